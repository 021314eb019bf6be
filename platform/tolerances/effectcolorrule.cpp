#include <tolerances/effectcolorrule.h>

#include <tolerances/toleranceruletools.h>

#include <colorimetry/colordifferenceformulas.h>

#include <domain/geometry.h>
#include <domain/tolerance.h>

#include <QStringList>
#include <QVector>

#include <algorithm>
#include <cmath>

namespace vexa {

namespace {

using Tools = ToleranceRuleTools;

double form(const Tolerance &tolerance, const EffectColorRule::Result &r)
{
    const QString f = Tools::text(tolerance, QStringLiteral("Form"), QStringLiteral("Effective"));
    if (f == QLatin1String("Polar"))
        return r.polar;
    if (f == QLatin1String("Cartesian"))
        return r.cartesian;
    return r.effective;
}

} // namespace

EffectColorRule::EffectColorRule(bool audi)
    : m_audi(audi)
{
}

QString EffectColorRule::validate(const Tolerance &tolerance) const
{
    const QString thresholds = ToleranceRule::validate(tolerance);
    return thresholds.isEmpty() ? Tools::checkDifferenceLimit(tolerance, QStringLiteral("dE")) : thresholds;
}

EffectColorRule::Result EffectColorRule::evaluate(const Tolerance &tolerance, const CieLab &standard,
                                                  const CieLab &trial, double gamma)
{
    auto p = [&tolerance](const char *name, double fallback) {
        return Tools::number(tolerance, QString::fromLatin1(name), fallback);
    };
    const ColorDifferenceFormulas::Result d = ColorDifferenceFormulas::cie76(standard, trial);
    const double cs = std::hypot(standard.a, standard.b);
    const double ct = std::hypot(trial.a, trial.b);
    const bool useStandard = Tools::text(tolerance, QStringLiteral("Weighting reference"),
                                         QStringLiteral("Geometric mean"))
                             == QLatin1String("Standard");
    const double lBar = useStandard ? standard.L : std::sqrt(std::max(0.0, standard.L * trial.L));
    const double cBar = useStandard ? cs : std::sqrt(cs * ct);
    const double sqrtL = std::sqrt(std::max(0.0, lBar));
    const double sqrtC = std::sqrt(cBar);
    const double floor = p("S floor", 0.7);

    Result r;
    r.SL = p("SL a", 0.15) * sqrtL + p("SL b", 31.5) / gamma;
    r.SC = std::max(floor, p("SC a", 0.48) * sqrtC - p("SC b", 0.35) * sqrtL + p("SC c", 42.0) / gamma);
    r.SH = std::max(floor, p("SH a", 0.14) * sqrtC - p("SH b", 0.20) * sqrtL + p("SH c", 21.0) / gamma
                               + p("SH d", 0.7));
    r.Sa = p("Sa", 0.7);
    r.Sb = p("Sb", 0.7);
    r.lightness = d.lightness / (p("gL", 1.0) * r.SL);
    r.chroma = d.chroma / (p("gC", 1.0) * r.SC);
    r.hue = d.hue / (p("gH", 1.0) * r.SH);
    r.a = (trial.a - standard.a) / (p("ga", 1.0) * r.Sa);
    r.b = (trial.b - standard.b) / (p("gb", 1.0) * r.Sb);
    r.polar = std::sqrt(r.lightness * r.lightness + r.chroma * r.chroma + r.hue * r.hue);
    r.cartesian = std::sqrt(r.lightness * r.lightness + r.a * r.a + r.b * r.b);
    const double c0 = p("C0 base", 10.0) + p("C0 step", 8.0) / (1.0 + std::exp(p("C0 L", 27.0) - lBar));
    r.sigma = 1.0 / (1.0 + std::exp(cBar - c0));
    r.effective = r.sigma * r.cartesian + (1.0 - r.sigma) * r.polar;
    return r;
}

ToleranceJudgement EffectColorRule::judge(const Tolerance &tolerance, const AppearanceValues &trial,
                                          const AppearanceValues &standard,
                                          const ColorimetricCondition &condition) const
{
    ToleranceJudgement judgement;
    const Geometry geometry = tolerance.geometryValue();
    if (!geometry.isDirectional() || geometry.getIlluminationAngle() != 45 || geometry.getAspecular() <= 0)
        return judgement;
    CieLab s;
    CieLab t;
    if (!Tools::labPair(standard, trial, geometry, condition, &s, &t))
        return judgement;
    const Result r = evaluate(tolerance, s, t, geometry.getAspecular());
    const double main = form(tolerance, r);

    // Informative aggregates over the effect angles present in both samples.
    double sum = 0.0;
    double maximum = 0.0;
    int count = 0;
    for (int gamma : {15, 25, 45, 75, 110}) {
        CieLab sg;
        CieLab tg;
        if (!Tools::labPair(standard, trial, Geometry(QStringLiteral("45as%1").arg(gamma)), condition, &sg, &tg))
            continue;
        const double value = form(tolerance, evaluate(tolerance, sg, tg, gamma));
        sum += value;
        maximum = std::max(maximum, value);
        ++count;
    }
    const double mean = count > 0 ? sum / count : main;
    if (count == 0)
        maximum = main;

    if (m_audi) {
        judgement.colorDifferences = {main, r.polar, r.cartesian, r.lightness, r.chroma, r.hue, mean, maximum};
        judgement.differenceNames = QStringList{QStringLiteral("dE"), QStringLiteral("dEp"), QStringLiteral("dEc"),
                                     QStringLiteral("dL/(gL SL)"), QStringLiteral("dC/(gC SC)"),
                                     QStringLiteral("dH/(gH SH)"), QStringLiteral("mdE"), QStringLiteral("maxdE")};
    } else {
        judgement.colorDifferences = {main, r.lightness, r.chroma, r.hue, r.a, r.b, mean, maximum};
        judgement.differenceNames = QStringList{QStringLiteral("dE"), QStringLiteral("dL/(gL SL)"), QStringLiteral("dC/(gC SC)"),
                                     QStringLiteral("dH/(gH SH)"), QStringLiteral("da/(ga Sa)"),
                                     QStringLiteral("db/(gb Sb)"), QStringLiteral("mdE"), QStringLiteral("maxdE")};
    }
    Tools::conclude(tolerance, main / Tools::limit(tolerance, QStringLiteral("dE"), 1.0), &judgement);
    return judgement;
}

} // namespace vexa
