#pragma once

#include <domain/domain_export.h>
#include <domain/tolerancejudgement.h>

#include <QString>

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
    // Why the tolerance cannot judge at all, in words for the user; empty when it can. The base
    // checks the thresholds: a pass threshold above 0 and a check threshold from 0 up to it.
    // Tolerance::judge asks this first and gives no verdict, with this text, when it is not empty.
    virtual QString validate(const Tolerance &tolerance) const;
};

} // namespace vexa
