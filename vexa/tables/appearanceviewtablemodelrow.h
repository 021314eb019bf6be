#pragma once

#include <vexa/vexa_export.h>

#include <domain/colorimetriccondition.h>
#include <domain/geometry.h>
#include <domain/tolerancejudgement.h>

#include <map>
#include <memory>
#include <string>

namespace vexa {

class AppearanceValues;
class LabChValue;
class NamedObject;
class Standard;
class Tolerance;
class Trial;

// One row of a colour table: a measurement (the standard's or a trial's) at one
// geometry, its L*a*b*/L*C*h values under the table's colorimetric condition and the
// standard's values to compare with. Rows are built when the table is refreshed and
// shared by the column definitions that read them. Verdicts are computed on first
// request and kept with the row.
class VEXA_EXPORT AppearanceViewTableModelRow
{
public:
    struct Data
    {
        Geometry geometry;
        std::shared_ptr<NamedObject> object;               // the standard or the trial
        std::shared_ptr<AppearanceValues> appearanceValues;  // the object's measurement
        std::shared_ptr<LabChValue> labCh;                   // null: nothing at this geometry
        std::shared_ptr<AppearanceValues> standardAppearanceValues;
        std::shared_ptr<LabChValue> standardLabCh;
        ColorimetricCondition colorimetricCondition;
        std::string displayName;
        bool isStandard = false;
    };

    explicit AppearanceViewTableModelRow(Data data);

    const Geometry &geometry() const { return m_data.geometry; }
    const std::shared_ptr<NamedObject> &namedObject() const { return m_data.object; }
    // The row's trial; null for the standard's rows.
    std::shared_ptr<Trial> trial() const;
    std::shared_ptr<Standard> standard() const;
    const std::shared_ptr<AppearanceValues> &appearanceValues() const { return m_data.appearanceValues; }
    const std::shared_ptr<LabChValue> &labChValue() const { return m_data.labCh; }
    const std::shared_ptr<AppearanceValues> &standardAppearanceValues() const { return m_data.standardAppearanceValues; }
    const std::shared_ptr<LabChValue> &standardLabChValue() const { return m_data.standardLabCh; }
    const ColorimetricCondition &colorimetricCondition() const { return m_data.colorimetricCondition; }
    const std::string &displayName() const { return m_data.displayName; }
    bool isStandard() const { return m_data.isStandard; }

    // The tolerance's verdict on this row's values against the standard's. No verdict
    // (status 0) when either measurement is missing.
    const ToleranceJudgement &judgement(const Tolerance &tolerance) const;

private:
    Data m_data;
    mutable std::map<const Tolerance *, ToleranceJudgement> m_judgements;
};

} // namespace vexa
