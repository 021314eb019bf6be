#include "spectrumimage.h"

#include <colorimetry/cietables.h>
#include <colorimetry/cievalues.h>

#include <algorithm>
#include <array>
#include <cmath>

namespace vexa {

namespace {

// Share of the spectral colour over white, top row and bottom row.
constexpr double TopStrength = 0.22;
constexpr double BottomStrength = 0.62;

// x̄, ȳ, z̄ at a wavelength, linear between the rows of the table.
CieXYZ matchingFunctions(const CieTable &cmf, double nm)
{
    const double row = std::clamp((nm - cmf.firstWavelength) / cmf.step, 0.0, double(cmf.count - 1));
    const int r0 = std::min(int(row), cmf.count - 2);
    const double f = row - r0;
    auto at = [&](int column) { return cmf.value(r0, column) * (1.0 - f) + cmf.value(r0 + 1, column) * f; };
    return CieXYZ{at(0), at(1), at(2)};
}

// The hue of monochromatic light in sRGB (IEC 61966-2-1 primaries, linear): the colour
// is desaturated by adding white until no channel is negative, then scaled so that its
// largest channel is 1.
std::array<double, 3> spectralRgb(const CieXYZ &xyz)
{
    std::array<double, 3> rgb{3.2404542 * xyz.X - 1.5371385 * xyz.Y - 0.4985314 * xyz.Z,
                              -0.9692660 * xyz.X + 1.8760108 * xyz.Y + 0.0415560 * xyz.Z,
                              0.0556434 * xyz.X - 0.2040259 * xyz.Y + 1.0572252 * xyz.Z};
    const double lowest = std::min({rgb[0], rgb[1], rgb[2]});
    if (lowest < 0.0) {
        for (double &c : rgb)
            c -= lowest;
    }
    const double highest = std::max({rgb[0], rgb[1], rgb[2]});
    for (double &c : rgb)
        c = highest > 0.0 ? c / highest : 1.0;
    return rgb;
}

double encode(double linear)
{
    const double v = std::clamp(linear, 0.0, 1.0);
    return v <= 0.0031308 ? 12.92 * v : 1.055 * std::pow(v, 1.0 / 2.4) - 0.055;
}

} // namespace

double SpectrumImage::wavelengthOfColumn(int column, int width)
{
    if (width <= 1)
        return FirstWavelength;
    return FirstWavelength + (LastWavelength - FirstWavelength) * column / double(width - 1);
}

QImage SpectrumImage::render(int width, int height)
{
    const CieTable *cmf = CieTables::observer("2");
    if (!cmf || width < 1 || height < 1)
        return QImage();
    QImage image(width, height, QImage::Format_ARGB32);
    for (int column = 0; column < width; ++column) {
        const std::array<double, 3> rgb = spectralRgb(matchingFunctions(*cmf, wavelengthOfColumn(column, width)));
        for (int row = 0; row < height; ++row) {
            const double t = height > 1 ? row / double(height - 1) : 1.0;
            const double strength = TopStrength + (BottomStrength - TopStrength) * t;
            // Faded towards white in linear light, then encoded.
            auto channel = [&](double c) { return int(std::lround(255.0 * encode(1.0 + (c - 1.0) * strength))); };
            image.setPixel(column, row, qRgb(channel(rgb[0]), channel(rgb[1]), channel(rgb[2])));
        }
    }
    return image;
}

} // namespace vexa
