#pragma once

// Forward declarations and shared-pointer aliases of the domain classes.

#include <memory>

namespace vexa {

#define VEXA_DOMAIN_POINTER(Class)                                                                 \
    class Class;                                                                                   \
    using Class##Ptr = std::shared_ptr<Class>;                                                     \
    using Class##ConstPtr = std::shared_ptr<const Class>;

VEXA_DOMAIN_POINTER(AppearanceValues)
VEXA_DOMAIN_POINTER(Assortment)
VEXA_DOMAIN_POINTER(BaseObject)
VEXA_DOMAIN_POINTER(ColorStandardsLibrary)
VEXA_DOMAIN_POINTER(ColorValues)
VEXA_DOMAIN_POINTER(Colorant)
VEXA_DOMAIN_POINTER(ColorantRestriction)
VEXA_DOMAIN_POINTER(DatabaseConfiguration)
VEXA_DOMAIN_POINTER(DirEntry)
VEXA_DOMAIN_POINTER(Domain)
VEXA_DOMAIN_POINTER(Folder)
VEXA_DOMAIN_POINTER(Formula)
VEXA_DOMAIN_POINTER(FormulationSettings)
VEXA_DOMAIN_POINTER(GlobalDirEntry)
VEXA_DOMAIN_POINTER(Ingredient)
VEXA_DOMAIN_POINTER(LChValue)
VEXA_DOMAIN_POINTER(LabChValue)
VEXA_DOMAIN_POINTER(LabValue)
VEXA_DOMAIN_POINTER(Letdown)
VEXA_DOMAIN_POINTER(MainObject)
VEXA_DOMAIN_POINTER(MeasurementConfiguration)
VEXA_DOMAIN_POINTER(NamedObject)
VEXA_DOMAIN_POINTER(Property)
VEXA_DOMAIN_POINTER(PropertyLibrary)
VEXA_DOMAIN_POINTER(QAFilter)
VEXA_DOMAIN_POINTER(QAJob)
VEXA_DOMAIN_POINTER(QCJob)
VEXA_DOMAIN_POINTER(QCJobTemplate)
VEXA_DOMAIN_POINTER(RGBValue)
VEXA_DOMAIN_POINTER(Recipe)
VEXA_DOMAIN_POINTER(RecipeTrial)
VEXA_DOMAIN_POINTER(ReflectanceSpectrum)
VEXA_DOMAIN_POINTER(Reflectable)
VEXA_DOMAIN_POINTER(SpectralValues)
VEXA_DOMAIN_POINTER(Standard)
VEXA_DOMAIN_POINTER(Substrate)
VEXA_DOMAIN_POINTER(Tag)
VEXA_DOMAIN_POINTER(TagDefinition)
VEXA_DOMAIN_POINTER(TagValue)
VEXA_DOMAIN_POINTER(TextureImage)
VEXA_DOMAIN_POINTER(TextureScaleValues)
VEXA_DOMAIN_POINTER(TextureValues)
VEXA_DOMAIN_POINTER(Tolerance)
VEXA_DOMAIN_POINTER(ToleranceParameter)
VEXA_DOMAIN_POINTER(ToleranceSet)
VEXA_DOMAIN_POINTER(ToleranceSetParameters)
VEXA_DOMAIN_POINTER(ToleranceValue)
VEXA_DOMAIN_POINTER(Trial)
VEXA_DOMAIN_POINTER(User)
VEXA_DOMAIN_POINTER(XYZValue)

#undef VEXA_DOMAIN_POINTER

} // namespace vexa
