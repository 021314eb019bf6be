#pragma once

#include <colorimetry/colorimetry_export.h>

#include <QString>

namespace vexa {

class ColorimetricCondition;
class LabValue;
class ReflectanceSpectrum;

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

    /// Special metamerism index for a change of illuminant (CIE 15, multiplicative correction): the colour
    /// difference, by the named formula (see ColorDifferenceCalculator::Default_DE), between
    /// standard and trial under the `test` condition after the trial's tristimulus values under
    /// `test` were corrected multiplicatively by the standard's and the trial's ratio under
    /// `reference`: X't = Xt · Xr(standard) / Xr(trial), likewise Y and Z. A pair that matches
    /// under the reference gives the plain difference under the test condition; a trial that
    /// differs from the standard only by a constant factor gives 0. NaN when a spectrum cannot
    /// be converted under either condition or the trial has a zero tristimulus value under the
    /// reference. Throws std::invalid_argument naming an unknown formula.
    static double MetamerismIndex(const ReflectanceSpectrum &standard, const ReflectanceSpectrum &trial,
                                  const ColorimetricCondition &reference, const ColorimetricCondition &test,
                                  const QString &formula);
};

} // namespace vexa
