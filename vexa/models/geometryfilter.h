#pragma once

#include <vexa/vexa_export.h>

#include <domain/geometry.h>

#include <memory>
#include <set>
#include <vector>

namespace vexa {

class Trial;

// The colour geometries present in a list of trials, limited to a filter.
class VEXA_EXPORT GeometryFilter
{
public:
    GeometryFilter() = default;
    explicit GeometryFilter(const std::set<Geometry> &filter);
    virtual ~GeometryFilter();

    const std::set<Geometry> &filter() const { return m_filter; }

    // The union of the geometries of the trials' colour values; with a non-empty filter only
    // those of the values at the filtered geometries. Trials without appearance values are skipped.
    std::set<Geometry> geometries(const std::vector<std::shared_ptr<Trial>> &trials) const;

private:
    std::set<Geometry> m_filter;
};

} // namespace vexa
