#include <colorimetry/colorspaceconversion.h>

#include <lcms2.h>

#include <algorithm>
#include <cmath>

namespace vexa {

namespace {

constexpr double kPi = 3.14159265358979323846;

cmsCIEXYZ toCms(const CieXYZ &xyz)
{
    // lcms2 works on the 0..1 scale.
    return cmsCIEXYZ{xyz.X / 100.0, xyz.Y / 100.0, xyz.Z / 100.0};
}

/// Linear sRGB (unclipped) of XYZ relative to `white`, after Bradford adaptation to D65.
std::array<double, 3> linearSrgb(const CieXYZ &xyz, const CieXYZ &white)
{
    const cmsCIEXYZ source = toCms(xyz);
    const cmsCIEXYZ sourceWhite = toCms(white);
    const cmsCIExyY d65xyY{0.3127, 0.3290, 1.0};
    cmsCIEXYZ d65;
    cmsxyY2XYZ(&d65, &d65xyY);
    cmsCIEXYZ adapted = source;
    if (!cmsAdaptToIlluminant(&adapted, &sourceWhite, &d65, &source))
        adapted = source;
    // Bradford maps the source white onto D65 with Y = 1: the perfect diffuser becomes display white.
    const double X = adapted.X;
    const double Y = adapted.Y;
    const double Z = adapted.Z;
    return {3.2406 * X - 1.5372 * Y - 0.4986 * Z,
            -0.9689 * X + 1.8758 * Y + 0.0415 * Z,
            0.0557 * X - 0.2040 * Y + 1.0570 * Z};
}

bool inGamut(const std::array<double, 3> &rgb)
{
    constexpr double eps = 1e-9;
    return std::all_of(rgb.begin(), rgb.end(), [](double v) { return v >= -eps && v <= 1.0 + eps; });
}

std::array<std::uint8_t, 3> encode(const std::array<double, 3> &rgb)
{
    std::array<std::uint8_t, 3> result{};
    for (std::size_t i = 0; i < 3; ++i) {
        const double v = std::clamp(rgb[i], 0.0, 1.0);
        const double encoded = v <= 0.0031308 ? 12.92 * v : 1.055 * std::pow(v, 1.0 / 2.4) - 0.055;
        result[i] = std::uint8_t(std::lround(std::clamp(encoded, 0.0, 1.0) * 255.0));
    }
    return result;
}

} // namespace

CieLab ColorSpaceConversion::xyzToLab(const CieXYZ &xyz, const CieXYZ &white)
{
    const cmsCIEXYZ in = toCms(xyz);
    const cmsCIEXYZ w = toCms(white);
    cmsCIELab lab;
    cmsXYZ2Lab(&w, &lab, &in);
    return CieLab{lab.L, lab.a, lab.b};
}

CieXYZ ColorSpaceConversion::labToXyz(const CieLab &lab, const CieXYZ &white)
{
    const cmsCIELab in{lab.L, lab.a, lab.b};
    const cmsCIEXYZ w = toCms(white);
    cmsCIEXYZ xyz;
    cmsLab2XYZ(&w, &xyz, &in);
    return CieXYZ{xyz.X * 100.0, xyz.Y * 100.0, xyz.Z * 100.0};
}

CieLCh ColorSpaceConversion::labToLCh(const CieLab &lab)
{
    const cmsCIELab in{lab.L, lab.a, lab.b};
    cmsCIELCh lch;
    cmsLab2LCh(&lch, &in);
    // lcms2 can return exactly 360 for a tiny negative angle; the hue range is [0, 360).
    return CieLCh{lch.L, lch.C, lch.h >= 360.0 ? lch.h - 360.0 : lch.h};
}

CieLab ColorSpaceConversion::lchToLab(const CieLCh &lch)
{
    const cmsCIELCh in{lch.L, lch.C, lch.h};
    cmsCIELab lab;
    cmsLCh2Lab(&lab, &in);
    return CieLab{lab.L, lab.a, lab.b};
}

double ColorSpaceConversion::hueAngle(double a, double b)
{
    if (a == 0.0 && b == 0.0)
        return 0.0;
    double h = std::atan2(b, a) * 180.0 / kPi;
    if (h < 0.0)
        h += 360.0;
    return h >= 360.0 ? h - 360.0 : h;
}

double ColorSpaceConversion::hueDifference(double h1, double h2)
{
    double d = h2 - h1;
    while (d > 180.0)
        d -= 360.0;
    while (d <= -180.0)
        d += 360.0;
    return d;
}

double ColorSpaceConversion::signedDeltaH(double a1, double b1, double a2, double b2)
{
    const double c1 = std::hypot(a1, b1);
    const double c2 = std::hypot(a2, b2);
    if (c1 == 0.0 || c2 == 0.0)
        return 0.0;
    const double dh = hueDifference(hueAngle(a1, b1), hueAngle(a2, b2));
    return 2.0 * std::sqrt(c1 * c2) * std::sin(dh * kPi / 360.0);
}

std::array<std::uint8_t, 3> ColorSpaceConversion::labToSrgb(const CieLab &lab, const CieXYZ &white)
{
    if (!std::isfinite(lab.L) || !std::isfinite(lab.a) || !std::isfinite(lab.b))
        return {0, 0, 0};
    std::array<double, 3> rgb = linearSrgb(labToXyz(lab, white), white);
    if (inGamut(rgb))
        return encode(rgb);
    const std::array<double, 3> grey = linearSrgb(labToXyz(CieLab{lab.L, 0.0, 0.0}, white), white);
    if (!inGamut(grey))
        return encode(rgb);
    // Bisection on the chroma factor: the largest in-gamut chroma at this L* and hue.
    double inside = 0.0;
    double outside = 1.0;
    rgb = grey;
    for (int i = 0; i < 24; ++i) {
        const double f = 0.5 * (inside + outside);
        const std::array<double, 3> candidate =
            linearSrgb(labToXyz(CieLab{lab.L, lab.a * f, lab.b * f}, white), white);
        if (inGamut(candidate)) {
            inside = f;
            rgb = candidate;
        } else {
            outside = f;
        }
    }
    return encode(rgb);
}

std::array<std::uint8_t, 3> ColorSpaceConversion::xyzToSrgb(const CieXYZ &xyz, const CieXYZ &white)
{
    return labToSrgb(xyzToLab(xyz, white), white);
}

} // namespace vexa
