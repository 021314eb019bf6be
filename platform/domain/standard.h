#pragma once

#include <domain/appearancevalues.h>
#include <domain/namedobject.h>

#include <QStringList>

namespace vexa {

class ToleranceSet;

// The reference a trial is compared with. It may hold several measurements
// (one per sample part, in the order of sampleParts()); index 0 is the main one.
class VEXA_DOMAIN_EXPORT Standard : public NamedObject
{
    VEXA_REFLECTABLE(Standard)
public:
    // The measurement at index; null when there is none.
    std::shared_ptr<AppearanceValues> appearanceValues(int index = 0) const;
    // Makes values the only measurement.
    void setAppearanceValues(const std::shared_ptr<AppearanceValues> &values);
    const std::vector<std::shared_ptr<AppearanceValues>> &appearanceValuesList() const { return m_appearanceValues; }
    void setAppearanceValuesList(const std::vector<std::shared_ptr<AppearanceValues>> &values) { m_appearanceValues = values; }

    // The tolerance sets that apply to this standard (references).
    const std::vector<std::shared_ptr<ToleranceSet>> &toleranceSets() const { return m_toleranceSets; }
    void setToleranceSets(const std::vector<std::shared_ptr<ToleranceSet>> &sets);

    // Names of the parts of the sample (e.g. "bumper", "door").
    QStringList sampleParts() const { return m_sampleParts; }
    void setSampleParts(const QStringList &parts) { m_sampleParts = parts; }

private:
    std::vector<std::shared_ptr<AppearanceValues>> m_appearanceValues;
    std::vector<std::shared_ptr<ToleranceSet>> m_toleranceSets;
    QStringList m_sampleParts;
};

} // namespace vexa
