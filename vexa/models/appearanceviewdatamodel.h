#pragma once

#include <vexa/vexa_export.h>

#include <domain/colorimetriccondition.h>
#include <domain/geometry.h>

#include <QObject>

#include <map>
#include <memory>
#include <string>
#include <vector>

namespace vexa {

class AppearanceValues;
class LabValue;
class QCJob;
class QCJobTemplate;
class Standard;
class TagDefinition;
class TagValue;
class Tolerance;
class ToleranceSet;
class Trial;

// The data every view of a comparison page shows: job, standard, trials, tolerance
// sets and the colorimetric condition. Objects are compared by identity; a setter
// that changes nothing emits nothing, except clearTrials() and
// setColorimetricCondition(), which always announce themselves.
class VEXA_EXPORT AppearanceViewDataModel : public QObject
{
    Q_OBJECT
public:
    explicit AppearanceViewDataModel(const ColorimetricCondition &condition);
    AppearanceViewDataModel(const AppearanceViewDataModel &other);
    ~AppearanceViewDataModel() override;

    const std::shared_ptr<QCJob> &qcJob() const { return m_qcJob; }
    const std::shared_ptr<Standard> &standard() const { return m_standard; }
    const std::vector<std::shared_ptr<Trial>> &trials() const { return m_trials; }
    const std::shared_ptr<QCJobTemplate> &jobTemplate() const { return m_jobTemplate; }
    const std::vector<std::shared_ptr<ToleranceSet>> &defaultTolerances() const { return m_defaultTolerances; }
    ColorimetricCondition colorimetricCondition() const { return m_colorimetricCondition; }
    std::string nameFormat() const { return m_nameFormat; }

    // The standard's tolerance sets, else the job template's, else the defaults.
    std::vector<std::shared_ptr<ToleranceSet>> toleranceSets() const;
    // Null without sets in force; the only set when there is one; else the user's choice.
    std::shared_ptr<ToleranceSet> currentToleranceSet() const;
    std::shared_ptr<Tolerance> tolerance(const Geometry &geometry) const;

    void setQcJob(const std::shared_ptr<QCJob> &job);
    void setStandard(const std::shared_ptr<Standard> &standard);
    void setTrials(const std::vector<std::shared_ptr<Trial>> &trials);
    void addTrial(const std::shared_ptr<Trial> &trial);
    void clearTrials();
    void setCurrentToleranceSet(const std::shared_ptr<ToleranceSet> &set);
    void setDefaultTolerances(const std::vector<std::shared_ptr<ToleranceSet>> &sets);
    void setJobTemplate(const std::shared_ptr<QCJobTemplate> &jobTemplate);
    void setColorimetricCondition(const ColorimetricCondition &condition);
    void setNameFormat(const std::string &format);

    // L*a*b* under the model's condition; null when nothing can be computed at the geometry.
    std::shared_ptr<LabValue> appearanceValueToLab(const std::shared_ptr<AppearanceValues> &values,
                                                   const Geometry &geometry) const;
    std::shared_ptr<LabValue> standardAsLabValue(const Geometry &geometry) const;
    std::shared_ptr<LabValue> standardAsLabValue(const std::shared_ptr<Standard> &standard,
                                                 const Geometry &geometry) const;
    // One entry per trial, in order; entries may be null.
    std::vector<std::shared_ptr<LabValue>> trialsAsLabValues(const Geometry &geometry) const;

    std::multimap<std::shared_ptr<TagValue>, std::shared_ptr<Trial>> trialsByGroup(
        const std::shared_ptr<TagDefinition> &tagDefinition) const;

Q_SIGNALS:
    void sgQCJobChanged();
    void sgStandardChanged();
    void sgToleranceSetChanged();
    void sgTrialsChanged();
    void sgColorimetricConditionChanged();
    void sgJobTemplateChanged();

private:
    std::shared_ptr<QCJob> m_qcJob;
    std::shared_ptr<Standard> m_standard;
    std::vector<std::shared_ptr<Trial>> m_trials;
    std::shared_ptr<ToleranceSet> m_currentToleranceSet;
    std::vector<std::shared_ptr<ToleranceSet>> m_defaultTolerances;
    std::shared_ptr<QCJobTemplate> m_jobTemplate;
    ColorimetricCondition m_colorimetricCondition;
    std::string m_nameFormat = "<Name>";
};

} // namespace vexa
