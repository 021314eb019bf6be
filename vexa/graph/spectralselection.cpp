#include <vexa/graph/spectralselection.h>

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/widgets/uihelper.h>

#include <domain/appearancevalues.h>
#include <domain/reflectancespectrum.h>
#include <domain/standard.h>
#include <domain/trial.h>

#include <set>

namespace vexa {

namespace {

std::shared_ptr<ReflectanceSpectrum> spectrumAt(const std::shared_ptr<AppearanceValues> &values, const Geometry &geometry)
{
    return values ? values->reflectanceAt(geometry) : nullptr;
}

void addGeometries(const std::shared_ptr<AppearanceValues> &values, std::set<Geometry> &geometries)
{
    if (!values)
        return;
    for (const std::shared_ptr<ColorValues> &colorValues : values->colorValues()) {
        if (std::dynamic_pointer_cast<ReflectanceSpectrum>(colorValues) && colorValues->geometry().isValid())
            geometries.insert(colorValues->geometry());
    }
}

} // namespace

SpectralEntry SpectralSelection::standardEntry(const AppearanceViewDataModel &dataModel, const Geometry &geometry)
{
    SpectralEntry entry;
    entry.role = SpectralEntry::Role::Standard;
    entry.name = dataModel.standard()->name();
    entry.geometry = geometry;
    entry.spectrum = spectrumAt(dataModel.standard()->appearanceValues(), geometry);
    return entry;
}

SpectralEntry SpectralSelection::trialEntry(const AppearanceViewDataModel &dataModel, const std::shared_ptr<Trial> &trial,
                                            const Geometry &geometry, SpectralEntry::Role role)
{
    SpectralEntry entry;
    entry.role = role;
    entry.name = UIHelper::trialDisplayString(*trial, QString::fromStdString(dataModel.nameFormat()));
    entry.geometry = geometry;
    entry.trial = trial;
    entry.spectrum = spectrumAt(trial->appearanceValues(), geometry);
    if (const std::shared_ptr<Standard> &standard = dataModel.standard())
        entry.reference = spectrumAt(standard->appearanceValues(), geometry);
    return entry;
}

std::vector<SpectralEntry> SpectralSelection::entries(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                                      const std::shared_ptr<TrialSelectionModel> &selectionModel,
                                                      SpectralScope scope)
{
    std::vector<SpectralEntry> result;
    if (!dataModel || !selectionModel)
        return result;
    const std::shared_ptr<Standard> &standard = dataModel->standard();
    const std::shared_ptr<Trial> &selected = selectionModel->selectedTrial();
    auto trialEntryOf = [&](const std::shared_ptr<Trial> &trial, const Geometry &geometry) {
        result.push_back(trialEntry(*dataModel, trial, geometry,
                                    trial == selected ? SpectralEntry::Role::SelectedTrial
                                                      : SpectralEntry::Role::ActiveTrial));
    };

    if (scope == SpectralScope::SelectedGeometry) {
        const Geometry geometry = selectionModel->selectedColorGeometry();
        if (standard)
            result.push_back(standardEntry(*dataModel, geometry));
        bool selectedShown = false;
        for (const std::shared_ptr<Trial> &trial : selectionModel->activeTrials()) {
            if (!trial)
                continue;
            selectedShown = selectedShown || trial == selected;
            trialEntryOf(trial, geometry);
        }
        if (selected && !selectedShown)
            trialEntryOf(selected, geometry);
        return result;
    }

    std::set<Geometry> geometries = selectionModel->colorGeometryFilter();
    if (geometries.empty()) {
        addGeometries(standard ? standard->appearanceValues() : nullptr, geometries);
        if (selected)
            addGeometries(selected->appearanceValues(), geometries);
    }
    for (const Geometry &geometry : geometries) {
        if (standard)
            result.push_back(standardEntry(*dataModel, geometry));
        if (selected)
            trialEntryOf(selected, geometry);
    }
    return result;
}

} // namespace vexa
