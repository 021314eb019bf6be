#include "geometryprovider.h"

#include "appearanceviewdatamodel.h"
#include "trialselectionmodel.h"

#include <domain/tolerance.h>
#include <domain/toleranceset.h>

namespace vexa {

GeometryProvider::~GeometryProvider() = default;

SelectorGeometryProvider::SelectorGeometryProvider(const TrialSelectionModel &selectionModel)
    : m_selectionModel(selectionModel)
{
}

std::set<Geometry> SelectorGeometryProvider::geometries() const
{
    return m_selectionModel.colorGeometryFilter();
}

ToleranceGeometryProvider::ToleranceGeometryProvider(const AppearanceViewDataModel &dataModel)
    : m_dataModel(dataModel)
{
}

std::set<Geometry> ToleranceGeometryProvider::geometries() const
{
    std::set<Geometry> result;
    for (const auto &set : m_dataModel.toleranceSets()) {
        if (!set)
            continue;
        for (const auto &tolerance : set->tolerances()) {
            if (tolerance && !tolerance->geometry().isEmpty())
                result.insert(tolerance->geometryValue());
        }
    }
    return result;
}

} // namespace vexa
