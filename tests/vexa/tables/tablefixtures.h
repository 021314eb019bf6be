#pragma once

// A comparison page for the colour table tests: a standard, trials that pass, warn and
// fail a CIELab dE*ab tolerance set, the shared models and colour compare settings.

#include "fixtures.h"

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/colorcomparesettings.h>
#include <vexa/models/trialselectionmodel.h>

#include <domain/instrumentinfo.h>
#include <settings/generalsettings.h>
#include <settings/stringlistsetting.h>
#include <tolerances/tolerancefactory.h>
#include <utilities/timestamp.h>

#include <memory>
#include <vector>

namespace tablefixtures {

inline std::shared_ptr<vexa::ToleranceSet> deltaESet(const QString &name, const QStringList &geometries)
{
    QVector<vexa::Geometry> list;
    for (const QString &g : geometries)
        list << vexa::Geometry(g);
    return vexa::ToleranceFactory::toleranceFactory()->createToleranceSet(QStringLiteral("CIELab dE*ab"), name, list);
}

inline std::shared_ptr<vexa::ColorCompareSettings> colorSettings(const QString &coordinates = QStringLiteral("CIELab"),
                                                                 const QString &standardCoordinates = QStringLiteral("None"),
                                                                 const QStringList &metrics = {QStringLiteral("Tolerances")})
{
    auto settings = std::make_shared<vexa::ColorCompareSettings>(QStringLiteral("Color"), QStringLiteral("Color Data"));
    settings->createSettings();
    settings->tableColorSpaceCoordinatesSetting()->setSelectedValue(coordinates);
    settings->tableStandardColorSpaceCoordinatesSetting()->setSelectedValue(standardCoordinates);
    settings->tableDEMetricsSetting()->setSelectedValues(metrics);
    return settings;
}

struct Page
{
    std::shared_ptr<vexa::AppearanceViewDataModel> data =
        std::make_shared<vexa::AppearanceViewDataModel>(vexa::ColorimetricCondition());
    std::shared_ptr<vexa::TrialSelectionModel> selection = std::make_shared<vexa::TrialSelectionModel>();
    std::shared_ptr<vexa::Standard> standard;
    std::vector<std::shared_ptr<vexa::Trial>> trials;
    std::shared_ptr<vexa::ToleranceSet> toleranceSet;

    // Standard "STD" at 45as15, 45as45, 45as110 with one dE*ab set there; trials T1 (near),
    // T2 (middle) and T3 (far) from the standard, stamped and measured by one instrument.
    static Page make(bool withTolerances = true)
    {
        Page page;
        page.standard = fixtures::standard(QStringLiteral("STD"), 0.20);
        if (withTolerances) {
            page.toleranceSet = deltaESet(QStringLiteral("dE Set"), fixtures::threeAngles());
            page.standard->setToleranceSets({page.toleranceSet});
        }
        const double bases[] = {0.2008, 0.2078, 0.2300};
        int n = 1;
        for (double base : bases) {
            auto trial = fixtures::trial(QStringLiteral("T%1").arg(n), base);
            trial->appearanceValues()->setTimeStamp(vexa::Timestamp(2024, 3, n, 10, 30, 0));
            vexa::InstrumentInfo info;
            info.setType(QStringLiteral("MA-T12"));
            info.setSerialNumber(QStringLiteral("SN%1").arg(n));
            trial->appearanceValues()->setInstrumentInfo(info);
            page.trials.push_back(trial);
            ++n;
        }
        page.data->setStandard(page.standard);
        page.data->setTrials(page.trials);
        return page;
    }
};

} // namespace tablefixtures
