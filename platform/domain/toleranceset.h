#pragma once

#include <domain/namedobject.h>
#include <domain/tolerance.h>
#include <domain/tolerancesetparameters.h>

namespace vexa {

// The tolerances of one type, one a geometry, with the parameters they share. Every tolerance
// of a set sees the set's own parameters: setting either the tolerances or the parameters links
// them, so a set read from the store or deep-copied judges by the parameters it shows, not by a
// stale copy a tolerance carried.
class VEXA_DOMAIN_EXPORT ToleranceSet : public NamedObject
{
    VEXA_REFLECTABLE(ToleranceSet)
public:
    const std::vector<std::shared_ptr<Tolerance>> &tolerances() const { return m_tolerances; }
    void setTolerances(const std::vector<std::shared_ptr<Tolerance>> &tolerances);
    // The first tolerance whose geometryValue() equals geometry; null when none.
    std::shared_ptr<Tolerance> toleranceWithGeometry(const Geometry &geometry) const;
    std::shared_ptr<ToleranceSetParameters> toleranceSetParameters() const { return m_parameters; }
    void setToleranceSetParameters(const std::shared_ptr<ToleranceSetParameters> &parameters);

private:
    void linkParameters();

    std::vector<std::shared_ptr<Tolerance>> m_tolerances;
    std::shared_ptr<ToleranceSetParameters> m_parameters;
};

} // namespace vexa
