#include "lchvalue.h"

#include "membertraits.h"

#include <cmath>

namespace vexa {

LChValue::LChValue()
    : m_l(qQNaN()), m_c(qQNaN()), m_h(qQNaN())
{
}

LChValue::LChValue(double l, double c, double h, const ColorimetricCondition &condition)
    : m_l(l), m_c(c), m_h(h), m_condition(condition)
{
}

const MemberList &LChValue::staticMembers()
{
    static const MemberList list(ColorValues::staticMembers(), {
        member("l", &LChValue::l, &LChValue::setL),
        member("c", &LChValue::c, &LChValue::setC),
        member("h", &LChValue::h, &LChValue::setH),
        member("colorimetricCondition", &LChValue::colorimetricCondition, &LChValue::setColorimetricCondition),
    });
    return list;
}

bool LChValue::isValid() const
{
    return std::isfinite(m_l) && std::isfinite(m_c) && std::isfinite(m_h);
}

QString LChValue::toString() const
{
    return ColorValues::toString() + QStringLiteral(" L*=%1 C*=%2 h=%3 %4").arg(m_l).arg(m_c).arg(m_h).arg(m_condition.toString());
}

} // namespace vexa
