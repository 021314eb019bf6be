#pragma once

#include <domain/colorimetriccondition.h>
#include <domain/colorvalues.h>

namespace vexa {

// CIE XYZ tristimulus values (Y of the perfect white = 100); empty (NaN) by default.
class VEXA_DOMAIN_EXPORT XYZValue : public ColorValues
{
    VEXA_REFLECTABLE(XYZValue)
public:
    XYZValue();
    XYZValue(double x, double y, double z, const ColorimetricCondition &condition = ColorimetricCondition());

    double x() const { return m_x; }
    double y() const { return m_y; }
    double z() const { return m_z; }
    void setX(double x) { m_x = x; }
    void setY(double y) { m_y = y; }
    void setZ(double z) { m_z = z; }
    ColorimetricCondition colorimetricCondition() const { return m_condition; }
    void setColorimetricCondition(const ColorimetricCondition &condition) { m_condition = condition; }

    bool isValid() const;

private:
    double m_x;
    double m_y;
    double m_z;
    ColorimetricCondition m_condition;
};

} // namespace vexa
