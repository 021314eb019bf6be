#pragma once

#include <colorimetry/colorimetry_export.h>

#include <QStringList>

namespace vexa {

class LabValue;

/// Colour differences between two L*a*b* values (static, pure, thread-safe). The first value is the
/// standard (reference), the second the trial; every difference is trial minus standard. CIE94 and CMC
/// take their weights from the standard; CIEDE2000, DIN99, DIN99o and ΔE*ab are symmetric.
///
/// An invalid value (NaN or infinite component) gives NaN, never a number that looks real; so do
/// two values under different colorimetric conditions (D65/10 against A/2), with a logged warning.
class VEXA_COLORIMETRY_EXPORT ColorDifferenceCalculator
{
public:
    /// The formula names Default_DE accepts: "CIELab" (ΔE*ab; "CIE1976" is accepted too), "CIE94",
    /// "CMC", "CIE2000", "DIN99", "DIN99o".
    static QStringList formulaNames();
    /// Whether `formula` names a formula of formulaNames() or an alias.
    static bool isKnownFormula(const QString &formula);

    /// The colour difference by the named formula with the weights (l, c, h):
    /// CIELab: unused; CIE94: (kL, kC, kH) with the graphic-arts constants K1 0.045, K2 0.015 and the
    /// standard's chroma; CMC: (l, c), h unused; CIE2000: (kL, kC, kH); DIN99/DIN99o: (kE, kCH), h unused.
    /// Throws std::invalid_argument naming an unknown formula.
    static double Default_DE(const QString &formula, const LabValue &lab1, const LabValue &lab2, double l = 1.0,
                             double c = 1.0, double h = 1.0);

    static double Delta_L(const LabValue &lab1, const LabValue &lab2);
    static double Delta_a(const LabValue &lab1, const LabValue &lab2);
    static double Delta_b(const LabValue &lab1, const LabValue &lab2);
    /// ΔC*ab = C*(trial) − C*(standard).
    static double Delta_C(const LabValue &lab1, const LabValue &lab2);
    /// Signed ΔH*ab, positive when the trial's hue angle is larger (counter-clockwise), divided by the
    /// hue weight `h` (the parametric factor kH; 1 gives the plain CIELAB ΔH*ab). `l` and `c` are the
    /// lightness and chroma weights of the same call to Default_DE; they do not affect ΔH*ab and are
    /// accepted so that the three weights can be passed along unchanged.
    static double Delta_H(const LabValue &lab1, const LabValue &lab2, double l = 1.0, double c = 1.0, double h = 1.0);
    /// ΔE*ab.
    static double Delta_E(const LabValue &lab1, const LabValue &lab2);
};

} // namespace vexa
