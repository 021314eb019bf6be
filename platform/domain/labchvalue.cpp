#include "labchvalue.h"

#include "membertraits.h"

#include <cmath>

namespace vexa {

LabChValue::LabChValue() = default;

LabChValue::LabChValue(const LabValue &lab)
{
    setLab(lab);
}

const MemberList &LabChValue::staticMembers()
{
    static const MemberList list(ColorValues::staticMembers(), {
        member("lab", &LabChValue::labPart, &LabChValue::setLabPart),
    });
    return list;
}

double LabChValue::c() const
{
    return std::hypot(m_lab.a(), m_lab.b());
}

double LabChValue::h() const
{
    double h = std::atan2(m_lab.b(), m_lab.a()) * 180.0 / M_PI;
    if (h < 0)
        h += 360.0;
    return h;
}

LabValue LabChValue::lab() const
{
    LabValue out = m_lab;
    out.setPhysicalCondition(physicalCondition());
    return out;
}

void LabChValue::setLab(const LabValue &lab)
{
    m_lab = lab;
    setPhysicalCondition(lab.physicalCondition());
}

QString LabChValue::toString() const
{
    return ColorValues::toString() + QStringLiteral(" L*=%1 a*=%2 b*=%3 C*=%4 h=%5").arg(l()).arg(a()).arg(b()).arg(c()).arg(h());
}

} // namespace vexa
