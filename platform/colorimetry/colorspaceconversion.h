#pragma once

#include <colorimetry/cievalues.h>
#include <colorimetry/colorimetry_export.h>

#include <array>
#include <cstdint>

namespace vexa {

/// XYZ ↔ CIELAB ↔ CIELCh and the display (sRGB) colour, on plain triples. XYZ are on the 0..100 scale
/// (Y of the white = 100). Pure functions, safe from any thread.
class VEXA_COLORIMETRY_EXPORT ColorSpaceConversion
{
public:
    static CieLab xyzToLab(const CieXYZ &xyz, const CieXYZ &white);
    static CieXYZ labToXyz(const CieLab &lab, const CieXYZ &white);
    static CieLCh labToLCh(const CieLab &lab);
    static CieLab lchToLab(const CieLCh &lch);

    /// h_ab = atan2(b*, a*) in degrees, in [0, 360); 0 for a* = b* = 0.
    static double hueAngle(double a, double b);
    /// Hue difference h2 − h1 wrapped to (−180, 180].
    static double hueDifference(double h1, double h2);
    /// Signed ΔH between the points (a1, b1) → (a2, b2) of any opponent plane: 2 sqrt(C1 C2) sin(Δh/2),
    /// positive when the second point's hue angle is larger (counter-clockwise); 0 if either chroma is 0.
    static double signedDeltaH(double a1, double b1, double a2, double b2);

    /// sRGB display colour (IEC 61966-2-1) of a CIELAB colour relative to `white`: Bradford adaptation
    /// from `white` to D65, then the sRGB matrix and transfer curve. Colours outside the sRGB gamut are
    /// brought in by reducing chroma at constant L* and hue; what is still outside (L* above 100 or
    /// below 0) is clipped per channel. Non-finite input gives black.
    static std::array<std::uint8_t, 3> labToSrgb(const CieLab &lab, const CieXYZ &white);
    /// Same for an XYZ colour relative to `white`.
    static std::array<std::uint8_t, 3> xyzToSrgb(const CieXYZ &xyz, const CieXYZ &white);
};

} // namespace vexa
