#include "colorphysicalcondition.h"

#include "membertraits.h"

namespace vexa {

const MemberList &ColorPhysicalCondition::staticMembers()
{
    using C = ColorPhysicalCondition;
    static const MemberList list{
        member("geometry", &C::geometry, &C::setGeometryText),
        member("geometryDetail", &C::geometryDetail, &C::setGeometryDetail),
        member("illuminationStandard", &C::illuminationStandard, &C::setIlluminationStandard),
        member("illuminationFilter", &C::illuminationFilter, &C::setIlluminationFilter),
        member("polarisationFilter", &C::polarisationFilter, &C::setPolarisationFilter),
        member("uvFilter", &C::uvFilter, &C::setUvFilter),
    };
    return list;
}

QString ColorPhysicalCondition::toString() const
{
    QStringList parts{m_geometry};
    for (const QString &s : {m_geometryDetail, m_illuminationStandard, m_illuminationFilter, m_polarisationFilter, m_uvFilter}) {
        if (!s.isEmpty())
            parts.append(s);
    }
    return parts.join(QStringLiteral(", "));
}

} // namespace vexa
