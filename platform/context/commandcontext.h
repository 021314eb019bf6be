#pragma once

#include <context/context_export.h>

#include <QString>
#include <QVariantMap>

namespace vexa {

// Who asks and in which database: sent along with a command.
class VEXA_CONTEXT_EXPORT CommandContext
{
public:
    QString userName() const { return m_userName; }
    void setUserName(const QString &userName) { m_userName = userName; }
    QString database() const { return m_database; }
    void setDatabase(const QString &database) { m_database = database; }
    // Further values a server may want (client version, locale ...).
    QVariantMap properties() const { return m_properties; }
    void setProperties(const QVariantMap &properties) { m_properties = properties; }

private:
    QString m_userName;
    QString m_database;
    QVariantMap m_properties;
};

} // namespace vexa
