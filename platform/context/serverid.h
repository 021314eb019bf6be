#pragma once

#include <context/context_export.h>

#include <string>

namespace vexa {

// Where an object server is: a host and port, or, with port 0, the file of an
// embedded store.
class VEXA_CONTEXT_EXPORT ServerId
{
public:
    ServerId() = default;
    ServerId(const std::string &server, int port = 0);

    const std::string &server() const { return m_server; }
    int port() const { return m_port; }
    bool isLocal() const { return m_port == 0; }
    bool isValid() const { return !m_server.empty(); }
    // The dispatcher id: the canonical file path of a local store, "host:port" otherwise.
    std::string toString() const;

    bool operator==(const ServerId &other) const { return toString() == other.toString(); }

private:
    std::string m_server;
    int m_port = 0;
};

} // namespace vexa
