#pragma once

#include <context/context_export.h>
#include <context/serverid.h>

#include <store/errorinfo.h>

#include <mutex>
#include <QObject>
#include <QPointer>

#include <atomic>
#include <functional>
#include <map>
#include <memory>
#include <string>

class QThread;

namespace vexa {

class Command;
class CommandWorker;
class ObjectStore;
class Progress;
class QtCommand;
class Response;

// Sends commands to one object server. The commands run one after another on
// the dispatcher's own worker thread (which owns the store's database
// connection); answers, errors and progress come back on the thread that owns
// the dispatcher (the GUI thread) through QtCommand signals.
//
// For now the server is an embedded store file (ServerId with port 0); a
// network server is not supported yet and never connects.
class VEXA_CONTEXT_EXPORT CommandDispatcher : public QObject
{
    Q_OBJECT
public:
    enum class ConnectionState { Disconnected, Connecting, Connected, Failed };
    Q_ENUM(ConnectionState)

    using ResponseCallback = std::function<void(std::shared_ptr<Response>)>;
    using ErrorCallback = std::function<void(std::shared_ptr<ErrorInfo>)>;
    using ProgressCallback = std::function<void(std::shared_ptr<Progress>)>;

    explicit CommandDispatcher(const ServerId &serverId, QObject *parent = nullptr);
    // Finishes the command being run, drops the queued ones and closes the store.
    ~CommandDispatcher() override;

    ServerId serverId() const { return m_serverId; }
    std::string dispatcherId() const { return m_serverId.toString(); }
    // The canonical form of a dispatcher id: the clean absolute path of a store
    // file (symbolic links resolved when the file exists), or a lower-case "host:port".
    static std::string standardizedDispatcherId(const std::string &dispatcher);

    // Safe to call from any thread; changes as soon as the worker has (not) connected.
    ConnectionState connectionState() const;
    bool isConnected() const { return connectionState() == ConnectionState::Connected; }
    ErrorInfo connectionError() const;
    // Asks the worker to connect (asynchronously). Does nothing while connecting or connected.
    void connectToServer();
    // Test hook: refuse every connection from now on (as an unreachable server would).
    void setRefuseConnections(bool refuse);

    // Sends a command. Connect to the returned object's signals at once (on the
    // dispatcher's thread the answer cannot arrive before control returns to the
    // event loop). A command without id is given one.
    QtCommand *execute(std::shared_ptr<Command> command);
    // The same with callbacks, called on the dispatcher's thread while context lives.
    std::string execute(std::shared_ptr<Command> command, QObject *context, ResponseCallback onResponse,
                        ErrorCallback onError, ProgressCallback onProgress = ProgressCallback());

    // Runs a job with the open store (null when not connected) on the worker
    // thread, queued behind the commands sent before (tools, sample data).
    void runWithStore(std::function<void(ObjectStore *)> job);
    // Runs a function on the dispatcher's thread (the GUI thread); a job on the worker
    // hands its results back with it.
    void runOnOwnerThread(std::function<void()> function);

Q_SIGNALS:
    void sgConnectionStateChanged(vexa::CommandDispatcher::ConnectionState state);

protected:
    bool event(QEvent *event) override;

private:
    QPointer<QtCommand> takePending(const std::string &id);
    void deliverResponse(const std::string &id, const std::shared_ptr<Response> &response);
    void deliverError(const std::string &id, const std::shared_ptr<ErrorInfo> &error);
    void deliverProgress(const std::string &id, const std::shared_ptr<Progress> &progress);
    void onConnectionResult(int state, const ErrorInfo &error);

    ServerId m_serverId;
    QThread *m_thread = nullptr;     // Owned.
    CommandWorker *m_worker = nullptr; // Owned; lives on m_thread.
    std::atomic<int> m_state{int(ConnectionState::Disconnected)};
    std::atomic<bool> m_refuse{false};
    mutable std::mutex m_errorMutex;
    ErrorInfo m_connectionError;
    std::map<std::string, QPointer<QtCommand>> m_pending;
};

} // namespace vexa

Q_DECLARE_METATYPE(vexa::CommandDispatcher::ConnectionState)
