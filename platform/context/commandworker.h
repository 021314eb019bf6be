#pragma once

#include <store/errorinfo.h>

#include <QObject>

#include <atomic>
#include <functional>
#include <memory>

namespace vexa {

class Command;
class ObjectStore;
class Progress;
class Response;

// Lives on the dispatcher's thread: owns the store (and with it the database
// connection of that thread) and runs the commands posted to it in order.
// Not installed; used only by CommandDispatcher.
class CommandWorker : public QObject
{
    Q_OBJECT
public:
    struct Callbacks
    {
        std::function<void(std::shared_ptr<Response>)> response;
        std::function<void(std::shared_ptr<ErrorInfo>)> error;
        std::function<void(std::shared_ptr<Progress>)> progress;
    };

    CommandWorker(const QString &storePath, std::atomic<int> *state);
    ~CommandWorker() override;

    // All on the worker thread.
    void openStore(bool refuse, const std::function<void(int state, ErrorInfo error)> &done);
    void run(const std::shared_ptr<Command> &command, const Callbacks &callbacks);
    void runWithStore(const std::function<void(ObjectStore *)> &job);
    void shutdown();

private:
    QString m_storePath;
    std::atomic<int> *m_state; // Owned by the dispatcher.
    std::unique_ptr<ObjectStore> m_store;

protected:
    bool event(QEvent *event) override;
};

} // namespace vexa
