#include "colorvalues.h"

#include "membertraits.h"

namespace vexa {

ColorValues::~ColorValues() = default;

const MemberList &ColorValues::staticMembers()
{
    static const MemberList list{
        member("physicalCondition", &ColorValues::physicalConditionValue, &ColorValues::setPhysicalCondition),
    };
    return list;
}

QString ColorValues::toString() const
{
    return typeName() + QStringLiteral(" (") + m_physicalCondition.toString() + QLatin1Char(')');
}

} // namespace vexa
