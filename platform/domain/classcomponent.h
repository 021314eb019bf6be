#pragma once

#include <domain/domain_export.h>

#include <QString>
#include <QVariant>

namespace vexa {

// One member of an object as the property views show it.
class VEXA_DOMAIN_EXPORT ClassComponent
{
public:
    ClassComponent() = default;
    ClassComponent(const QString &name, const QString &type, const QString &innerType, const QVariant &value);

    QString name() const { return m_name; }
    // The member kind ("double", "QString", "ownedObjectList", "reference" ...).
    QString type() const { return m_type; }
    // The class name of nested or referenced objects, empty for plain values.
    QString innerType() const { return m_innerType; }
    QVariant value() const { return m_value; }

private:
    QString m_name;
    QString m_type;
    QString m_innerType;
    QVariant m_value;
};

} // namespace vexa
