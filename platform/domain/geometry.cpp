#include "geometry.h"

#include <QRegularExpression>

#include <stdexcept>
#include <tuple>

namespace vexa {

Geometry::Geometry(const QString &text)
    : Geometry(toGeometry(text, static_cast<bool *>(nullptr)))
{
}

Geometry::Geometry(const char *text)
    : Geometry(QString::fromUtf8(text))
{
}

Geometry Geometry::toGeometry(const QString &text, bool *ok)
{
    static const QRegularExpression directional(QStringLiteral("^(\\d{1,3})as([-n]?)(\\d{1,3})$"),
                                                QRegularExpression::CaseInsensitiveOption);
    static const QRegularExpression sphere(QStringLiteral("^d[/:]?8$"), QRegularExpression::CaseInsensitiveOption);
    static const QRegularExpression angleDiffuse(QStringLiteral("^(\\d{1,3})[_ ]?diffuse$"),
                                                 QRegularExpression::CaseInsensitiveOption);
    const QString t = text.trimmed();
    Geometry g;
    if (const auto m = directional.match(t); m.hasMatch()) {
        const int illumination = m.captured(1).toInt();
        const int aspecular = m.captured(3).toInt() * (m.captured(2).isEmpty() ? 1 : -1);
        // The aspecular angle must point somewhere above the sample.
        if (illumination <= 90 && aspecular >= -illumination - 90 && aspecular <= 180 - illumination) {
            g.m_kind = Kind::Directional;
            g.m_illumination = illumination;
            g.m_aspecular = aspecular;
        }
    } else if (t.compare(QLatin1String("diffuse"), Qt::CaseInsensitive) == 0) {
        g.m_kind = Kind::Diffuse;
        g.m_diffuseForm = 0;
    } else if (sphere.match(t).hasMatch()) {
        g.m_kind = Kind::Diffuse;
        g.m_diffuseForm = 1;
        g.m_illumination = 8;
    } else if (const auto m = angleDiffuse.match(t); m.hasMatch()) {
        if (m.captured(1).toInt() <= 90) {
            g.m_kind = Kind::Diffuse;
            g.m_diffuseForm = 2;
            g.m_illumination = m.captured(1).toInt();
        }
    } else if (t.compare(QLatin1String("SPIN"), Qt::CaseInsensitive) == 0) {
        g.m_kind = Kind::Spin;
        g.m_illumination = 8;
    }
    if (ok)
        *ok = g.isValid();
    return g;
}

Geometry Geometry::toGeometry(const QString &text, bool throwOnError)
{
    bool ok = false;
    const Geometry g = toGeometry(text, &ok);
    if (!ok && throwOnError)
        throw std::invalid_argument(QStringLiteral("Unknown geometry \"%1\"").arg(text).toStdString());
    return g;
}

QVector<Geometry> Geometry::geometries(GeometrySet set)
{
    auto make = [](std::initializer_list<const char *> names) {
        QVector<Geometry> out;
        for (const char *n : names)
            out.append(Geometry(n));
        return out;
    };
    switch (set) {
    case GeometrySet::MultiAngleSimple:
        return make({ANGLE_45as15, ANGLE_45as45, ANGLE_45as110});
    case GeometrySet::MultiAngle:
        return make({ANGLE_45asN15, ANGLE_45as15, ANGLE_45as25, ANGLE_45as45, ANGLE_45as75, ANGLE_45as110});
    case GeometrySet::MultiAngle15:
        return make({ANGLE_15asN45, ANGLE_15asN30, ANGLE_15asN15, ANGLE_15as15, ANGLE_15as45, ANGLE_15as80});
    case GeometrySet::Color:
        return geometries(GeometrySet::MultiAngle15) + geometries(GeometrySet::MultiAngle);
    case GeometrySet::Texture:
        return make({ANGLE_15as15, ANGLE_15as45, ANGLE_45as15, ANGLE_15_diffuse});
    case GeometrySet::Sphere:
        return make({ANGLE_d8, SPIN});
    case GeometrySet::All:
        return geometries(GeometrySet::Color) + make({ANGLE_diffuse, ANGLE_d8, ANGLE_15_diffuse, SPIN});
    }
    return {};
}

QVector<Geometry> Geometry::geometriesMultiAngleSimple()
{
    return geometries(GeometrySet::MultiAngleSimple);
}

QString Geometry::toString() const
{
    switch (m_kind) {
    case Kind::Invalid:
        return QString();
    case Kind::Directional:
        return QStringLiteral("%1as%2").arg(m_illumination).arg(m_aspecular);
    case Kind::Diffuse:
        if (m_diffuseForm == 0)
            return QStringLiteral("diffuse");
        if (m_diffuseForm == 1)
            return QStringLiteral("d8");
        return QStringLiteral("%1_diffuse").arg(m_illumination);
    case Kind::Spin:
        return QStringLiteral("SPIN");
    }
    return QString();
}

int Geometry::geometryCompare(const Geometry &a, const Geometry &b)
{
    const auto key = [](const Geometry &g) {
        return std::make_tuple(int(g.m_kind), g.m_diffuseForm, g.m_illumination, g.m_aspecular);
    };
    const auto ka = key(a);
    const auto kb = key(b);
    return ka < kb ? -1 : (kb < ka ? 1 : 0);
}

bool Geometry::operator==(const Geometry &o) const
{
    return geometryCompare(*this, o) == 0;
}

uint qHash(const Geometry &geometry, uint seed)
{
    return qHash(geometry.toString(), seed);
}

} // namespace vexa
