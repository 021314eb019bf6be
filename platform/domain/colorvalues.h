#pragma once

#include <domain/colorphysicalcondition.h>
#include <domain/reflectable.h>

namespace vexa {

// One colour measurement or computed colour value at one geometry. The kinds:
// SpectralValues (ReflectanceSpectrum), LabValue, LChValue, LabChValue, XYZValue.
class VEXA_DOMAIN_EXPORT ColorValues : public Reflectable
{
    VEXA_REFLECTABLE_ABSTRACT(ColorValues)
public:
    ~ColorValues() override;

    const ColorPhysicalCondition &physicalCondition() const { return m_physicalCondition; }
    ColorPhysicalCondition &physicalCondition() { return m_physicalCondition; }
    void setPhysicalCondition(const ColorPhysicalCondition &condition) { m_physicalCondition = condition; }

    // Shorthands for physicalCondition().geometryValue() / setGeometry().
    Geometry geometry() const { return m_physicalCondition.geometryValue(); }
    void setGeometry(const Geometry &geometry) { m_physicalCondition.setGeometry(geometry); }

    // The kind and the physical condition, for logs and tests.
    virtual QString toString() const;

protected:
    ColorValues() = default;
    ColorValues(const ColorValues &) = default;
    ColorValues &operator=(const ColorValues &) = default;

private:
    ColorPhysicalCondition physicalConditionValue() const { return m_physicalCondition; }

    ColorPhysicalCondition m_physicalCondition;
};

} // namespace vexa
