#include "xyzvalue.h"

#include "membertraits.h"

#include <cmath>

namespace vexa {

XYZValue::XYZValue()
    : m_x(qQNaN()), m_y(qQNaN()), m_z(qQNaN())
{
}

XYZValue::XYZValue(double x, double y, double z, const ColorimetricCondition &condition)
    : m_x(x), m_y(y), m_z(z), m_condition(condition)
{
}

const MemberList &XYZValue::staticMembers()
{
    static const MemberList list(ColorValues::staticMembers(), {
        member("x", &XYZValue::x, &XYZValue::setX),
        member("y", &XYZValue::y, &XYZValue::setY),
        member("z", &XYZValue::z, &XYZValue::setZ),
        member("colorimetricCondition", &XYZValue::colorimetricCondition, &XYZValue::setColorimetricCondition),
    });
    return list;
}

bool XYZValue::isValid() const
{
    return std::isfinite(m_x) && std::isfinite(m_y) && std::isfinite(m_z);
}

} // namespace vexa
