#include "appearancevalues.h"

#include "membertraits.h"
#include "reflectancespectrum.h"

#include <algorithm>

namespace vexa {

const MemberList &AppearanceValues::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("colorValues", &AppearanceValues::colorValues, &AppearanceValues::setColorValues),
        member("textureValues", &AppearanceValues::textureValues, &AppearanceValues::setTextureValues),
        member("instrumentInfo", &AppearanceValues::instrumentInfoValue, &AppearanceValues::setInstrumentInfo),
    });
    return list;
}

void AppearanceValues::addColorValues(const std::shared_ptr<ColorValues> &values)
{
    if (values)
        m_colorValues.push_back(values);
}

std::vector<std::shared_ptr<ColorValues>> AppearanceValues::colorValuesForGeometries(const QVector<Geometry> &geometries) const
{
    std::vector<std::shared_ptr<ColorValues>> out;
    for (const auto &values : m_colorValues) {
        if (values && geometries.contains(values->geometry()))
            out.push_back(values);
    }
    return out;
}

void AppearanceValues::removeColorValuesOfTypeAndGeometry(const QString &typeName, const Geometry &geometry)
{
    m_colorValues.erase(std::remove_if(m_colorValues.begin(), m_colorValues.end(),
                                       [&](const std::shared_ptr<ColorValues> &v) {
                                           return v && v->typeName() == typeName && v->geometry() == geometry;
                                       }),
                        m_colorValues.end());
}

std::shared_ptr<ReflectanceSpectrum> AppearanceValues::reflectanceAt(const Geometry &geometry) const
{
    for (const auto &values : m_colorValues) {
        auto spectrum = std::dynamic_pointer_cast<ReflectanceSpectrum>(values);
        if (spectrum && spectrum->geometry() == geometry)
            return spectrum;
    }
    return nullptr;
}

std::shared_ptr<TextureValues> AppearanceValues::textureValuesAt(const Geometry &geometry) const
{
    for (const auto &values : m_textureValues) {
        if (values && values->geometry() == geometry)
            return values;
    }
    return nullptr;
}

} // namespace vexa
