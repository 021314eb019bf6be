#pragma once

#include <tolerances/tolerances_export.h>

#include <colorimetry/cievalues.h>

#include <domain/tolerancerule.h>

namespace vexa {

/// The judging rule of the multi-angle effect-paint types "DIN 6175-2" and "Audi2000".
///
/// Per aspecular angle γ (45° illumination, γ > 0) the semi-axes S_L, S_C, S_H depend on γ and on
/// L̄, C̄ (geometric mean of standard and trial, or the standard's values); the difference is the
/// Cartesian form ΔE_c (Δa*, Δb* against S_a, S_b), the polar form ΔE_p (ΔL*, ΔC*, ΔH*), or the
/// effective blend σΔE_c + (1 − σ)ΔE_p that favours the Cartesian form near neutral. Every constant
/// is a (hidden) tolerance parameter with the published defaults. Audi2000 uses the same kernel.
/// Stateless; safe from any thread.
class VEXA_TOLERANCES_EXPORT EffectColorRule : public ToleranceRule
{
public:
    explicit EffectColorRule(bool audi);

    /// The kernel at one angle; the parameters come from `tolerance` (defaults where absent).
    struct Result
    {
        double effective = 0.0;
        double polar = 0.0;
        double cartesian = 0.0;
        double sigma = 0.0;
        double SL = 0.0, SC = 0.0, SH = 0.0, Sa = 0.0, Sb = 0.0;
        double lightness = 0.0, chroma = 0.0, hue = 0.0, a = 0.0, b = 0.0; // weighted parts
    };
    static Result evaluate(const Tolerance &tolerance, const CieLab &standard, const CieLab &trial, double gamma);

    ToleranceJudgement judge(const Tolerance &tolerance, const AppearanceValues &trial,
                             const AppearanceValues &standard, const ColorimetricCondition &condition) const override;
    QString validate(const Tolerance &tolerance) const override;

private:
    bool m_audi;
};

} // namespace vexa
