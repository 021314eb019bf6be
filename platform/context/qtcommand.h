#pragma once

#include <context/command.h>
#include <context/context_export.h>
#include <context/progress.h>
#include <context/response.h>

#include <store/errorinfo.h>

#include <QObject>

#include <memory>

namespace vexa {

// A sent command as a QObject: its answer, error and progress arrive as signals
// on the GUI thread (the dispatcher's thread). After the answer or the error the
// object deletes itself (deleteLater).
class VEXA_CONTEXT_EXPORT QtCommand : public QObject
{
    Q_OBJECT
public:
    explicit QtCommand(std::shared_ptr<Command> command, QObject *parent = nullptr);
    ~QtCommand() override;

    std::shared_ptr<Command> command() const { return m_command; }
    std::string commandId() const { return m_command ? m_command->commandId() : std::string(); }
    bool isFinished() const { return m_finished; }

    // Used by the dispatcher to hand over what its worker produced.
    void deliverResponse(const std::shared_ptr<Response> &response);
    void deliverError(const std::shared_ptr<ErrorInfo> &error);
    void deliverProgress(const std::shared_ptr<Progress> &progress);

Q_SIGNALS:
    void responseReceived(std::shared_ptr<vexa::Response> response);
    void errorReceived(std::shared_ptr<vexa::ErrorInfo> error);
    void progressReceived(std::shared_ptr<vexa::Progress> progress);

private:
    std::shared_ptr<Command> m_command;
    bool m_finished = false;
};

} // namespace vexa
