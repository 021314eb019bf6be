#include "domainclasses.h"

#include "appearancevalues.h"
#include "assortment.h"
#include "classregistration.h"
#include "colorant.h"
#include "colorantrestriction.h"
#include "colorphysicalcondition.h"
#include "colorstandardslibrary.h"
#include "databaseconfiguration.h"
#include "direntry.h"
#include "domain.h"
#include "folder.h"
#include "formula.h"
#include "formulationsettings.h"
#include "globaldirentry.h"
#include "header.h"
#include "ingredient.h"
#include "instrumentinfo.h"
#include "labchvalue.h"
#include "labvalue.h"
#include "lchvalue.h"
#include "letdown.h"
#include "measurementconfiguration.h"
#include "parameterchoice.h"
#include "property.h"
#include "propertylibrary.h"
#include "qafilter.h"
#include "qajob.h"
#include "qcjob.h"
#include "qcjobtemplate.h"
#include "recipe.h"
#include "recipetrial.h"
#include "reflectancespectrum.h"
#include "rgbvalue.h"
#include "spectralvalues.h"
#include "standard.h"
#include "substrate.h"
#include "tag.h"
#include "tagdefinition.h"
#include "tagvalue.h"
#include "textureimage.h"
#include "texturephysicalcondition.h"
#include "texturescalevaluesdiffuse.h"
#include "texturescalevaluesdirectional.h"
#include "texturevalues.h"
#include "tolerance.h"
#include "toleranceparameter.h"
#include "toleranceset.h"
#include "tolerancesetparameters.h"
#include "tolerancevalue.h"
#include "trial.h"
#include "user.h"
#include "xyzvalue.h"

namespace vexa {

void registerDomainClasses(ClassRegistration &r)
{
    // Value objects.
    r.registerClass<Header>();
    r.registerClass<ColorPhysicalCondition>();
    r.registerClass<SpectralValues>();
    r.registerClass<ReflectanceSpectrum>();
    r.registerClass<LabValue>();
    r.registerClass<LChValue>();
    r.registerClass<LabChValue>();
    r.registerClass<XYZValue>();
    r.registerClass<RGBValue>();
    r.registerClass<TextureImage>();
    r.registerClass<TexturePhysicalCondition>();
    r.registerClass<TextureScaleValuesDiffuse>();
    r.registerClass<TextureScaleValuesDirectional>();
    r.registerClass<TextureValues>();
    r.registerClass<InstrumentInfo>();
    r.registerClass<ParameterChoice>();
    r.registerClass<ToleranceSetParameters>();
    r.registerClass<Ingredient>();
    r.registerClass<ColorantRestriction>();
    r.registerClass<FormulationSettings>();

    // Stored objects.
    r.registerClass<AppearanceValues>();
    r.registerClass<TagDefinition>();
    r.registerClass<TagValue>();
    r.registerClass<Assortment>();
    r.registerClass<ColorStandardsLibrary>();
    r.registerClass<Colorant>();
    r.registerClass<DatabaseConfiguration>();
    r.registerClass<DirEntry>();
    r.registerClass<Domain>();
    r.registerClass<Folder>();
    r.registerClass<Formula>();
    r.registerClass<GlobalDirEntry>();
    r.registerClass<Letdown>();
    r.registerClass<MeasurementConfiguration>();
    r.registerClass<Property>();
    r.registerClass<PropertyLibrary>();
    r.registerClass<QAFilter>();
    r.registerClass<QAJob>();
    r.registerClass<QCJob>();
    r.registerClass<QCJobTemplate>();
    r.registerClass<Recipe>();
    r.registerClass<RecipeTrial>();
    r.registerClass<Standard>();
    r.registerClass<Substrate>();
    r.registerClass<Tag>();
    r.registerClass<Tolerance>();
    r.registerClass<ToleranceParameter>();
    r.registerClass<ToleranceSet>();
    r.registerClass<ToleranceValue>();
    r.registerClass<Trial>();
    r.registerClass<User>();
}

} // namespace vexa
