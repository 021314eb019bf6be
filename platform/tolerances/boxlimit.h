#pragma once

#include <tolerances/tolerances_export.h>

namespace vexa {

/// Normalisation of a difference against a (lower, upper) limit pair of a box tolerance.
///
/// A pair typed the wrong way round (dL- = 1, dL+ = -1) is the same box as (-1, 1): the smaller
/// limit is the lower one, wherever the pair comes from (an editor, a stored set, code).
///
/// If the box contains 0 the reference r is 0, otherwise r is the box centre (an offset box). Then
/// n = (Δ − r)/(upper − r) for Δ ≥ r and (Δ − r)/(lower − r) below, so n = 1 on the box edge. A side of
/// zero width gives infinity for any Δ beyond it. An axis whose limits are both 0 is switched off (n = 0).
class VEXA_TOLERANCES_EXPORT BoxLimit
{
public:
    static double normalized(double delta, double lower, double upper);
    /// Puts the smaller limit first; NaN stays where it is.
    static void order(double *lower, double *upper);
    static bool isDisabled(double lower, double upper) { return lower == 0.0 && upper == 0.0; }
};

} // namespace vexa
