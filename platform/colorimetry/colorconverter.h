#pragma once

#include <colorimetry/colorimetry_export.h>

#include <domain/colorimetriccondition.h>
#include <domain/labvalue.h>
#include <domain/lchvalue.h>
#include <domain/rgbvalue.h>
#include <domain/xyzvalue.h>

namespace vexa {

class AppearanceValues;
class Geometry;
class ReflectanceSpectrum;

/// Colour conversions of measured values (static, pure, safe to call from any thread).
///
/// Spectra → XYZ use weighting factors computed from the CIE 1 nm tables for the spectrum's own
/// wavelength grid (see SpectralWeights); the white point is the perfect diffuser with the same
/// weights, so R ≡ 1 gives L* = 100, a* = b* = 0 exactly. Reflectance factors above 1 (metallic
/// highlights) are used as they are, never clipped.
///
/// A conversion that cannot be made (empty spectrum, a NaN or infinite value, a bad wavelength grid,
/// an unknown illuminant or observer, a missing geometry) gives an empty value (NaN components,
/// isValid() false) and writes the reason to the log. It never throws.
class VEXA_COLORIMETRY_EXPORT ColorConverter
{
public:
    /// L*a*b* of the measurement at `geometry` under `condition`. Reflectance spectra are converted;
    /// an L*a*b* value stored for that geometry is returned as it is when its condition matches.
    /// Empty when the geometry is absent or nothing usable is stored for it.
    static LabValue toLabValue(const AppearanceValues &values, const Geometry &geometry,
                               const ColorimetricCondition &condition);

    static LabValue toLab(const ReflectanceSpectrum &spectrum, const ColorimetricCondition &condition);
    static LabValue toLab(const LChValue &lch);
    static LChValue toLCh(const LabValue &lab);
    static LChValue toLCh(const ReflectanceSpectrum &spectrum, const ColorimetricCondition &condition);
    static XYZValue toXYZ(const ReflectanceSpectrum &spectrum, const ColorimetricCondition &condition);

    /// White point (Y = 100) of a condition for the 1 nm grid; the white of any grid differs from it only
    /// by rounding. Empty for an unknown condition.
    static XYZValue whitePoint(const ColorimetricCondition &condition);

    /// Display colour (sRGB, D65) of a colour under its colorimetric condition: Bradford adaptation
    /// from the condition's white to D65; out-of-gamut colours lose chroma at constant L* and hue,
    /// and what is brighter than white or darker than black is clipped per channel. An invalid value
    /// gives black.
    static RGBValue toRGB(const LabValue &lab);
    static RGBValue toRGB(const XYZValue &xyz);
};

} // namespace vexa
