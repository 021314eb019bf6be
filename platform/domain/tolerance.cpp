#include "tolerance.h"

#include "appearancevalues.h"
#include "membertraits.h"
#include "toleranceruleregistry.h"

#include <utilities/logger.h>

#include <cmath>
#include <exception>

namespace vexa {

const MemberList &Tolerance::staticMembers()
{
    using C = Tolerance;
    static const MemberList list(BaseObject::staticMembers(), {
        member("toleranceType", &C::toleranceType, &C::setToleranceType),
        member("toleranceGroup", &C::toleranceGroup, &C::setToleranceGroup),
        member("geometry", &C::geometry, &C::setGeometryText),
        member("passThreshold", &C::passThreshold, &C::setPassThreshold),
        member("checkThreshold", &C::checkThreshold, &C::setCheckThreshold),
        member("toleranceParameters", &C::toleranceParameters, &C::setToleranceParameters),
        member("toleranceValues", &C::toleranceValues, &C::setToleranceValues),
        member("toleranceSetParameters", &C::toleranceSetParameters, &C::setToleranceSetParameters),
    });
    return list;
}

std::shared_ptr<ToleranceValue> Tolerance::toleranceValue(const QString &name) const
{
    for (const auto &v : m_values) {
        if (v && v->name() == name)
            return v;
    }
    return nullptr;
}

std::shared_ptr<ToleranceParameter> Tolerance::toleranceParameter(const QString &name) const
{
    for (const auto &p : m_parameters) {
        if (p && p->name() == name)
            return p;
    }
    return nullptr;
}

QString Tolerance::describe() const
{
    const QString type = m_toleranceType.isEmpty() ? QStringLiteral("Tolerance") : QStringLiteral("\"%1\"").arg(m_toleranceType);
    return m_geometry.isEmpty() ? type : QStringLiteral("%1 at %2").arg(type, m_geometry);
}

QString Tolerance::validationError() const
{
    const auto rule = ToleranceRuleRegistry::instance().rule(m_toleranceType);
    if (!rule)
        return QStringLiteral("%1: the tolerance type is not known.").arg(describe());
    return rule->validate(*this);
}

ToleranceJudgement Tolerance::judge(const AppearanceValues &trial, const AppearanceValues &standard,
                                    const ColorimetricCondition &condition) const
{
    const auto rule = ToleranceRuleRegistry::instance().rule(m_toleranceType);
    if (!rule)
        return ToleranceJudgement();
    try {
        const QString problem = rule->validate(*this);
        if (!problem.isEmpty()) {
            ToleranceJudgement refused;
            refused.error = problem;
            return refused;
        }
        return rule->judge(*this, trial, standard, condition);
    } catch (const std::exception &e) {
        Logger::instance().error(LogCategory::General,
                                 QStringLiteral("Tolerance::judge: rule for \"%1\" failed: %2")
                                     .arg(m_toleranceType, QString::fromLocal8Bit(e.what())));
    } catch (...) {
        Logger::instance().error(LogCategory::General,
                                 QStringLiteral("Tolerance::judge: rule for \"%1\" failed").arg(m_toleranceType));
    }
    return ToleranceJudgement();
}

int Tolerance::status(const AppearanceValues &trial, const AppearanceValues &standard,
                      const ColorimetricCondition &condition) const
{
    return judge(trial, standard, condition).status;
}

int Tolerance::statusOfNormalizedDifference(double normalizedDifference) const
{
    // A difference that cannot be a number while data are present fails: a broken value
    // must never pass. Missing data is the rule's call (no verdict) before it gets here.
    if (!std::isfinite(normalizedDifference))
        return ToleranceJudgement::Fail;
    if (normalizedDifference <= m_checkThreshold)
        return ToleranceJudgement::Pass;
    if (normalizedDifference <= m_passThreshold)
        return ToleranceJudgement::Warning;
    return ToleranceJudgement::Fail;
}

} // namespace vexa
