// A minimal host: uses one class of each installed library it finds.
#include <utilities/applicationinfo.h>
#include <utilities/mathhelper.h>

#include <cstdio>

#ifdef HAVE_VEXA_DOMAIN
#include <domain/geometry.h>
#endif

int main()
{
    if (vexa::MathHelper::toDegree(vexa::MathHelper::toRadiant(90.0)) < 89.999)
        return 1;
#ifdef HAVE_VEXA_DOMAIN
    if (vexa::Geometry(QStringLiteral("45as15")).toString() != QStringLiteral("45as15"))
        return 2;
#endif
    std::printf("consumer linked against Vexa %s\n",
                vexa::ApplicationInfo::instance().version().toUtf8().constData());
    return 0;
}
