#include <context/serverid.h>

#include <context/commanddispatcher.h>

namespace vexa {

ServerId::ServerId(const std::string &server, int port)
    : m_server(server)
    , m_port(port < 0 ? 0 : port)
{
}

std::string ServerId::toString() const
{
    if (m_port == 0)
        return CommandDispatcher::standardizedDispatcherId(m_server);
    return CommandDispatcher::standardizedDispatcherId(m_server + ":" + std::to_string(m_port));
}

} // namespace vexa
