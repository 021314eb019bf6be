#pragma once

#include <colorimetry/cievalues.h>
#include <colorimetry/colorimetry_export.h>

#include <QString>

#include <memory>
#include <vector>

namespace vexa {

/// Weighting factors that turn a reflectance spectrum sampled on one wavelength grid into CIE XYZ
/// under one illuminant and observer: X = sum_j Wx[j] R[j] (likewise Y, Z).
///
/// The factors are computed from the 1 nm CIE tables for the spectrum's own grid, in the way of
/// ASTM E2022 (weights without bandpass correction, as ASTM E308 Table 6): the reflectance is
/// interpolated by Lagrange polynomials through the neighbouring samples (cubic inside, quadratic in
/// the first and last interval), the products S(λ)·x̄(λ) are summed against the interpolation
/// coefficients, and the weights of wavelengths outside the measured range are added to the first or
/// last sample (constant extrapolation). The normalisation is k = 100 / Σ S(λ)ȳ(λ). The sum runs at the
/// illuminant's own tabulation where it overlaps the observer tables (360-830 nm): 1 nm for A, D50,
/// D65; 5 nm for C, D55, D75 (360-780 nm) and F2, F7, F11, F12 (380-780 nm). No illuminant value is
/// interpolated or extrapolated.
///
/// The white point is the XYZ of R ≡ 1 with the same weights, so a perfect white gives L* = 100,
/// a* = b* = 0 exactly. Instances are immutable and shared; forGrid() caches them, thread-safe.
class VEXA_COLORIMETRY_EXPORT SpectralWeights
{
public:
    /// Weights for the grid start, start + interval, … (count samples). Illuminant "A", "C", "D50",
    /// "D55", "D65", "D75", "F2", "F7", "F11", "F12" ("FL11" is accepted for "F11"); observer "2" or "10"
    /// (a trailing degree sign or "deg" is accepted). Returns nullptr for an unknown illuminant or
    /// observer or an unusable grid (count < 1, interval ≤ 0, non-finite numbers).
    static std::shared_ptr<const SpectralWeights> forGrid(const QString &illuminant, const QString &observer,
                                                          double start, double interval, int count);

    /// Canonical names, or an empty string when unknown.
    static QString illuminantName(const QString &text);
    static QString observerName(const QString &text);

    int count() const { return int(m_x.size()); }
    const std::vector<double> &weightsX() const { return m_x; }
    const std::vector<double> &weightsY() const { return m_y; }
    const std::vector<double> &weightsZ() const { return m_z; }

    /// XYZ of the given reflectance factors (count() values, not clipped). Non-finite input gives
    /// non-finite output.
    CieXYZ tristimulus(const double *reflectance) const;
    /// XYZ of R ≡ 1 with these weights.
    const CieXYZ &whitePoint() const { return m_white; }

    /// The largest share, over X, Y and Z, of the colour matching weight (S(λ)·x̄(λ) summed over
    /// 360-830 nm) that falls outside the measured range and is only extrapolated: 0 for a grid
    /// covering 360-830 nm, about 0.002 for 400-700 nm, 1 for a grid wholly outside. A colour
    /// computed from a grid that leaves much of the weight unmeasured is made up, not measured.
    double unmeasuredShare() const { return m_unmeasuredShare; }
    /// The share above which a grid gives no colour: 0.1 (420-700 nm still passes with 0.06 of
    /// Z unmeasured under D65/10; 430-670 nm does not).
    static constexpr double maximumUnmeasuredShare = 0.1;

private:
    SpectralWeights() = default;
    static std::shared_ptr<const SpectralWeights> compute(const QString &illuminant, const QString &observer,
                                                          double start, double interval, int count);

    std::vector<double> m_x;
    std::vector<double> m_y;
    std::vector<double> m_z;
    CieXYZ m_white;
    double m_unmeasuredShare = 0.0;
};

} // namespace vexa
