#include <tolerances/flopindexrule.h>

#include <tolerances/boxlimit.h>
#include <tolerances/toleranceruletools.h>

#include <colorimetry/colorindicescalculator.h>

#include <domain/geometry.h>
#include <domain/tolerance.h>

#include <QStringList>
#include <QVector>

#include <cmath>

namespace vexa {

QString FlopIndexRule::validate(const Tolerance &tolerance) const
{
    const QString thresholds = ToleranceRule::validate(tolerance);
    return thresholds.isEmpty() ? ToleranceRuleTools::checkBoxLimits(tolerance, QStringLiteral("dFI")) : thresholds;
}

ToleranceJudgement FlopIndexRule::judge(const Tolerance &tolerance, const AppearanceValues &trial,
                                        const AppearanceValues &standard, const ColorimetricCondition &condition) const
{
    ToleranceJudgement judgement;
    CieLab s[3];
    CieLab t[3];
    const char *angles[3] = {Geometry::ANGLE_45as15, Geometry::ANGLE_45as45, Geometry::ANGLE_45as110};
    for (int i = 0; i < 3; ++i) {
        if (!ToleranceRuleTools::labPair(standard, trial, Geometry(angles[i]), condition, &s[i], &t[i]))
            return judgement;
    }
    const double fiStandard = ColorIndicesCalculator::flopIndex(s[0].L, s[1].L, s[2].L);
    const double fiTrial = ColorIndicesCalculator::flopIndex(t[0].L, t[1].L, t[2].L);
    if (std::isnan(fiStandard) || std::isnan(fiTrial))
        return judgement; // L*45 ≤ 0: the index is undefined, no verdict
    const double delta = fiTrial - fiStandard;
    judgement.colorDifferences = {delta, fiTrial, fiStandard};
    judgement.differenceNames = QStringList{QStringLiteral("dFI"), QStringLiteral("FI trial"), QStringLiteral("FI standard")};
    ToleranceRuleTools::conclude(tolerance,
                                 BoxLimit::normalized(delta, ToleranceRuleTools::limit(tolerance, QStringLiteral("dFI-"), -1.0),
                                                      ToleranceRuleTools::limit(tolerance, QStringLiteral("dFI+"), 1.0)),
                                 &judgement);
    return judgement;
}

} // namespace vexa
