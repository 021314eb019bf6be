#include "observer.h"

namespace vexa {

Observer::Type Observer::fromString(const QString &text, bool *ok)
{
    QString t = text.trimmed();
    if (t.endsWith(QChar(0x00b0)))
        t.chop(1);
    else if (t.endsWith(QLatin1String("deg"), Qt::CaseInsensitive))
        t.chop(3);
    t = t.trimmed();
    Type type = Unknown;
    if (t == QLatin1String("2"))
        type = Observer_2_Degree;
    else if (t == QLatin1String("10"))
        type = Observer_10_Degree;
    if (ok)
        *ok = type != Unknown;
    return type;
}

QString Observer::toString(Type type)
{
    switch (type) {
    case Observer_2_Degree: return QStringLiteral("2");
    case Observer_10_Degree: return QStringLiteral("10");
    case Unknown: break;
    }
    return QString();
}

QStringList Observer::names()
{
    return {toString(Observer_2_Degree), toString(Observer_10_Degree)};
}

} // namespace vexa
