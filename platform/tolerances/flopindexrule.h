#pragma once

#include <tolerances/tolerances_export.h>

#include <domain/tolerancerule.h>

namespace vexa {

/// The judging rule of "Flop Index(+/-)": a box (dFI-, dFI+) on ΔFI = FI(trial) − FI(standard), from
/// L* at 45as15, 45as45 and 45as110 (all three needed in both samples). Sample-wide: the tolerance's
/// own geometry is not used. Stateless; safe from any thread.
class VEXA_TOLERANCES_EXPORT FlopIndexRule : public ToleranceRule
{
public:
    ToleranceJudgement judge(const Tolerance &tolerance, const AppearanceValues &trial,
                             const AppearanceValues &standard, const ColorimetricCondition &condition) const override;
    QString validate(const Tolerance &tolerance) const override;
};

} // namespace vexa
