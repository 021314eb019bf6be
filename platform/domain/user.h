#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A user of the store; the name is the login name.
class VEXA_DOMAIN_EXPORT User : public NamedObject
{
    VEXA_REFLECTABLE(User)
public:
    QString fullName() const { return m_fullName; }
    void setFullName(const QString &name) { m_fullName = name; }
    QString email() const { return m_email; }
    void setEmail(const QString &email) { m_email = email; }
    bool isAdministrator() const { return m_isAdministrator; }
    void setIsAdministrator(bool administrator) { m_isAdministrator = administrator; }

private:
    QString m_fullName;
    QString m_email;
    bool m_isAdministrator = false;
};

} // namespace vexa
