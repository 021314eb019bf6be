#pragma once

#include <domain/geometry.h>
#include <domain/reflectable.h>

namespace vexa {

// How a colour value was measured: the geometry and the instrument's filters.
class VEXA_DOMAIN_EXPORT ColorPhysicalCondition : public Reflectable
{
    VEXA_REFLECTABLE(ColorPhysicalCondition)
public:
    ColorPhysicalCondition() = default;
    explicit ColorPhysicalCondition(const Geometry &geometry) : m_geometry(geometry.toString()) {}

    // The geometry's text ("45as15").
    QString geometry() const { return m_geometry; }
    void setGeometry(const QString &geometry) { m_geometry = geometry; }
    void setGeometry(const Geometry &geometry) { m_geometry = geometry.toString(); }
    // The geometry as a value; invalid when the text is not a geometry.
    Geometry geometryValue() const { return Geometry::toGeometry(m_geometry, static_cast<bool *>(nullptr)); }

    QString geometryDetail() const { return m_geometryDetail; }
    void setGeometryDetail(const QString &detail) { m_geometryDetail = detail; }
    QString illuminationStandard() const { return m_illuminationStandard; }
    void setIlluminationStandard(const QString &standard) { m_illuminationStandard = standard; }
    QString illuminationFilter() const { return m_illuminationFilter; }
    void setIlluminationFilter(const QString &filter) { m_illuminationFilter = filter; }
    QString polarisationFilter() const { return m_polarisationFilter; }
    void setPolarisationFilter(const QString &filter) { m_polarisationFilter = filter; }
    QString uvFilter() const { return m_uvFilter; }
    void setUvFilter(const QString &filter) { m_uvFilter = filter; }

    // The geometry followed by the non-empty details: "45as15, detail, ...".
    QString toString() const;

private:
    void setGeometryText(const QString &geometry) { m_geometry = geometry; }

    QString m_geometry;
    QString m_geometryDetail;
    QString m_illuminationStandard;
    QString m_illuminationFilter;
    QString m_polarisationFilter;
    QString m_uvFilter;
};

} // namespace vexa
