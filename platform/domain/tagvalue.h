#pragma once

#include <domain/baseobject.h>

namespace vexa {

// The value of one tag on an object.
class VEXA_DOMAIN_EXPORT TagValue : public BaseObject
{
    VEXA_REFLECTABLE(TagValue)
public:
    QString tagDefinitionId() const { return m_tagDefinitionId; }
    void setTagDefinitionId(const QString &id) { m_tagDefinitionId = id; }
    QString value() const { return m_value; }
    void setValue(const QString &value) { m_value = value; }

private:
    QString m_tagDefinitionId;
    QString m_value;
};

} // namespace vexa
