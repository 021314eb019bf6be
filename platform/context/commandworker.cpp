#include <context/commandworker.h>
#include <context/functionevent_p.h>

#include <context/command.h>
#include <context/commanddispatcher.h>
#include <context/commandexecutor.h>
#include <context/progress.h>
#include <context/response.h>

#include <store/sqliteobjectstore.h>

#include <utilities/logger.h>

#include <QCoreApplication>

#include <exception>

namespace vexa {

bool CommandWorker::event(QEvent *event)
{
    return FunctionEvent::handle(this, event) || QObject::event(event);
}

CommandWorker::CommandWorker(const QString &storePath, std::atomic<int> *state)
    : m_storePath(storePath)
    , m_state(state)
{
}

CommandWorker::~CommandWorker()
{
    shutdown();
}

void CommandWorker::openStore(bool refuse, const std::function<void(int, ErrorInfo)> &done)
{
    using State = CommandDispatcher::ConnectionState;
    ErrorInfo error;
    if (m_store && m_store->isOpen()) {
        m_state->store(int(State::Connected));
        done(int(State::Connected), error);
        return;
    }
    bool ok = false;
    if (refuse) {
        error = ErrorInfo(QCoreApplication::translate("vexa::CommandDispatcher", "The server does not answer."),
                          CorvidErrorCode::NotConnected, QStringLiteral("connections refused"));
    } else if (m_storePath.isEmpty()) {
        error = ErrorInfo(QCoreApplication::translate("vexa::CommandDispatcher",
                                                      "Network object servers are not supported yet."),
                          CorvidErrorCode::NotSupported);
    } else {
        auto store = std::make_unique<SqliteObjectStore>(m_storePath);
        ok = store->open(&error);
        if (ok)
            m_store = std::move(store);
    }
    const int state = int(ok ? State::Connected : State::Failed);
    m_state->store(state);
    done(state, error);
}

void CommandWorker::run(const std::shared_ptr<Command> &command, const Callbacks &callbacks)
{
    if (!m_store || !m_store->isOpen()) {
        callbacks.error(ErrorInfo::create(
            QCoreApplication::translate("vexa::CommandDispatcher", "No connection to the object server."),
            CorvidErrorCode::NotConnected, QStringLiteral("%1 sent without connection"), {command->typeName()}));
        return;
    }
    ErrorInfo error;
    std::shared_ptr<Response> response;
    const std::string id = command->commandId();
    const auto progress = [&](double value) { callbacks.progress(std::make_shared<Progress>(value, id)); };
    try {
        CommandExecutor executor(*m_store);
        response = executor.execute(command, progress, &error);
    } catch (const std::exception &e) {
        // A slot must not throw: a failure inside the domain becomes an error answer.
        error = ErrorInfo(QCoreApplication::translate("vexa::CommandDispatcher", "The command failed."),
                          CorvidErrorCode::Unknown, QString::fromUtf8(e.what()));
    }
    if (response) {
        callbacks.response(response);
    } else {
        if (!error.isError())
            error.setErrorCode(CorvidErrorCode::Unknown);
        Logger::instance().debug(LogCategory::Store, QStringLiteral("%1 failed: %2 [%3]")
                                                         .arg(command->typeName(), error.toString(),
                                                              error.internalMessage()));
        callbacks.error(std::make_shared<ErrorInfo>(error));
    }
}

void CommandWorker::runWithStore(const std::function<void(ObjectStore *)> &job)
{
    job(m_store && m_store->isOpen() ? m_store.get() : nullptr);
}

void CommandWorker::shutdown()
{
    m_store.reset();
}

} // namespace vexa
