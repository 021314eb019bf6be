#pragma once

#include <context/context_export.h>

#include <QMetaType>

#include <memory>
#include <string>

namespace vexa {

class Command;

// The answer to a command. Commands without a result of their own (DeleteObject)
// are answered by a plain Response; the others by a typed subclass.
class VEXA_CONTEXT_EXPORT Response
{
public:
    explicit Response(std::shared_ptr<Command> command = nullptr);
    virtual ~Response();

    std::shared_ptr<Command> command() const { return m_command; }
    void setCommand(std::shared_ptr<Command> command);
    // The id of the command this answers.
    std::string commandId() const;

private:
    std::shared_ptr<Command> m_command;
};

} // namespace vexa

Q_DECLARE_METATYPE(std::shared_ptr<vexa::Response>)
