#include "toleranceset.h"

#include "membertraits.h"

namespace vexa {

const MemberList &ToleranceSet::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("tolerances", &ToleranceSet::tolerances, &ToleranceSet::setTolerances),
        member("toleranceSetParameters", &ToleranceSet::toleranceSetParameters, &ToleranceSet::setToleranceSetParameters),
    });
    return list;
}

std::shared_ptr<Tolerance> ToleranceSet::toleranceWithGeometry(const Geometry &geometry) const
{
    for (const auto &t : m_tolerances) {
        if (t && t->geometryValue() == geometry)
            return t;
    }
    return nullptr;
}

} // namespace vexa
