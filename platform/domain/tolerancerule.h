#pragma once

#include <domain/domain_export.h>
#include <domain/tolerancejudgement.h>

namespace vexa {

class AppearanceValues;
class ColorimetricCondition;
class Tolerance;

// How tolerances of one type judge. The tolerance library registers one rule per
// tolerance type with ToleranceRuleRegistry. Rules must be safe to call from any
// thread on objects nobody modifies meanwhile, and must not throw.
class VEXA_DOMAIN_EXPORT ToleranceRule
{
public:
    virtual ~ToleranceRule();
    virtual ToleranceJudgement judge(const Tolerance &tolerance, const AppearanceValues &trial,
                                     const AppearanceValues &standard, const ColorimetricCondition &condition) const = 0;
};

} // namespace vexa
