#pragma once

#include <domain/domain_export.h>
#include <domain/reflectable.h>

#include <utilities/timestamp.h>

namespace vexa {

// Name, description and creation data of a stored object.
class VEXA_DOMAIN_EXPORT Header : public Reflectable
{
    VEXA_REFLECTABLE(Header)
public:
    Header() = default;

    QString name() const { return m_name; }
    void setName(const QString &name) { m_name = name; }
    QString description() const { return m_description; }
    void setDescription(const QString &description) { m_description = description; }
    QString creatorId() const { return m_creatorId; }
    void setCreatorId(const QString &creatorId) { m_creatorId = creatorId; }
    Timestamp creationTimestamp() const { return m_creationTimestamp; }
    void setCreationTimestamp(const Timestamp &timestamp) { m_creationTimestamp = timestamp; }

private:
    QString m_name;
    QString m_description;
    QString m_creatorId;
    Timestamp m_creationTimestamp;
};

} // namespace vexa
