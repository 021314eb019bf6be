#pragma once

#include <tolerances/tolerances_export.h>

#include <colorimetry/cievalues.h>

#include <domain/tolerancejudgement.h>

#include <QString>

namespace vexa {

class AppearanceValues;
class ColorimetricCondition;
class Geometry;
class Tolerance;

/// Helpers shared by the tolerance rules.
class VEXA_TOLERANCES_EXPORT ToleranceRuleTools
{
public:
    /// The limit `name` of the tolerance, or `fallback` when it has none.
    static double limit(const Tolerance &tolerance, const QString &name, double fallback);
    /// A numeric parameter: the tolerance's own, else the set-wide one, else `fallback`.
    static double number(const Tolerance &tolerance, const QString &name, double fallback);
    /// A text (choice) parameter, looked up like number().
    static QString text(const Tolerance &tolerance, const QString &name, const QString &fallback);

    /// L*a*b* of standard and trial at `geometry`; false when either is missing or unusable.
    static bool labPair(const AppearanceValues &standard, const AppearanceValues &trial, const Geometry &geometry,
                        const ColorimetricCondition &condition, CieLab *standardLab, CieLab *trialLab);

    /// Fills status and normalizedDifference from n. A NaN or infinite n fails (3): the inputs were
    /// there, but the difference cannot be bounded.
    static void conclude(const Tolerance &tolerance, double n, ToleranceJudgement *judgement);
};

} // namespace vexa
