#include "labvalue.h"

#include "membertraits.h"

#include <cmath>

namespace vexa {

LabValue::LabValue()
    : m_l(qQNaN()), m_a(qQNaN()), m_b(qQNaN())
{
}

LabValue::LabValue(double l, double a, double b, const ColorimetricCondition &condition)
    : m_l(l), m_a(a), m_b(b), m_condition(condition)
{
}

const MemberList &LabValue::staticMembers()
{
    static const MemberList list(ColorValues::staticMembers(), {
        member("l", &LabValue::l, &LabValue::setL),
        member("a", &LabValue::a, &LabValue::setA),
        member("b", &LabValue::b, &LabValue::setB),
        member("colorimetricCondition", &LabValue::colorimetricCondition, &LabValue::setColorimetricCondition),
    });
    return list;
}

bool LabValue::isEmpty() const
{
    return std::isnan(m_l) && std::isnan(m_a) && std::isnan(m_b);
}

bool LabValue::isValid() const
{
    return std::isfinite(m_l) && std::isfinite(m_a) && std::isfinite(m_b);
}

QString LabValue::toString() const
{
    return ColorValues::toString() + QStringLiteral(" L*=%1 a*=%2 b*=%3 %4").arg(m_l).arg(m_a).arg(m_b).arg(m_condition.toString());
}

} // namespace vexa
