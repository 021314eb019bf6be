#pragma once

#include <vexa/vexa_export.h>

#include <domain/geometry.h>

#include <set>

namespace vexa {

class AppearanceViewDataModel;
class TrialSelectionModel;

// Which geometries a table or plot lists. Providers read their model afresh on every
// call, so they never need to be told of changes.
class VEXA_EXPORT GeometryProvider
{
public:
    GeometryProvider() = default;
    GeometryProvider(const GeometryProvider &) = default;
    GeometryProvider &operator=(const GeometryProvider &) = default;
    virtual ~GeometryProvider();

    virtual std::set<Geometry> geometries() const = 0;
};

// The colour geometry filter of the selection model (empty when nothing is filtered).
class VEXA_EXPORT SelectorGeometryProvider : public GeometryProvider
{
public:
    // The selection model must outlive the provider.
    explicit SelectorGeometryProvider(const TrialSelectionModel &selectionModel);
    std::set<Geometry> geometries() const override;

private:
    const TrialSelectionModel &m_selectionModel; // Not owned.
};

// The geometries named by the tolerances of the sets in force; tolerances without a
// geometry name (sample-wide ones such as the flop index) contribute nothing.
class VEXA_EXPORT ToleranceGeometryProvider : public GeometryProvider
{
public:
    // The data model must outlive the provider.
    explicit ToleranceGeometryProvider(const AppearanceViewDataModel &dataModel);
    std::set<Geometry> geometries() const override;

private:
    const AppearanceViewDataModel &m_dataModel; // Not owned.
};

} // namespace vexa
