#pragma once

#include <colorimetry/colorimetry_export.h>

namespace vexa {

class LabValue;

/// Colour indices of multi-angle measurements.
class VEXA_COLORIMETRY_EXPORT ColorIndicesCalculator
{
public:
    /// Flop index (DuPont; Alman 1987) from the L*a*b* at 45as15, 45as45 and 45as110:
    /// FI = 2.69 · sgn(d) · |d|^1.11 / (L*45)^0.86 with d = L*15 − L*110. The signed (odd) extension
    /// keeps small noise on solid colours as small signed values. NaN when L*45 ≤ 0 or any value is
    /// missing or not finite.
    static double FlopIndex(const LabValue &lab15, const LabValue &lab45, const LabValue &lab110);
    /// The same from the three lightness values.
    static double flopIndex(double l15, double l45, double l110);
};

} // namespace vexa
