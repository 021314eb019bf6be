#pragma once

#include <context/context_export.h>
#include <context/response.h>

#include <QString>
#include <QStringList>

#include <memory>

namespace vexa {

// The names of the databases.
class VEXA_CONTEXT_EXPORT GetDatabasesResponse : public Response
{
public:
    using Response::Response;
    ~GetDatabasesResponse() override;

    QStringList databases() const { return m_databases; }
    void setDatabases(const QStringList &databases) { m_databases = databases; }

private:
    QStringList m_databases;
};

} // namespace vexa
