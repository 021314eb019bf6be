#include "toleranceparameter.h"

#include "membertraits.h"

namespace vexa {

ToleranceParameter::ToleranceParameter(const QString &name, const QString &displayName, ParameterType type,
                                       const QVariant &value)
    : m_name(name), m_displayName(displayName), m_parameterType(type), m_value(value)
{
}

const MemberList &ToleranceParameter::staticMembers()
{
    using C = ToleranceParameter;
    static const MemberList list(BaseObject::staticMembers(), {
        member("name", &C::name, &C::setName),
        member("displayName", &C::displayName, &C::setDisplayName),
        member("parameterType", &C::parameterType, &C::setParameterType),
        member("possibleValues", &C::possibleValues, &C::setPossibleValues),
        member("isEditable", &C::isEditable, &C::setIsEditable),
        member("isVisible", &C::isVisible, &C::setIsVisible),
        member("value", &C::value, &C::setValue),
    });
    return list;
}

double ToleranceParameter::valueAsDouble() const
{
    bool ok = false;
    const double d = m_value.toDouble(&ok);
    return ok ? d : qQNaN();
}

} // namespace vexa
