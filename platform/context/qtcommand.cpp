#include <context/qtcommand.h>

namespace vexa {

QtCommand::QtCommand(std::shared_ptr<Command> command, QObject *parent)
    : QObject(parent)
    , m_command(std::move(command))
{
}

QtCommand::~QtCommand() = default;

void QtCommand::deliverResponse(const std::shared_ptr<Response> &response)
{
    if (m_finished)
        return;
    m_finished = true;
    Q_EMIT responseReceived(response);
    deleteLater();
}

void QtCommand::deliverError(const std::shared_ptr<ErrorInfo> &error)
{
    if (m_finished)
        return;
    m_finished = true;
    Q_EMIT errorReceived(error);
    deleteLater();
}

void QtCommand::deliverProgress(const std::shared_ptr<Progress> &progress)
{
    if (!m_finished)
        Q_EMIT progressReceived(progress);
}

} // namespace vexa
