#include "geometryfilter.h"

#include <domain/appearancevalues.h>
#include <domain/colorvalues.h>
#include <domain/trial.h>

namespace vexa {

GeometryFilter::GeometryFilter(const std::set<Geometry> &filter)
    : m_filter(filter)
{
}

GeometryFilter::~GeometryFilter() = default;

std::set<Geometry> GeometryFilter::geometries(const std::vector<std::shared_ptr<Trial>> &trials) const
{
    std::set<Geometry> result;
    const QVector<Geometry> filter(m_filter.begin(), m_filter.end());
    for (const auto &trial : trials) {
        if (!trial || !trial->appearanceValues())
            continue;
        const auto &values = *trial->appearanceValues();
        const auto colorValues = m_filter.empty() ? values.colorValues() : values.colorValuesForGeometries(filter);
        for (const auto &cv : colorValues) {
            if (!cv)
                continue;
            const Geometry g = cv->physicalCondition().geometryValue();
            if (g.isValid())
                result.insert(g);
        }
    }
    return result;
}

} // namespace vexa
