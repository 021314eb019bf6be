#include <context/response.h>

#include <context/command.h>

namespace vexa {

Response::Response(std::shared_ptr<Command> command)
    : m_command(std::move(command))
{
}

Response::~Response() = default;

void Response::setCommand(std::shared_ptr<Command> command)
{
    m_command = std::move(command);
}

std::string Response::commandId() const
{
    return m_command ? m_command->commandId() : std::string();
}

} // namespace vexa
