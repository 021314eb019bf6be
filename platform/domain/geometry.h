#pragma once

#include <domain/domain_export.h>

#include <QHashFunctions>
#include <QMetaType>
#include <QString>
#include <QVector>

namespace vexa {

// Named groups of geometries.
enum class GeometrySet {
    MultiAngleSimple, // 45as15, 45as45, 45as110
    MultiAngle,       // the six angles of a 45° multi-angle instrument: 45as-15 ... 45as110
    MultiAngle15,     // the angles illuminated at 15°: 15as-45 ... 15as80
    Color,            // MultiAngle15 and MultiAngle
    Texture,          // sparkle (15as15, 15as45, 45as15) and coarseness (15_diffuse)
    Sphere,           // d8 and SPIN
    All,              // every named geometry
};

// A measurement geometry, a value built from its text form:
//  - directional "<illumination>as<aspecular>", e.g. "45as15", "45as-15", "15as80"; the aspecular
//    angle may also be written with N for the minus ("45asN15"); the canonical text uses '-';
//  - diffuse: "diffuse", "d8" (also "d/8", "d:8"; diffuse illumination, 8° viewing) and
//    "<angle>_diffuse" (directional illumination at <angle>, diffuse viewing, e.g. "15_diffuse");
//  - "SPIN": sphere, specular included (not counted as diffuse).
// Parsing ignores case and surrounding blanks. Bad text gives an invalid geometry.
//
// Ordering: invalid geometries first; then directional geometries by illumination angle and then
// aspecular angle ascending (15as-45 < ... < 15as80 < 45as-15 < 45as15 < ... < 45as110); then the
// diffuse ones by angle ("diffuse" < "d8" < "15_diffuse"); SPIN last.
class VEXA_DOMAIN_EXPORT Geometry
{
public:
    static constexpr const char *ANGLE_15_diffuse = "15_diffuse";
    static constexpr const char *ANGLE_15as15 = "15as15";
    static constexpr const char *ANGLE_15as45 = "15as45";
    static constexpr const char *ANGLE_15as80 = "15as80";
    static constexpr const char *ANGLE_15asN15 = "15as-15";
    static constexpr const char *ANGLE_15asN30 = "15as-30";
    static constexpr const char *ANGLE_15asN45 = "15as-45";
    static constexpr const char *ANGLE_45as110 = "45as110";
    static constexpr const char *ANGLE_45as15 = "45as15";
    static constexpr const char *ANGLE_45as25 = "45as25";
    static constexpr const char *ANGLE_45as45 = "45as45";
    static constexpr const char *ANGLE_45as75 = "45as75";
    static constexpr const char *ANGLE_45asN15 = "45as-15";
    static constexpr const char *ANGLE_d8 = "d8";
    static constexpr const char *ANGLE_diffuse = "diffuse";
    static constexpr const char *SPIN = "SPIN";

    enum class Kind { Invalid, Directional, Diffuse, Spin };

    Geometry() = default;
    explicit Geometry(const QString &text);
    explicit Geometry(const char *text);

    // The geometry of text; invalid and *ok false for bad text.
    static Geometry toGeometry(const QString &text, bool *ok = nullptr);
    // With throwOnError, bad text throws std::invalid_argument naming the text;
    // otherwise bad text gives an invalid geometry.
    static Geometry toGeometry(const QString &text, bool throwOnError);

    static QVector<Geometry> geometries(GeometrySet set);
    static QVector<Geometry> geometriesMultiAngleSimple();

    bool isValid() const { return m_kind != Kind::Invalid; }
    Kind kind() const { return m_kind; }
    bool isDiffuse() const { return m_kind == Kind::Diffuse; }
    bool isDirectional() const { return m_kind == Kind::Directional; }
    bool isSpin() const { return m_kind == Kind::Spin; }

    // The canonical text; empty for an invalid geometry.
    QString toString() const;
    // Directional and "<angle>_diffuse": the illumination angle; "d8" and SPIN: 8 (viewing
    // angle of the sphere); "diffuse" and invalid: 0.
    int getIlluminationAngle() const { return m_illumination; }
    // Directional: the aspecular angle (negative towards the illumination); otherwise 0.
    int getAspecular() const { return m_aspecular; }

    // -1, 0, 1 in the order described above.
    static int geometryCompare(const Geometry &a, const Geometry &b);

    bool operator==(const Geometry &o) const;
    bool operator!=(const Geometry &o) const { return !(*this == o); }
    bool operator<(const Geometry &o) const { return geometryCompare(*this, o) < 0; }

private:
    Kind m_kind = Kind::Invalid;
    int m_illumination = 0;
    int m_aspecular = 0;
    // Diffuse forms: 0 "diffuse", 1 "d8", 2 "<angle>_diffuse".
    int m_diffuseForm = 0;
};

VEXA_DOMAIN_EXPORT uint qHash(const Geometry &geometry, uint seed = 0);

} // namespace vexa

Q_DECLARE_METATYPE(vexa::Geometry)
