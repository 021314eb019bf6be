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

    /// The CIE94 application in force and the factors it fixes: "Graphic arts" kL 1, K1 0.045,
    /// K2 0.015; "Textiles" kL 2, K1 0.048, K2 0.014. A set-wide "Application" rules over the
    /// tolerance's own; neither gives "Graphic arts". An unknown name gives an empty name (and the
    /// graphic-arts factors).
    struct Cie94Application
    {
        QString name;
        double kL = 1.0;
        double K1 = 0.045;
        double K2 = 0.015;
    };
    static Cie94Application cie94Application(const Tolerance &tolerance);

    /// L*a*b* of standard and trial at `geometry`; false when either is missing or unusable.
    static bool labPair(const AppearanceValues &standard, const AppearanceValues &trial, const Geometry &geometry,
                        const ColorimetricCondition &condition, CieLab *standardLab, CieLab *trialLab);

    /// Why a colour-difference limit cannot be used (NaN, infinite or negative); empty when it can.
    static QString checkDifferenceLimit(const Tolerance &tolerance, const QString &name);
    /// Why a box's limit pair `axis`- / `axis`+ cannot be used (NaN or infinite); empty when it can.
    /// A pair the wrong way round is not an error: the box is the same.
    static QString checkBoxLimits(const Tolerance &tolerance, const QString &axis);

    /// Fills status and normalizedDifference from n. A NaN or infinite n fails (3): the inputs were
    /// there, but the difference cannot be bounded.
    static void conclude(const Tolerance &tolerance, double n, ToleranceJudgement *judgement);
};

} // namespace vexa
