#pragma once

#include <vexa/vexa_export.h>

#include <QIcon>
#include <QMap>
#include <QString>

#include <array>
#include <memory>
#include <vector>

namespace vexa {

class BaseObject;

// The icons of the object types (one variant for light and one for dark
// backgrounds) and the state icons of the applications. One instance per process,
// created on first use (after the QGuiApplication); GUI thread only.
class VEXA_EXPORT ImageRepository
{
public:
    // The brightness of the background an icon is shown on.
    enum EBrightness {
        Light = 0,
        Dark = 1,
    };

    // The state of an application's icon.
    enum class Status {
        Enable,
        Active,
        Disabled,
        Rollover,
    };

    // One registered type icon: the resource image and whether it is drawn for dark
    // backgrounds (then the light variant is the inverted image).
    struct TypeIcon
    {
        QString typeId;
        QString imagePath;
        bool inverted;
    };

    static ImageRepository &instance();

    ImageRepository(const ImageRepository &) = delete;
    ImageRepository &operator=(const ImageRepository &) = delete;

    // The icon of a type id for that background; an empty icon for unknown types.
    QIcon iconForType(const QString &typeId, EBrightness brightness) const;
    // The icon of the object's type; an empty icon for a null object.
    QIcon iconForObject(const std::shared_ptr<BaseObject> &object, EBrightness brightness) const;
    QIcon iconForObject(const BaseObject &object, EBrightness brightness) const;
    // The type icons in registration order.
    const std::vector<TypeIcon> &registeredTypeIcons() const { return m_typeIcons; }

    // An icon of the image file with its colours inverted (alpha kept); empty when the
    // file cannot be read.
    static QIcon inversedIcon(const QString &path);

    // Stores the four state icons of an application (replacing earlier ones).
    void registerAppIcon(const QString &appName, const QIcon &enableIcon, const QIcon &activeIcon,
                         const QIcon &disabledIcon, const QIcon &rolloverIcon);
    // The icon of that state; an empty icon for an unknown application.
    QIcon iconForApp(const QString &appName, Status status) const;
    // The key of a state in the application icon map: "Enable", "Active", "Disabled", "Rollover".
    static QString statusKey(Status status);

private:
    ImageRepository();
    void registerTypeIcon(const QString &typeId, const QString &imagePath, bool inverted);

    std::vector<TypeIcon> m_typeIcons;
    std::array<QMap<QString, QIcon>, 2> m_typeIconMaps;
    QMap<QString, QMap<QString, QIcon>> m_appIcons;
};

} // namespace vexa
