#include <tolerances/toleranceruletools.h>

#include <colorimetry/colorconverter.h>

#include <domain/appearancevalues.h>
#include <domain/tolerance.h>
#include <domain/toleranceparameter.h>
#include <domain/tolerancesetparameters.h>
#include <domain/tolerancevalue.h>

#include <cmath>

namespace vexa {

namespace {

std::shared_ptr<ToleranceParameter> findParameter(const Tolerance &tolerance, const QString &name)
{
    if (auto own = tolerance.toleranceParameter(name))
        return own;
    if (const auto setParameters = tolerance.toleranceSetParameters())
        return setParameters->parameter(name);
    return nullptr;
}

} // namespace

double ToleranceRuleTools::limit(const Tolerance &tolerance, const QString &name, double fallback)
{
    const auto value = tolerance.toleranceValue(name);
    return value ? value->valueAsDouble() : fallback;
}

double ToleranceRuleTools::number(const Tolerance &tolerance, const QString &name, double fallback)
{
    const auto parameter = findParameter(tolerance, name);
    return parameter ? parameter->valueAsDouble() : fallback;
}

QString ToleranceRuleTools::text(const Tolerance &tolerance, const QString &name, const QString &fallback)
{
    const auto parameter = findParameter(tolerance, name);
    return parameter ? parameter->value().toString() : fallback;
}

bool ToleranceRuleTools::labPair(const AppearanceValues &standard, const AppearanceValues &trial,
                                 const Geometry &geometry, const ColorimetricCondition &condition,
                                 CieLab *standardLab, CieLab *trialLab)
{
    const LabValue s = ColorConverter::toLabValue(standard, geometry, condition);
    if (!s.isValid())
        return false;
    const LabValue t = ColorConverter::toLabValue(trial, geometry, condition);
    if (!t.isValid())
        return false;
    *standardLab = CieLab{s.l(), s.a(), s.b()};
    *trialLab = CieLab{t.l(), t.a(), t.b()};
    return true;
}

ToleranceRuleTools::Cie94Application ToleranceRuleTools::cie94Application(const Tolerance &tolerance)
{
    const QString key = QStringLiteral("Application");
    std::shared_ptr<ToleranceParameter> parameter;
    if (const auto setParameters = tolerance.toleranceSetParameters())
        parameter = setParameters->parameter(key);
    if (!parameter)
        parameter = tolerance.toleranceParameter(key);
    Cie94Application application;
    application.name = parameter ? parameter->value().toString() : QStringLiteral("Graphic arts");
    if (application.name == QLatin1String("Textiles")) {
        application.kL = 2.0;
        application.K1 = 0.048;
        application.K2 = 0.014;
    } else if (application.name != QLatin1String("Graphic arts")) {
        application.name.clear();
    }
    return application;
}

QString ToleranceRuleTools::checkDifferenceLimit(const Tolerance &tolerance, const QString &name)
{
    const auto value = tolerance.toleranceValue(name);
    if (!value)
        return QString();
    const double limit = value->valueAsDouble();
    if (!std::isfinite(limit))
        return QStringLiteral("%1: the limit %2 is not a number.").arg(tolerance.describe(), name);
    if (limit < 0.0)
        return QStringLiteral("%1: the limit %2 is negative (%3); a colour-difference limit must be 0 or more.")
            .arg(tolerance.describe(), name, QString::number(limit));
    return QString();
}

QString ToleranceRuleTools::checkBoxLimits(const Tolerance &tolerance, const QString &axis)
{
    for (const QChar side : {QLatin1Char('-'), QLatin1Char('+')}) {
        const QString name = axis + side;
        const auto value = tolerance.toleranceValue(name);
        if (value && !std::isfinite(value->valueAsDouble()))
            return QStringLiteral("%1: the limit %2 is not a number.").arg(tolerance.describe(), name);
    }
    return QString();
}

void ToleranceRuleTools::conclude(const Tolerance &tolerance, double n, ToleranceJudgement *judgement)
{
    judgement->normalizedDifference = n;
    if (!std::isfinite(n))
        judgement->status = ToleranceJudgement::Fail;
    else if (n <= tolerance.checkThreshold())
        judgement->status = ToleranceJudgement::Pass;
    else if (n <= tolerance.passThreshold())
        judgement->status = ToleranceJudgement::Warning;
    else
        judgement->status = ToleranceJudgement::Fail;
}

} // namespace vexa
