#include "appearancevalueshelper.h"

#include "appearancevalues.h"

namespace vexa {

void AppearanceValuesHelper::addGeometriesFromAppearanceValues(const AppearanceValues &values,
                                                               std::set<Geometry> &geometries)
{
    for (const auto &v : values.colorValues()) {
        if (v && v->geometry().isValid())
            geometries.insert(v->geometry());
    }
}

void AppearanceValuesHelper::addGeometriesFromAppearanceValues(const std::shared_ptr<AppearanceValues> &values,
                                                               std::set<Geometry> &geometries)
{
    if (values)
        addGeometriesFromAppearanceValues(*values, geometries);
}

void AppearanceValuesHelper::addTextureGeometriesFromAppearanceValues(const AppearanceValues &values,
                                                                      std::set<Geometry> &geometries)
{
    for (const auto &v : values.textureValues()) {
        if (v && v->geometry().isValid())
            geometries.insert(v->geometry());
    }
}

} // namespace vexa
