// A minimal host: uses one class of each installed library it finds.
#include <utilities/applicationinfo.h>
#include <utilities/mathhelper.h>

#include <cstdio>

#ifdef HAVE_VEXA_DOMAIN
#include <domain/geometry.h>
#endif
#ifdef HAVE_VEXA_SETTINGS
#include <settings/generalsettings.h>
#endif
#ifdef HAVE_VEXA_COLORIMETRY
#include <colorimetry/colordifferencecalculator.h>
#include <domain/labvalue.h>
#endif
#ifdef HAVE_VEXA_TOLERANCES
#include <tolerances/tolerancefactory.h>
#endif
#ifdef HAVE_VEXA_CONTEXT
#include <context/commanddispatcher.h>
#endif
#ifdef HAVE_VEXA_COMPONENTS
#include <vexa/models/trialselectionmodel.h>
#endif

int main()
{
    if (vexa::MathHelper::toDegree(vexa::MathHelper::toRadiant(90.0)) < 89.999)
        return 1;
#ifdef HAVE_VEXA_DOMAIN
    if (vexa::Geometry(QStringLiteral("45as15")).toString() != QStringLiteral("45as15"))
        return 2;
#endif
#ifdef HAVE_VEXA_SETTINGS
    if (GeneralSettings().exportDelimiter().isEmpty())
        return 3;
#endif
#ifdef HAVE_VEXA_COLORIMETRY
    const double de = vexa::ColorDifferenceCalculator::Default_DE(QStringLiteral("CIE2000"),
        vexa::LabValue(50, 2.6772, -79.7751), vexa::LabValue(50, 0, -82.7485), 1, 1, 1);
    if (de < 2.042 || de > 2.043)
        return 4;
#endif
#ifdef HAVE_VEXA_TOLERANCES
    if (vexa::ToleranceFactory::toleranceFactory()->allToleranceTypes().isEmpty())
        return 5;
#endif
#ifdef HAVE_VEXA_CONTEXT
    if (vexa::CommandDispatcher::standardizedDispatcherId("localhost:8765").empty())
        return 6;
#endif
#ifdef HAVE_VEXA_COMPONENTS
    vexa::TrialSelectionModel selection;
    if (selection.selectedColorGeometry().toString() != QStringLiteral("45as45"))
        return 7;
#endif
    std::printf("consumer linked against Vexa %s\n",
                vexa::ApplicationInfo::instance().version().toUtf8().constData());
    return 0;
}
