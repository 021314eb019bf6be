#pragma once

#include <domain/colorimetriccondition.h>
#include <domain/colorvalues.h>

namespace vexa {

// A CIE L*C*h value (hue in degrees) under a colorimetric condition; empty (NaN) by default.
class VEXA_DOMAIN_EXPORT LChValue : public ColorValues
{
    VEXA_REFLECTABLE(LChValue)
public:
    LChValue();
    LChValue(double l, double c, double h, const ColorimetricCondition &condition = ColorimetricCondition());

    double l() const { return m_l; }
    double c() const { return m_c; }
    double h() const { return m_h; }
    void setL(double l) { m_l = l; }
    void setC(double c) { m_c = c; }
    void seth(double h) { m_h = h; }
    void setH(double h) { m_h = h; }
    ColorimetricCondition colorimetricCondition() const { return m_condition; }
    void setColorimetricCondition(const ColorimetricCondition &condition) { m_condition = condition; }

    bool isValid() const;
    QString toString() const override;

private:
    double m_l;
    double m_c;
    double m_h;
    ColorimetricCondition m_condition;
};

} // namespace vexa
