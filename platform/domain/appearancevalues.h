#pragma once

#include <domain/colorvalues.h>
#include <domain/instrumentinfo.h>
#include <domain/namedobject.h>
#include <domain/texturevalues.h>

#include <QVector>

#include <memory>
#include <vector>

namespace vexa {

class ReflectanceSpectrum;

// Everything measured on one sample: colour values (of several kinds, one or more
// a geometry) and texture values, with the instrument that measured them.
class VEXA_DOMAIN_EXPORT AppearanceValues : public NamedObject
{
    VEXA_REFLECTABLE(AppearanceValues)
public:
    const std::vector<std::shared_ptr<ColorValues>> &colorValues() const { return m_colorValues; }
    void setColorValues(const std::vector<std::shared_ptr<ColorValues>> &values) { m_colorValues = values; }
    void addColorValues(const std::shared_ptr<ColorValues> &values);
    // The colour values whose geometry is one of geometries, in stored order.
    std::vector<std::shared_ptr<ColorValues>> colorValuesForGeometries(const QVector<Geometry> &geometries) const;
    // Drops the colour values of the given kind (typeName(), e.g. "LabValue") at the geometry.
    void removeColorValuesOfTypeAndGeometry(const QString &typeName, const Geometry &geometry);
    // The first reflectance spectrum at the geometry; null when there is none.
    std::shared_ptr<ReflectanceSpectrum> reflectanceAt(const Geometry &geometry) const;

    const std::vector<std::shared_ptr<TextureValues>> &textureValues() const { return m_textureValues; }
    void setTextureValues(const std::vector<std::shared_ptr<TextureValues>> &values) { m_textureValues = values; }
    std::shared_ptr<TextureValues> textureValuesAt(const Geometry &geometry) const;

    const InstrumentInfo &instrumentInfo() const { return m_instrumentInfo; }
    void setInstrumentInfo(const InstrumentInfo &info) { m_instrumentInfo = info; }

private:
    InstrumentInfo instrumentInfoValue() const { return m_instrumentInfo; }

    std::vector<std::shared_ptr<ColorValues>> m_colorValues;
    std::vector<std::shared_ptr<TextureValues>> m_textureValues;
    InstrumentInfo m_instrumentInfo;
};

} // namespace vexa
