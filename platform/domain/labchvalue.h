#pragma once

#include <domain/labvalue.h>

namespace vexa {

// L*a*b* together with chroma and hue derived from it (C* = sqrt(a*² + b*²),
// h = atan2(b*, a*) in degrees, 0 <= h < 360). Only L*a*b* is stored.
class VEXA_DOMAIN_EXPORT LabChValue : public ColorValues
{
    VEXA_REFLECTABLE(LabChValue)
public:
    LabChValue();
    explicit LabChValue(const LabValue &lab);

    double l() const { return m_lab.l(); }
    double a() const { return m_lab.a(); }
    double b() const { return m_lab.b(); }
    double c() const;
    double h() const;
    // The L*a*b* part, with this value's physical condition.
    LabValue lab() const;
    void setLab(const LabValue &lab);
    ColorimetricCondition colorimetricCondition() const { return m_lab.colorimetricCondition(); }

    bool isValid() const { return m_lab.isValid(); }
    QString toString() const override;

private:
    LabValue labPart() const { return m_lab; }
    void setLabPart(const LabValue &lab) { m_lab = lab; }

    LabValue m_lab;
};

} // namespace vexa
