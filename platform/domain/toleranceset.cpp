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

void ToleranceSet::setTolerances(const std::vector<std::shared_ptr<Tolerance>> &tolerances)
{
    m_tolerances = tolerances;
    linkParameters();
}

void ToleranceSet::setToleranceSetParameters(const std::shared_ptr<ToleranceSetParameters> &parameters)
{
    m_parameters = parameters;
    linkParameters();
}

void ToleranceSet::linkParameters()
{
    if (!m_parameters)
        return;
    for (const auto &tolerance : m_tolerances) {
        if (tolerance)
            tolerance->setToleranceSetParameters(m_parameters);
    }
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
