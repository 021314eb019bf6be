#pragma once

#include <QImage>

namespace vexa {

// The background of the spectral view: the colours of the visible spectrum from 400 nm
// (left column) to 700 nm (right column), computed from the CIE 1931 colour-matching
// functions. Each column is the hue of the monochromatic light of its wavelength, as
// saturated and as bright as sRGB shows it; the rows fade it towards white, palest at
// the top, so that curves drawn over it stay easy to read.
class SpectrumImage
{
public:
    static constexpr int DefaultWidth = 301; // one column per nanometre
    static constexpr int DefaultHeight = 64;
    static constexpr double FirstWavelength = 400.0;
    static constexpr double LastWavelength = 700.0;

    // ARGB32 image; a null image for an empty size or without the CIE tables.
    static QImage render(int width = DefaultWidth, int height = DefaultHeight);
    // The wavelength shown by a column.
    static double wavelengthOfColumn(int column, int width);
};

} // namespace vexa
