#include <context/commanddispatcher.h>

#include <context/command.h>
#include <context/commandworker.h>
#include <context/functionevent_p.h>
#include <context/progress.h>
#include <context/qtcommand.h>
#include <context/response.h>

#include <QDir>
#include <QFileInfo>
#include <QThread>

namespace vexa {

namespace {

void registerMetaTypes()
{
    static const bool done = [] {
        qRegisterMetaType<std::shared_ptr<vexa::Response>>("std::shared_ptr<vexa::Response>");
        qRegisterMetaType<std::shared_ptr<vexa::ErrorInfo>>("std::shared_ptr<vexa::ErrorInfo>");
        qRegisterMetaType<std::shared_ptr<vexa::Progress>>("std::shared_ptr<vexa::Progress>");
        qRegisterMetaType<vexa::ErrorInfo>("vexa::ErrorInfo");
        qRegisterMetaType<vexa::Progress>("vexa::Progress");
        qRegisterMetaType<vexa::CommandDispatcher::ConnectionState>("vexa::CommandDispatcher::ConnectionState");
        return true;
    }();
    Q_UNUSED(done)
}

} // namespace

CommandDispatcher::CommandDispatcher(const ServerId &serverId, QObject *parent)
    : QObject(parent)
    , m_serverId(serverId)
{
    registerMetaTypes();
    const QString storePath = serverId.isLocal() ? QString::fromStdString(serverId.toString()) : QString();
    m_thread = new QThread;
    m_thread->setObjectName(QStringLiteral("CommandDispatcher"));
    m_worker = new CommandWorker(storePath, &m_state);
    m_worker->moveToThread(m_thread);
    m_thread->start();
}

CommandDispatcher::~CommandDispatcher()
{
    // Close the store on its own thread, then stop the thread.
    CommandWorker *worker = m_worker;
    // The shutdown is the worker thread's last work: the thread ends after it, and
    // wait() returns only then.
    FunctionEvent::post(m_worker, [worker, thread = m_thread] {
        worker->shutdown();
        FunctionEvent::release(worker);
        thread->quit();
    });
    m_thread->wait();
    FunctionEvent::acquire(worker);
    delete m_worker;
    delete m_thread;
}

std::string CommandDispatcher::standardizedDispatcherId(const std::string &dispatcher)
{
    const QString text = QString::fromStdString(dispatcher).trimmed();
    if (text.isEmpty())
        return std::string();
    // "host:port" (not a Windows drive letter) names a network server.
    const int colon = text.lastIndexOf(QLatin1Char(':'));
    if (colon > 1 && !text.contains(QLatin1Char('/')) && !text.contains(QLatin1Char('\\'))) {
        bool numeric = false;
        text.midRef(colon + 1).toInt(&numeric);
        if (numeric)
            return text.toLower().toStdString();
    }
    const QFileInfo info(text);
    const QString canonical = info.canonicalFilePath();
    return QDir::cleanPath(canonical.isEmpty() ? info.absoluteFilePath() : canonical).toStdString();
}

CommandDispatcher::ConnectionState CommandDispatcher::connectionState() const
{
    return ConnectionState(m_state.load());
}

ErrorInfo CommandDispatcher::connectionError() const
{
    std::lock_guard<std::mutex> lock(m_errorMutex);
    return m_connectionError;
}

void CommandDispatcher::setRefuseConnections(bool refuse)
{
    m_refuse = refuse;
}

void CommandDispatcher::connectToServer()
{
    int expected = m_state.load();
    if (expected == int(ConnectionState::Connected) || expected == int(ConnectionState::Connecting))
        return;
    if (!m_state.compare_exchange_strong(expected, int(ConnectionState::Connecting)))
        return;
    Q_EMIT sgConnectionStateChanged(ConnectionState::Connecting);
    CommandWorker *worker = m_worker;
    const bool refuse = m_refuse.load();
    FunctionEvent::post(m_worker, [worker, refuse, this] {
        worker->openStore(refuse, [this](int state, ErrorInfo error) {
            {
                std::lock_guard<std::mutex> lock(m_errorMutex);
                m_connectionError = error;
            }
            FunctionEvent::post(this, [this, state, error] { onConnectionResult(state, error); });
        });
    });
}

bool CommandDispatcher::event(QEvent *event)
{
    return FunctionEvent::handle(this, event) || QObject::event(event);
}

void CommandDispatcher::runOnOwnerThread(std::function<void()> function)
{
    FunctionEvent::post(this, std::move(function));
}

void CommandDispatcher::onConnectionResult(int state, const ErrorInfo &error)
{
    Q_UNUSED(error)
    Q_EMIT sgConnectionStateChanged(ConnectionState(state));
}

QtCommand *CommandDispatcher::execute(std::shared_ptr<Command> command)
{
    if (command->commandId().empty())
        command->generateId();
    auto *qtCommand = new QtCommand(command, this);
    const std::string id = command->commandId();
    if (m_pending.count(id) && m_pending[id])
        m_pending[id]->deliverError(ErrorInfo::create(tr("The command was replaced by another with the same id."),
                                                      CorvidErrorCode::InvalidRequest, QString()));
    m_pending[id] = qtCommand;
    CommandWorker::Callbacks callbacks;
    callbacks.response = [this, id](std::shared_ptr<Response> response) {
        FunctionEvent::post(this, [this, id, response] { deliverResponse(id, response); });
    };
    callbacks.error = [this, id](std::shared_ptr<ErrorInfo> error) {
        FunctionEvent::post(this, [this, id, error] { deliverError(id, error); });
    };
    callbacks.progress = [this, id](std::shared_ptr<Progress> progress) {
        FunctionEvent::post(this, [this, id, progress] { deliverProgress(id, progress); });
    };
    CommandWorker *worker = m_worker;
    FunctionEvent::post(m_worker, [worker, command, callbacks] { worker->run(command, callbacks); });
    return qtCommand;
}

std::string CommandDispatcher::execute(std::shared_ptr<Command> command, QObject *context,
                                       ResponseCallback onResponse, ErrorCallback onError,
                                       ProgressCallback onProgress)
{
    QtCommand *qtCommand = execute(std::move(command));
    QObject *receiver = context ? context : this;
    if (onResponse)
        connect(qtCommand, &QtCommand::responseReceived, receiver, std::move(onResponse));
    if (onError)
        connect(qtCommand, &QtCommand::errorReceived, receiver, std::move(onError));
    if (onProgress)
        connect(qtCommand, &QtCommand::progressReceived, receiver, std::move(onProgress));
    return qtCommand->commandId();
}

void CommandDispatcher::runWithStore(std::function<void(ObjectStore *)> job)
{
    CommandWorker *worker = m_worker;
    FunctionEvent::post(m_worker, [worker, job] { worker->runWithStore(job); });
}

// The final answer of a command: the command leaves the pending table once.
QPointer<QtCommand> CommandDispatcher::takePending(const std::string &id)
{
    const auto it = m_pending.find(id);
    if (it == m_pending.end())
        return nullptr;
    QPointer<QtCommand> qtCommand = it->second;
    m_pending.erase(it);
    return qtCommand;
}

void CommandDispatcher::deliverResponse(const std::string &id, const std::shared_ptr<Response> &response)
{
    if (QPointer<QtCommand> qtCommand = takePending(id))
        qtCommand->deliverResponse(response);
}

void CommandDispatcher::deliverError(const std::string &id, const std::shared_ptr<ErrorInfo> &error)
{
    if (QPointer<QtCommand> qtCommand = takePending(id))
        qtCommand->deliverError(error);
}

void CommandDispatcher::deliverProgress(const std::string &id, const std::shared_ptr<Progress> &progress)
{
    const auto it = m_pending.find(id);
    if (it != m_pending.end() && it->second)
        it->second->deliverProgress(progress);
}

} // namespace vexa
