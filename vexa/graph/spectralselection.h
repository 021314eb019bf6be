#pragma once

#include <vexa/vexa_export.h>

#include <domain/geometry.h>

#include <QString>

#include <memory>
#include <vector>

namespace vexa {

class AppearanceViewDataModel;
class ReflectanceSpectrum;
class Trial;
class TrialSelectionModel;

// What a spectral page compares: the standard and the active trials at the selected
// colour geometry, or the selected trial (the standard when none is selected) against the
// standard at every geometry.
enum class SpectralScope {
    SelectedGeometry,
    AllGeometries,
};

// One measurement at one geometry on a spectral page.
struct VEXA_EXPORT SpectralEntry
{
    enum class Role {
        Standard,
        SelectedTrial,
        ActiveTrial,
    };

    Role role = Role::Standard;
    // The display name of the measurement (trials by the data model's name format).
    QString name;
    Geometry geometry;
    // Null for the standard.
    std::shared_ptr<Trial> trial;
    // The measurement's reflectance spectrum at the geometry; null when it has none.
    std::shared_ptr<ReflectanceSpectrum> spectrum;
    // The standard's spectrum at the same geometry, for trials; null when there is none.
    std::shared_ptr<ReflectanceSpectrum> reference;
};

class VEXA_EXPORT SpectralSelection
{
public:
    // The entries to show, standard first at each geometry:
    // - SelectedGeometry: the standard, then the active trials in their order (the selected
    //   trial marked; a selected trial that is not active comes last), at the selection
    //   model's colour geometry;
    // - AllGeometries: the standard and the selected trial at each geometry of the colour
    //   geometry filter, or, without a filter, at each geometry where either has a spectrum.
    // Empty without models.
    static std::vector<SpectralEntry> entries(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                              const std::shared_ptr<TrialSelectionModel> &selectionModel,
                                              SpectralScope scope);

    // The entry of the data model's standard (which must be set) at a geometry.
    static SpectralEntry standardEntry(const AppearanceViewDataModel &dataModel, const Geometry &geometry);
    // The entry of a trial (not null) at a geometry, with the standard's spectrum as reference.
    static SpectralEntry trialEntry(const AppearanceViewDataModel &dataModel, const std::shared_ptr<Trial> &trial,
                                    const Geometry &geometry, SpectralEntry::Role role);
};

} // namespace vexa
