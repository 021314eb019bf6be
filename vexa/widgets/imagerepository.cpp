#include "imagerepository.h"

#include <domain/assortment.h>
#include <domain/baseobject.h>
#include <domain/colorant.h>
#include <domain/colorstandardslibrary.h>
#include <domain/databaseconfiguration.h>
#include <domain/domain.h>
#include <domain/folder.h>
#include <domain/formula.h>
#include <domain/letdown.h>
#include <domain/measurementconfiguration.h>
#include <domain/property.h>
#include <domain/propertylibrary.h>
#include <domain/qafilter.h>
#include <domain/qajob.h>
#include <domain/qcjob.h>
#include <domain/qcjobtemplate.h>
#include <domain/recipe.h>
#include <domain/reflectancespectrum.h>
#include <domain/standard.h>
#include <domain/substrate.h>
#include <domain/tag.h>
#include <domain/tagdefinition.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>
#include <domain/user.h>

#include <QImage>
#include <QPixmap>

namespace vexa {

ImageRepository &ImageRepository::instance()
{
    static ImageRepository repository;
    return repository;
}

ImageRepository::ImageRepository()
{
    // A set flag marks images drawn light on dark: they are inverted for light backgrounds.
    registerTypeIcon(Assortment::typeId(), QStringLiteral(":/Images/Assortment_16x16.png"), true);
    registerTypeIcon(Colorant::typeId(), QStringLiteral(":/Images/Colorant_16x16.png"), true);
    registerTypeIcon(Domain::typeId(), QStringLiteral(":/Images/Domain_16x16.png"), true);
    registerTypeIcon(Folder::typeId(), QStringLiteral(":/Images/Images/L2_FileM_Icon_Folder_01.png"), false);
    registerTypeIcon(Formula::typeId(), QStringLiteral(":/Images/Formula_16x16.png"), false);
    registerTypeIcon(Letdown::typeId(), QStringLiteral(":/Images/Letdown_16x16.png"), true);
    registerTypeIcon(Recipe::typeId(), QStringLiteral(":/Images/Images/L2_SC_Icon_Formulated_01.png"), false);
    registerTypeIcon(ReflectanceSpectrum::typeId(), QStringLiteral(":/Images/ReflectanceSpectrum_16x16.png"), false);
    registerTypeIcon(Standard::typeId(), QStringLiteral(":/Images/Images/HeaderIcon-StandardBuilder.png"), false);
    registerTypeIcon(Substrate::typeId(), QStringLiteral(":/Images/Paper_16x16.png"), false);
    registerTypeIcon(ToleranceSet::typeId(), QStringLiteral(":/Images/Images/COM_ICN_STD_TOL_30px_SELECTED.png"), false);
    registerTypeIcon(User::typeId(), QStringLiteral(":/Images/User_16x16.png"), true);
    registerTypeIcon(DatabaseConfiguration::typeId(), QStringLiteral(":/Images/DatabaseConfiguration_16x16.png"), false);
    registerTypeIcon(QCJobTemplate::typeId(), QStringLiteral(":/Images/Images/Icon-QCTemplate.png"), false);
    registerTypeIcon(ColorStandardsLibrary::typeId(), QStringLiteral(":/Images/Images/Color_Libraries_button.png"), false);
    registerTypeIcon(Property::typeId(), QStringLiteral(":/Images/Images/HeaderIcon-TagBuilder.png"), false);
    registerTypeIcon(PropertyLibrary::typeId(), QStringLiteral(":/Images/Images/Icon-Library.png"), false);
    registerTypeIcon(TagDefinition::typeId(), QStringLiteral(":/Images/Images/HeaderIcon-TagBuilder.png"), false);
    registerTypeIcon(Tag::typeId(), QStringLiteral(":/Images/Images/HeaderIcon-TagBuilder.png"), false);
    registerTypeIcon(MeasurementConfiguration::typeId(), QStringLiteral(":/Images/Images/Icon-OptionsGear.png"), false);
    registerTypeIcon(QCJob::typeId(), QStringLiteral(":/Images/Images/HeaderIcon-AutoQC.png"), false);
    registerTypeIcon(QAJob::typeId(), QStringLiteral(":/Images/Images/HeaderIcon-AutoQA.png"), false);
    registerTypeIcon(QAFilter::typeId(), QStringLiteral(":/Images/Images/HeaderIcon-AutoQA.png"), false);
    registerTypeIcon(Trial::typeId(), QStringLiteral(":/Images/Images/Icon-Trial.png"), false);
}

void ImageRepository::registerTypeIcon(const QString &typeId, const QString &imagePath, bool inverted)
{
    const QPixmap pixmap(imagePath);
    const QIcon plain = pixmap.isNull() ? QIcon() : QIcon(pixmap);
    const QIcon negative = inversedIcon(imagePath);
    m_typeIcons.push_back(TypeIcon{typeId, imagePath, inverted});
    m_typeIconMaps[Light].insert(typeId, inverted ? negative : plain);
    m_typeIconMaps[Dark].insert(typeId, inverted ? plain : negative);
}

QIcon ImageRepository::iconForType(const QString &typeId, EBrightness brightness) const
{
    const int index = brightness == Dark ? Dark : Light;
    return m_typeIconMaps[static_cast<size_t>(index)].value(typeId);
}

QIcon ImageRepository::iconForObject(const std::shared_ptr<BaseObject> &object, EBrightness brightness) const
{
    return object ? iconForObject(*object, brightness) : QIcon();
}

QIcon ImageRepository::iconForObject(const BaseObject &object, EBrightness brightness) const
{
    return iconForType(object.typeName(), brightness);
}

QIcon ImageRepository::inversedIcon(const QString &path)
{
    QImage image(path);
    if (image.isNull())
        return QIcon();
    image = image.convertToFormat(QImage::Format_ARGB32);
    image.invertPixels(QImage::InvertRgb);
    return QIcon(QPixmap::fromImage(image));
}

QString ImageRepository::statusKey(Status status)
{
    switch (status) {
    case Status::Enable:
        return QStringLiteral("Enable");
    case Status::Active:
        return QStringLiteral("Active");
    case Status::Disabled:
        return QStringLiteral("Disabled");
    case Status::Rollover:
        return QStringLiteral("Rollover");
    }
    return QString();
}

void ImageRepository::registerAppIcon(const QString &appName, const QIcon &enableIcon, const QIcon &activeIcon,
                                      const QIcon &disabledIcon, const QIcon &rolloverIcon)
{
    QMap<QString, QIcon> icons;
    icons.insert(statusKey(Status::Enable), enableIcon);
    icons.insert(statusKey(Status::Active), activeIcon);
    icons.insert(statusKey(Status::Disabled), disabledIcon);
    icons.insert(statusKey(Status::Rollover), rolloverIcon);
    m_appIcons.insert(appName, icons);
}

QIcon ImageRepository::iconForApp(const QString &appName, Status status) const
{
    return m_appIcons.value(appName).value(statusKey(status));
}

} // namespace vexa
