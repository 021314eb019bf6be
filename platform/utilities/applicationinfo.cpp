#include "applicationinfo.h"

namespace vexa {

ApplicationInfo &ApplicationInfo::instance()
{
    static ApplicationInfo info;
    return info;
}

QString ApplicationInfo::version() const
{
    return QStringLiteral(VEXA_VERSION_STRING);
}

QString ApplicationInfo::name() const
{
    return QStringLiteral("Vexa");
}

QString ApplicationInfo::organization() const
{
    return QStringLiteral("Vexa");
}

} // namespace vexa
