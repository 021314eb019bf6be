#include "illuminant.h"

#include <QVector>

namespace vexa {

namespace {
const char *const kNames[] = {"A", "C", "D50", "D55", "D65", "D75", "F2", "F7", "F11", "F12"};
}

Illuminant::Type Illuminant::fromValue(const QString &value, bool *ok)
{
    const QString t = value.trimmed();
    for (int i = 0; i < int(Unknown); ++i) {
        if (t.compare(QLatin1String(kNames[i]), Qt::CaseInsensitive) == 0) {
            if (ok)
                *ok = true;
            return Type(i);
        }
    }
    if (ok)
        *ok = false;
    return Unknown;
}

QString Illuminant::toString(Type type)
{
    return (type >= A && type < Unknown) ? QLatin1String(kNames[type]) : QString();
}

QVector<Illuminant::Type> Illuminant::all()
{
    QVector<Type> out;
    for (int i = 0; i < int(Unknown); ++i)
        out.append(Type(i));
    return out;
}

QStringList Illuminant::names()
{
    QStringList out;
    for (Type t : all())
        out.append(toString(t));
    return out;
}

} // namespace vexa
