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

std::vector<SpectralEntry> SpectralSelection::entries(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                                      const std::shared_ptr<TrialSelectionModel> &selectionModel,
                                                      SpectralScope scope)
{
    std::vector<SpectralEntry> result;
    if (!dataModel || !selectionModel)
        return result;
    const std::shared_ptr<Standard> &standard = dataModel->standard();
    const std::shared_ptr<AppearanceValues> standardValues = standard ? standard->appearanceValues() : nullptr;
    const QString format = QString::fromStdString(dataModel->nameFormat());
    const std::shared_ptr<Trial> &selected = selectionModel->selectedTrial();

    auto standardEntry = [&](const Geometry &geometry) {
        SpectralEntry entry;
        entry.role = SpectralEntry::Role::Standard;
        entry.name = standard->name();
        entry.geometry = geometry;
        entry.spectrum = spectrumAt(standardValues, geometry);
        result.push_back(entry);
    };
    auto trialEntry = [&](const std::shared_ptr<Trial> &trial, const Geometry &geometry) {
        SpectralEntry entry;
        entry.role = trial == selected ? SpectralEntry::Role::SelectedTrial : SpectralEntry::Role::ActiveTrial;
        entry.name = UIHelper::trialDisplayString(*trial, format);
        entry.geometry = geometry;
        entry.trial = trial;
        entry.spectrum = spectrumAt(trial->appearanceValues(), geometry);
        entry.reference = spectrumAt(standardValues, geometry);
        result.push_back(entry);
    };

    if (scope == SpectralScope::SelectedGeometry) {
        const Geometry geometry = selectionModel->selectedColorGeometry();
        if (standard)
            standardEntry(geometry);
        bool selectedShown = false;
        for (const std::shared_ptr<Trial> &trial : selectionModel->activeTrials()) {
            if (!trial)
                continue;
            selectedShown = selectedShown || trial == selected;
            trialEntry(trial, geometry);
        }
        if (selected && !selectedShown)
            trialEntry(selected, geometry);
        return result;
    }

    std::set<Geometry> geometries = selectionModel->colorGeometryFilter();
    if (geometries.empty()) {
        addGeometries(standardValues, geometries);
        if (selected)
            addGeometries(selected->appearanceValues(), geometries);
    }
    for (const Geometry &geometry : geometries) {
        if (standard)
            standardEntry(geometry);
        if (selected)
            trialEntry(selected, geometry);
    }
    return result;
}

} // namespace vexa
