#include "classcomponent.h"

namespace vexa {

ClassComponent::ClassComponent(const QString &name, const QString &type, const QString &innerType,
                               const QVariant &value)
    : m_name(name), m_type(type), m_innerType(innerType), m_value(value)
{
}

} // namespace vexa
