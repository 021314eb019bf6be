// Verbs over the domain library: version, geometries, conditions, check.

#include "verbregistry.h"

#include <domain/baseobject.h>
#include <domain/colorimetriccondition.h>
#include <domain/geometry.h>
#include <domain/serialization.h>

#include <utilities/applicationinfo.h>

#include <QFile>
#include <QFileInfo>

using namespace vexa;

namespace {

bool usage(const QStringList &args, int count, const QString &verb, const QString &arguments, QTextStream &err)
{
    if (args.size() == count)
        return true;
    err << "Usage: vexa-tool " << (verb + QLatin1Char(' ') + arguments).trimmed() << "\n";
    return false;
}

int runVersion(const QStringList &args, QTextStream &out, QTextStream &err)
{
    if (!usage(args, 0, QStringLiteral("version"), QString(), err))
        return 2;
    out << "vexa-tool " << ApplicationInfo::instance().version() << " (stored object format "
        << Serialization::FormatVersion << ")\n";
    return 0;
}

QString kindName(const Geometry &g)
{
    switch (g.kind()) {
    case Geometry::Kind::Directional: return QStringLiteral("directional");
    case Geometry::Kind::Diffuse: return QStringLiteral("diffuse");
    case Geometry::Kind::Spin: return QStringLiteral("sphere, specular included");
    case Geometry::Kind::Invalid: break;
    }
    return QStringLiteral("invalid");
}

int runGeometries(const QStringList &args, QTextStream &out, QTextStream &err)
{
    if (!usage(args, 0, QStringLiteral("geometries"), QString(), err))
        return 2;
    out << QStringLiteral("geometry").leftJustified(12) << QStringLiteral("illumination").rightJustified(13)
        << QStringLiteral("aspecular").rightJustified(11) << "  kind\n";
    for (const Geometry &g : Geometry::geometries(GeometrySet::All)) {
        out << g.toString().leftJustified(12) << QString::number(g.getIlluminationAngle()).rightJustified(13)
            << (g.isDirectional() ? QString::number(g.getAspecular()) : QStringLiteral("-")).rightJustified(11) << "  "
            << kindName(g) << "\n";
    }
    return 0;
}

int runConditions(const QStringList &args, QTextStream &out, QTextStream &err)
{
    if (!usage(args, 0, QStringLiteral("conditions"), QString(), err))
        return 2;
    for (const ColorimetricCondition &c : ColorimetricCondition::availableConditions())
        out << c.toString() << "\n";
    return 0;
}

// Reads and validates a stored object file; writes nothing.
int runCheck(const QStringList &args, QTextStream &out, QTextStream &err)
{
    if (!usage(args, 1, QStringLiteral("check"), QStringLiteral("FILE"), err))
        return 2;
    const QString path = args.first();
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        err << path << ": cannot open: " << file.errorString() << "\n";
        return 1;
    }
    QString error;
    int format = 0;
    const auto object = Serialization::readAny(file.readAll(), &error, &format);
    if (!object) {
        err << path << ": broken: " << error << "\n";
        return 1;
    }
    out << path << ": OK, " << object->typeName();
    if (const auto stored = std::dynamic_pointer_cast<BaseObject>(object)) {
        out << " \"" << stored->header().name() << "\" (id " << stored->id() << ")";
        const auto references = stored->referencedObjects();
        if (!references.empty())
            out << ", " << references.size() << " reference(s)";
    }
    out << ", format " << format;
    if (format < Serialization::FormatVersion)
        out << " (older; saved again it becomes format " << Serialization::FormatVersion << ")";
    out << "\n";
    return 0;
}

const VerbRegistrar registrar{
    {QStringLiteral("version"), QString(), QStringLiteral("Show the version"), &runVersion},
    {QStringLiteral("geometries"), QString(), QStringLiteral("List the known geometries with their angles"), &runGeometries},
    {QStringLiteral("conditions"), QString(), QStringLiteral("List the colorimetric conditions"), &runConditions},
    {QStringLiteral("check"), QStringLiteral("FILE"), QStringLiteral("Validate a stored object file"), &runCheck},
};

} // namespace
