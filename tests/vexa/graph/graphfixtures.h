#pragma once

// A comparison page for the spectral views' tests: the models, the standard "STD" and the
// given trials, all of them active (so the first is selected).

#include "fixtures.h"

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <memory>
#include <vector>

namespace graphfixtures {

struct Page
{
    std::shared_ptr<vexa::AppearanceViewDataModel> data;
    std::shared_ptr<vexa::TrialSelectionModel> selection;
    std::shared_ptr<vexa::Standard> standard;
    std::vector<std::shared_ptr<vexa::Trial>> trials;

    void reset(const std::vector<std::shared_ptr<vexa::Trial>> &pageTrials)
    {
        data = std::make_shared<vexa::AppearanceViewDataModel>(
            vexa::ColorimetricCondition(QStringLiteral("D65"), QStringLiteral("10")));
        selection = std::make_shared<vexa::TrialSelectionModel>();
        standard = fixtures::standard(QStringLiteral("STD"), 0.20);
        trials = pageTrials;
        data->setStandard(standard);
        data->setTrials(trials);
        selection->setActiveTrials(trials);
    }
};

} // namespace graphfixtures
