#pragma once

#include <domain/namedobject.h>
#include <domain/rgbvalue.h>

#include <QtNumeric>

namespace vexa {

// The type names of colorants.
struct VEXA_DOMAIN_EXPORT ColorantType
{
    static constexpr const char *Clear = "Clear";
    static constexpr const char *Metallic = "Metallic";
    static constexpr const char *Pearl = "Pearl";
    static constexpr const char *Pigment = "Pigment";
};

// A colorant of a paint system.
class VEXA_DOMAIN_EXPORT Colorant : public NamedObject
{
    VEXA_REFLECTABLE(Colorant)
public:
    // A ColorantType name.
    QString type() const { return m_type; }
    void setType(const QString &type) { m_type = type; }
    // g/cm³; NaN when unknown.
    double density() const { return m_density; }
    void setDensity(double density) { m_density = density; }
    // The colour a colorant swatch is shown in.
    const RGBValue &displayRGB() const { return m_displayRGB; }
    void setDisplayRGB(const RGBValue &rgb) { m_displayRGB = rgb; }

private:
    RGBValue displayRGBValue() const { return m_displayRGB; }

    QString m_type = QLatin1String(ColorantType::Pigment);
    double m_density = qQNaN();
    RGBValue m_displayRGB;
};

} // namespace vexa
