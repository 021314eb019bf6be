#pragma once

// Colour-plot fixtures: measurements stored as L*a*b* values (so that the plotted numbers are
// known exactly), tolerances of known shape, and judging rules for tests whose regions are
// known in closed form.

#include <domain/appearancevalues.h>
#include <domain/colorimetriccondition.h>
#include <domain/geometry.h>
#include <domain/labvalue.h>
#include <domain/standard.h>
#include <domain/tolerance.h>
#include <domain/toleranceruleregistry.h>
#include <domain/toleranceset.h>
#include <domain/tolerancevalue.h>
#include <domain/trial.h>
#include <tolerances/tolerancefactory.h>

#include <QStringList>

#include <atomic>
#include <cmath>
#include <functional>
#include <memory>

namespace plotfixtures {

inline vexa::ColorimetricCondition condition()
{
    return vexa::ColorimetricCondition(QStringLiteral("D65"), QStringLiteral("10"));
}

inline QStringList geometries()
{
    return {QStringLiteral("45as15"), QStringLiteral("45as45"), QStringLiteral("45as110")};
}

// L* falls with the aspecular angle, as on a metallic finish; a* and b* stay.
inline double flopLightness(double l45, const vexa::Geometry &g)
{
    return l45 * (1.75 - g.getAspecular() / 60.0);
}

inline std::shared_ptr<vexa::AppearanceValues> labAppearance(double l45, double a, double b,
                                                             const QStringList &geometryTexts = geometries())
{
    auto values = std::make_shared<vexa::AppearanceValues>();
    std::vector<std::shared_ptr<vexa::ColorValues>> colorValues;
    for (const QString &text : geometryTexts) {
        const vexa::Geometry g(text);
        auto lab = std::make_shared<vexa::LabValue>(g == vexa::Geometry("45as45") ? l45 : flopLightness(l45, g), a, b,
                                                    condition());
        lab->setGeometry(g);
        colorValues.push_back(lab);
    }
    values->setColorValues(colorValues);
    return values;
}

inline std::shared_ptr<vexa::Standard> labStandard(const QString &name, double l45, double a, double b,
                                                   const QStringList &geometryTexts = geometries())
{
    auto s = std::make_shared<vexa::Standard>();
    s->setName(name);
    s->setAppearanceValues(labAppearance(l45, a, b, geometryTexts));
    return s;
}

inline std::shared_ptr<vexa::Trial> labTrial(const QString &name, double l45, double a, double b,
                                             const QStringList &geometryTexts = geometries())
{
    auto t = std::make_shared<vexa::Trial>();
    t->setName(name);
    t->setAppearanceValues(labAppearance(l45, a, b, geometryTexts));
    return t;
}

// A tolerance of a registered type at the geometry, with limit "dE" (ellipsoid types) and the
// pass/warning thresholds given.
inline std::shared_ptr<vexa::Tolerance> tolerance(const QString &type, const vexa::Geometry &geometry,
                                                  double dE = 1.0, double checkThreshold = 0.8,
                                                  double passThreshold = 1.0)
{
    auto *factory = vexa::ToleranceFactory::toleranceFactory();
    auto t = factory->isKnownType(type) ? factory->createTolerance(type, geometry) : nullptr;
    if (!t) {
        t = std::make_shared<vexa::Tolerance>();
        t->setToleranceType(type);
        t->setGeometry(geometry);
    }
    if (auto limit = t->toleranceValue(QStringLiteral("dE")))
        limit->setValue(dE);
    t->setCheckThreshold(checkThreshold);
    t->setPassThreshold(passThreshold);
    return t;
}

inline std::shared_ptr<vexa::ToleranceSet> toleranceSet(const std::vector<std::shared_ptr<vexa::Tolerance>> &tolerances)
{
    auto set = std::make_shared<vexa::ToleranceSet>();
    set->setName(QStringLiteral("Plot tolerances"));
    set->setTolerances(tolerances);
    return set;
}

// A rule given as a function of the probe's offset from the standard (dL, da, db).
class FunctionRule : public vexa::ToleranceRule
{
public:
    using Judge = std::function<int(double dL, double da, double db)>;
    explicit FunctionRule(Judge judge)
        : m_judge(std::move(judge))
    {
    }
    vexa::ToleranceJudgement judge(const vexa::Tolerance &tolerance, const vexa::AppearanceValues &trial,
                                   const vexa::AppearanceValues &standard,
                                   const vexa::ColorimetricCondition &cond) const override
    {
        vexa::ToleranceJudgement judgement;
        const vexa::Geometry g = tolerance.geometryValue();
        vexa::LabValue s;
        vexa::LabValue t;
        for (const auto &v : standard.colorValues())
            if (auto lab = std::dynamic_pointer_cast<vexa::LabValue>(v); lab && lab->geometry() == g)
                s = *lab;
        for (const auto &v : trial.colorValues())
            if (auto lab = std::dynamic_pointer_cast<vexa::LabValue>(v); lab && lab->geometry() == g)
                t = *lab;
        if (!s.isValid() || !t.isValid() || s.colorimetricCondition() != cond)
            return judgement;
        judgement.status = m_judge(t.l() - s.l(), t.a() - s.a(), t.b() - s.b());
        return judgement;
    }

private:
    Judge m_judge;
};

// Registers a test rule under a type name (replacing an earlier one of that name).
inline void registerRule(const QString &type, FunctionRule::Judge judge)
{
    vexa::ToleranceRuleRegistry::instance().registerRule(type, std::make_shared<FunctionRule>(std::move(judge)));
}

inline std::shared_ptr<vexa::Tolerance> ruleTolerance(const QString &type, const vexa::Geometry &geometry)
{
    auto t = std::make_shared<vexa::Tolerance>();
    t->setToleranceType(type);
    t->setGeometry(geometry);
    return t;
}

// Some work per judgement, so that a calculation lasts long enough to be interrupted.
inline int slowly(int status)
{
    volatile double sink = 0.0;
    for (int i = 0; i < 20000; ++i)
        sink = sink + std::sqrt(static_cast<double>(i));
    return status;
}

// A silver metallic standard at 45as45 (L* 62, a* -0.6, b* -1.9) and twenty trials around it,
// scattered deterministically to pass, warn and fail a tolerance of about one unit.
struct SilverSample
{
    std::shared_ptr<vexa::Standard> standard;
    std::vector<std::shared_ptr<vexa::Trial>> trials;
};

inline SilverSample silverSample()
{
    SilverSample sample;
    sample.standard = labStandard(QStringLiteral("Silver metallic"), 62.0, -0.6, -1.9);
    // Offsets (dL, da, db) on a spiral with growing radius and alternating lightness.
    for (int i = 0; i < 20; ++i) {
        const double angle = i * 2.39996; // golden angle
        const double radius = 0.15 + 0.075 * i;
        const double da = radius * std::cos(angle);
        const double db = radius * std::sin(angle) * 0.8;
        const double dL = ((i % 5) - 2) * 0.35 + (i % 2 ? 0.2 : -0.15);
        sample.trials.push_back(labTrial(QStringLiteral("Panel %1").arg(i + 1, 2, 10, QLatin1Char('0')), 62.0 + dL,
                                         -0.6 + da, -1.9 + db));
    }
    return sample;
}

} // namespace plotfixtures
