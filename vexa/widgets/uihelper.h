#pragma once

#include <vexa/vexa_export.h>

#include <QColor>
#include <QCoreApplication>
#include <QIcon>
#include <QMap>
#include <QVariant>
#include <QSize>
#include <QString>

#include <memory>
#include <vector>

class QMimeData;

namespace vexa {

class AppearanceValues;
class BaseObject;
class ColorValues;
class NamedObject;
class RGBValue;

// Display helpers shared by the views: display colours and swatches, trial display
// names, the sort order of object types and the objects of an item-model drag.
// GUI thread only.
class VEXA_EXPORT UIHelper
{
    Q_DECLARE_TR_FUNCTIONS(vexa::UIHelper)
public:
    // The rank of an object type when lists are sorted by type (lower first).
    using SortOrder = int;

    // The MIME type of the standard item-model drag data.
    static QString itemModelMimeType();
    // The outline colour of colour swatches.
    static QColor swatchOutlineColor();

    // The colour of the value, opaque.
    static QColor toColor(const RGBValue &rgb);
    // Multiplies the HSV saturation by factor (truncated, clamped to 0..255); hue and
    // value are kept, alpha becomes 255.
    static void changeSaturation(QColor &color, double factor);
    static QColor createColorWithChangedSaturation(const QColor &color, double factor);

    // A rounded colour swatch of the given size; an empty icon for an empty size or a null value.
    static QIcon createRGBIcon(const RGBValue &rgb, const QSize &size);
    static QIcon createRGBIcon(const std::shared_ptr<RGBValue> &rgb, const QSize &size);

    // The display colour of a measurement: its 45as45 values when it has several sets,
    // else its first. False when there is nothing to show.
    static bool didGetColorValueForDisplay(RGBValue &rgb, const std::shared_ptr<AppearanceValues> &values);
    // The display colour of a reflectance spectrum (under D65/2) or a L*a*b* value; false
    // for other kinds and for values that cannot be converted.
    static bool didGetColorValueForDisplay(RGBValue &rgb, const std::shared_ptr<ColorValues> &values);

    // The name of a trial (or any named object) by a name format: "<Name>" becomes the
    // name; "<Year>", "<Month>", "<Day>", "<Hour>", "<Minute>", "<Second>" the parts of
    // its time stamp without leading zeros. An empty format gives the name; a null
    // object an empty text.
    static QString trialDisplayString(const NamedObject &object, const QString &format);
    static QString trialDisplayString(const std::shared_ptr<NamedObject> &object, const QString &format);

    // The sort order of a type name; 0 for types never set.
    static SortOrder objectSortOrder(const QString &type);
    static void setObjectSortOrder(const QString &type, SortOrder order);

    // The objects of an item-model drag ("application/x-qabstractitemmodeldatalist"),
    // taken from each cell's Qt::UserRole value, in stream order. Cells without an
    // object are skipped; null or foreign data give an empty list.
    static std::vector<std::shared_ptr<BaseObject>> baseObjectsFromMimeData(const QMimeData *mimeData);
    // The cells of an item-model drag, each as its map of role to value, in stream order;
    // empty for null or foreign data.
    static std::vector<QMap<int, QVariant>> itemDataFromMimeData(const QMimeData *mimeData);
};

} // namespace vexa
