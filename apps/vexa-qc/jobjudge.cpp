#include "jobjudge.h"

#include <domain/appearancevalues.h>
#include <domain/qcjob.h>
#include <domain/qcjobtemplate.h>
#include <domain/standard.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>
#include <tolerances/tolerancefactory.h>

#include <algorithm>

namespace vexa {

JobJudge::JobJudge(std::shared_ptr<QCJob> job, const ColorimetricCondition &condition)
    : m_job(std::move(job))
    , m_condition(condition)
{
    ToleranceFactory::toleranceFactory(); // the judging rules
    if (!m_job)
        return;
    if (m_job->standard() && !m_job->standard()->toleranceSets().empty())
        m_set = m_job->standard()->toleranceSets().front();
    else if (m_job->qcJobTemplate() && !m_job->qcJobTemplate()->toleranceSets().empty())
        m_set = m_job->qcJobTemplate()->toleranceSets().front();
}

std::vector<TrialVerdict> JobJudge::judge() const
{
    return judge(m_set);
}

std::vector<TrialVerdict> JobJudge::judge(const std::shared_ptr<ToleranceSet> &chosen) const
{
    const std::shared_ptr<ToleranceSet> set = chosen ? chosen : m_set;
    std::vector<TrialVerdict> verdicts;
    if (!m_job)
        return verdicts;
    const auto standard = m_job->standard();
    for (const auto &trial : m_job->trials()) {
        TrialVerdict verdict;
        verdict.trial = trial;
        if (set && standard && standard->appearanceValues() && trial && trial->appearanceValues()) {
            for (const auto &tolerance : set->tolerances()) {
                if (!tolerance)
                    continue;
                const ToleranceJudgement j
                    = tolerance->judge(*trial->appearanceValues(), *standard->appearanceValues(), m_condition);
                GeometryVerdict g;
                g.geometry = tolerance->geometryValue();
                g.toleranceType = tolerance->toleranceType();
                g.status = j.status;
                g.figure = j.colorDifferences.isEmpty() ? qQNaN() : j.colorDifferences.first();
                verdict.worst = std::max(verdict.worst, j.status);
                verdict.geometries << g;
            }
        }
        verdicts.push_back(verdict);
    }
    return verdicts;
}

QString JobJudge::statusText(int status)
{
    switch (status) {
    case 1:
        return QStringLiteral("PASS");
    case 2:
        return QStringLiteral("WARNING");
    case 3:
        return QStringLiteral("FAIL");
    default:
        return QString();
    }
}

} // namespace vexa
