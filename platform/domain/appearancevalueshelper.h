#pragma once

#include <domain/geometry.h>

#include <memory>
#include <set>

namespace vexa {

class AppearanceValues;

class VEXA_DOMAIN_EXPORT AppearanceValuesHelper
{
public:
    // Adds the (valid) geometries of the colour values to geometries.
    static void addGeometriesFromAppearanceValues(const AppearanceValues &values, std::set<Geometry> &geometries);
    static void addGeometriesFromAppearanceValues(const std::shared_ptr<AppearanceValues> &values,
                                                  std::set<Geometry> &geometries);
    // The same for the texture values.
    static void addTextureGeometriesFromAppearanceValues(const AppearanceValues &values, std::set<Geometry> &geometries);
};

} // namespace vexa
