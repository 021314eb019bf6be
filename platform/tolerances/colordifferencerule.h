#pragma once

#include <tolerances/tolerances_export.h>

#include <domain/tolerancerule.h>

namespace vexa {

/// The judging rule of the single-geometry CIELAB and DIN99 tolerance types: the boxes
/// "CIELab(+/-)" and "CIELCh(+/-)" and the ellipsoids "CIELab dE*ab", "CIE94", "CMC(l:c)",
/// "CIEDE2000", "DIN99" and "DIN99o". Stateless; safe from any thread.
class VEXA_TOLERANCES_EXPORT ColorDifferenceRule : public ToleranceRule
{
public:
    enum class Kind { LabBox, LChBox, CIELab, CIE94, CMC, CIEDE2000, DIN99, DIN99o };

    explicit ColorDifferenceRule(Kind kind);

    ToleranceJudgement judge(const Tolerance &tolerance, const AppearanceValues &trial,
                             const AppearanceValues &standard, const ColorimetricCondition &condition) const override;
    QString validate(const Tolerance &tolerance) const override;

private:
    Kind m_kind;
};

} // namespace vexa
