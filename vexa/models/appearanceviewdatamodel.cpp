#include "appearanceviewdatamodel.h"

#include "sameobjects_p.h"

#include <colorimetry/colorconverter.h>
#include <domain/appearancevalues.h>
#include <domain/labvalue.h>
#include <domain/qcjob.h>
#include <domain/qcjobtemplate.h>
#include <domain/standard.h>
#include <domain/tagdefinition.h>
#include <domain/tagvalue.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>

namespace vexa {


AppearanceViewDataModel::AppearanceViewDataModel(const ColorimetricCondition &condition)
    : m_colorimetricCondition(condition)
{
}

AppearanceViewDataModel::AppearanceViewDataModel(const AppearanceViewDataModel &other)
    : QObject(nullptr)
    , m_qcJob(other.m_qcJob)
    , m_standard(other.m_standard)
    , m_trials(other.m_trials)
    , m_currentToleranceSet(other.m_currentToleranceSet)
    , m_defaultTolerances(other.m_defaultTolerances)
    , m_jobTemplate(other.m_jobTemplate)
    , m_colorimetricCondition(other.m_colorimetricCondition)
    , m_nameFormat(other.m_nameFormat)
{
}

AppearanceViewDataModel::~AppearanceViewDataModel() = default;

std::vector<std::shared_ptr<ToleranceSet>> AppearanceViewDataModel::toleranceSets() const
{
    if (m_standard && !m_standard->toleranceSets().empty())
        return m_standard->toleranceSets();
    if (m_jobTemplate && !m_jobTemplate->toleranceSets().empty())
        return m_jobTemplate->toleranceSets();
    return m_defaultTolerances;
}

std::shared_ptr<ToleranceSet> AppearanceViewDataModel::currentToleranceSet() const
{
    const auto sets = toleranceSets();
    if (sets.empty())
        return nullptr;
    if (sets.size() == 1)
        return sets.front();
    return m_currentToleranceSet;
}

std::shared_ptr<Tolerance> AppearanceViewDataModel::tolerance(const Geometry &geometry) const
{
    const auto set = currentToleranceSet();
    if (!set)
        return nullptr;
    return set->toleranceWithGeometry(geometry);
}

void AppearanceViewDataModel::setQcJob(const std::shared_ptr<QCJob> &job)
{
    if (job.get() == m_qcJob.get())
        return;
    // A new job starts empty; the resets are part of the job change and announce nothing else.
    m_qcJob = job;
    m_standard.reset();
    m_trials.clear();
    m_jobTemplate.reset();
    m_currentToleranceSet.reset();
    Q_EMIT sgQCJobChanged();
}

void AppearanceViewDataModel::setStandard(const std::shared_ptr<Standard> &standard)
{
    if (standard.get() == m_standard.get())
        return;
    m_standard = standard;
    Q_EMIT sgStandardChanged();

    // A standard with exactly one set in force makes it current; with several the user chooses again.
    const auto sets = toleranceSets();
    const std::shared_ptr<ToleranceSet> candidate = sets.size() == 1 ? sets.front() : nullptr;
    if (candidate.get() != m_currentToleranceSet.get()) {
        m_currentToleranceSet = candidate;
        Q_EMIT sgToleranceSetChanged();
    }
}

void AppearanceViewDataModel::setTrials(const std::vector<std::shared_ptr<Trial>> &trials)
{
    if (sameObjects(trials, m_trials))
        return;
    m_trials = trials;
    Q_EMIT sgTrialsChanged();
}

void AppearanceViewDataModel::addTrial(const std::shared_ptr<Trial> &trial)
{
    m_trials.push_back(trial);
    Q_EMIT sgTrialsChanged();
}

void AppearanceViewDataModel::clearTrials()
{
    m_trials.clear();
    Q_EMIT sgTrialsChanged();
}

void AppearanceViewDataModel::setCurrentToleranceSet(const std::shared_ptr<ToleranceSet> &set)
{
    if (set.get() == m_currentToleranceSet.get())
        return;
    m_currentToleranceSet = set;
    Q_EMIT sgToleranceSetChanged();
}

void AppearanceViewDataModel::setDefaultTolerances(const std::vector<std::shared_ptr<ToleranceSet>> &sets)
{
    if (sameObjects(sets, m_defaultTolerances))
        return;
    m_defaultTolerances = sets;
    Q_EMIT sgToleranceSetChanged();
}

void AppearanceViewDataModel::setJobTemplate(const std::shared_ptr<QCJobTemplate> &jobTemplate)
{
    if (jobTemplate.get() == m_jobTemplate.get())
        return;
    m_jobTemplate = jobTemplate;
    Q_EMIT sgJobTemplateChanged();
}

void AppearanceViewDataModel::setColorimetricCondition(const ColorimetricCondition &condition)
{
    m_colorimetricCondition.setIlluminant(condition.illuminant());
    m_colorimetricCondition.setObserver(condition.observer());
    Q_EMIT sgColorimetricConditionChanged();
}

void AppearanceViewDataModel::setNameFormat(const std::string &format)
{
    m_nameFormat = format;
}

std::shared_ptr<LabValue> AppearanceViewDataModel::appearanceValueToLab(
    const std::shared_ptr<AppearanceValues> &values, const Geometry &geometry) const
{
    if (!values)
        return nullptr;
    const LabValue lab = ColorConverter::toLabValue(*values, geometry, m_colorimetricCondition);
    if (!lab.isValid())
        return nullptr;
    return std::make_shared<LabValue>(lab);
}

std::shared_ptr<LabValue> AppearanceViewDataModel::standardAsLabValue(const Geometry &geometry) const
{
    return standardAsLabValue(m_standard, geometry);
}

std::shared_ptr<LabValue> AppearanceViewDataModel::standardAsLabValue(const std::shared_ptr<Standard> &standard,
                                                                      const Geometry &geometry) const
{
    if (!standard)
        return nullptr;
    return appearanceValueToLab(standard->appearanceValues(), geometry);
}

std::vector<std::shared_ptr<LabValue>> AppearanceViewDataModel::trialsAsLabValues(const Geometry &geometry) const
{
    std::vector<std::shared_ptr<LabValue>> result;
    result.reserve(m_trials.size());
    for (const auto &trial : m_trials)
        result.push_back(trial ? appearanceValueToLab(trial->appearanceValues(), geometry) : nullptr);
    return result;
}

std::multimap<std::shared_ptr<TagValue>, std::shared_ptr<Trial>> AppearanceViewDataModel::trialsByGroup(
    const std::shared_ptr<TagDefinition> &tagDefinition) const
{
    std::multimap<std::shared_ptr<TagValue>, std::shared_ptr<Trial>> groups;
    for (const auto &trial : m_trials) {
        if (!trial)
            continue;
        groups.emplace(tagDefinition ? trial->tagValue(*tagDefinition) : nullptr, trial);
    }
    return groups;
}

} // namespace vexa
