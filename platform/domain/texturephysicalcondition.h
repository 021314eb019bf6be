#pragma once

#include <domain/geometry.h>
#include <domain/reflectable.h>

namespace vexa {

// The geometry a texture measurement was taken at.
class VEXA_DOMAIN_EXPORT TexturePhysicalCondition : public Reflectable
{
    VEXA_REFLECTABLE(TexturePhysicalCondition)
public:
    TexturePhysicalCondition() = default;
    explicit TexturePhysicalCondition(const Geometry &geometry) : m_geometry(geometry.toString()) {}

    QString geometry() const { return m_geometry; }
    void setGeometry(const QString &geometry) { m_geometry = geometry; }
    Geometry geometryValue() const { return Geometry::toGeometry(m_geometry, static_cast<bool *>(nullptr)); }

private:
    QString m_geometry;
};

} // namespace vexa
