#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QString>

#include <memory>

namespace vexa {

// The server's name.
class VEXA_CONTEXT_EXPORT ServerInfoResponse : public Response
{
public:
    using Response::Response;
    ~ServerInfoResponse() override;

    QString serverName() const { return m_serverName; }
    void setServerName(const QString &serverName) { m_serverName = serverName; }

private:
    QString m_serverName;
};

} // namespace vexa
