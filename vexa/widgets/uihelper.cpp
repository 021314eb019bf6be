#include "uihelper.h"

#include <colorimetry/colorconverter.h>

#include <domain/appearancevalues.h>
#include <domain/baseobject.h>
#include <domain/colorimetriccondition.h>
#include <domain/domainmetatypes.h>
#include <domain/labvalue.h>
#include <domain/namedobject.h>
#include <domain/reflectancespectrum.h>
#include <domain/rgbvalue.h>
#include <domain/xyzvalue.h>

#include <QByteArray>
#include <QDataStream>
#include <QHash>
#include <QImage>
#include <QMap>
#include <QMimeData>
#include <QPainter>
#include <QPixmap>
#include <QVariant>

#include <algorithm>

namespace vexa {

namespace {

QHash<QString, UIHelper::SortOrder> &sortOrders()
{
    static QHash<QString, UIHelper::SortOrder> orders;
    return orders;
}

const char *const kDisplayGeometry = "45as45";

} // namespace

QString UIHelper::itemModelMimeType()
{
    return QStringLiteral("application/x-qabstractitemmodeldatalist");
}

QColor UIHelper::swatchOutlineColor()
{
    return QColor(96, 96, 96);
}

QColor UIHelper::toColor(const RGBValue &rgb)
{
    return QColor(rgb.R(), rgb.G(), rgb.B(), 255);
}

void UIHelper::changeSaturation(QColor &color, double factor)
{
    int hue = 0;
    int saturation = 0;
    int value = 0;
    color.getHsv(&hue, &saturation, &value);
    const double scaled = saturation * factor;
    // Truncate first, then clamp; out-of-range products (and NaN) end at the limits.
    int changed = 0;
    if (scaled >= 255.0)
        changed = 255;
    else if (scaled > 0.0)
        changed = static_cast<int>(scaled);
    color.setHsv(hue, std::clamp(changed, 0, 255), value, 255);
}

QColor UIHelper::createColorWithChangedSaturation(const QColor &color, double factor)
{
    QColor changed = color;
    changeSaturation(changed, factor);
    return changed;
}

QIcon UIHelper::createRGBIcon(const RGBValue &rgb, const QSize &size)
{
    if (size.isEmpty())
        return QIcon();
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    {
        QPainter painter(&image);
        painter.setRenderHint(QPainter::Antialiasing);
        QPen pen(swatchOutlineColor());
        pen.setWidth(1);
        painter.setPen(pen);
        painter.setBrush(toColor(rgb));
        const QRectF rect(0.5, 0.5, size.width() - 1, size.height() - 1);
        painter.drawRoundedRect(rect, 30, 30, Qt::RelativeSize);
    }
    const QPixmap pixmap = QPixmap::fromImage(image);
    QIcon icon;
    for (QIcon::Mode mode : {QIcon::Normal, QIcon::Active, QIcon::Selected})
        icon.addPixmap(pixmap, mode);
    return icon;
}

QIcon UIHelper::createRGBIcon(const std::shared_ptr<RGBValue> &rgb, const QSize &size)
{
    return rgb ? createRGBIcon(*rgb, size) : QIcon();
}

bool UIHelper::didGetColorValueForDisplay(RGBValue &rgb, const std::shared_ptr<AppearanceValues> &values)
{
    if (!values || values->colorValues().empty())
        return false;
    const auto &colorValues = values->colorValues();
    std::shared_ptr<ColorValues> chosen = colorValues.front();
    if (colorValues.size() > 1) {
        const auto it = std::find_if(colorValues.begin(), colorValues.end(), [](const auto &candidate) {
            return candidate && candidate->physicalCondition().geometry() == QLatin1String(kDisplayGeometry);
        });
        if (it != colorValues.end())
            chosen = *it;
    }
    return didGetColorValueForDisplay(rgb, chosen);
}

bool UIHelper::didGetColorValueForDisplay(RGBValue &rgb, const std::shared_ptr<ColorValues> &values)
{
    if (!values)
        return false;
    if (values->typeName() == ReflectanceSpectrum::typeId()) {
        const auto *spectrum = dynamic_cast<const ReflectanceSpectrum *>(values.get());
        if (!spectrum)
            return false;
        const XYZValue xyz = ColorConverter::toXYZ(*spectrum, ColorimetricCondition::fromString(QStringLiteral("D65/2")));
        if (!xyz.isValid())
            return false;
        rgb = ColorConverter::toRGB(xyz);
        return true;
    }
    if (values->typeName() == LabValue::typeId()) {
        const auto *lab = dynamic_cast<const LabValue *>(values.get());
        if (!lab || !lab->isValid())
            return false;
        rgb = ColorConverter::toRGB(*lab);
        return true;
    }
    return false;
}

QString UIHelper::trialDisplayString(const NamedObject &object, const QString &format)
{
    if (format.isEmpty())
        return object.name();
    const Timestamp stamp = object.timeStamp();
    // One pass over the format: what a placeholder puts in (a trial named "Batch <Year>") is
    // never read again as a placeholder.
    const std::pair<QLatin1String, QString> placeholders[] = {
        {QLatin1String("<Name>"), object.name()},
        {QLatin1String("<Year>"), QString::number(stamp.year())},
        {QLatin1String("<Month>"), QString::number(stamp.month())},
        {QLatin1String("<Day>"), QString::number(stamp.day())},
        {QLatin1String("<Hour>"), QString::number(stamp.hour())},
        {QLatin1String("<Minute>"), QString::number(stamp.minute())},
        {QLatin1String("<Second>"), QString::number(stamp.second())},
    };
    QString text;
    text.reserve(format.size() + object.name().size());
    int position = 0;
    while (position < format.size()) {
        bool replaced = false;
        if (format.at(position) == QLatin1Char('<')) {
            for (const auto &placeholder : placeholders) {
                if (format.midRef(position, placeholder.first.size()) == placeholder.first) {
                    text += placeholder.second;
                    position += placeholder.first.size();
                    replaced = true;
                    break;
                }
            }
        }
        if (!replaced)
            text += format.at(position++);
    }
    return text;
}

QString UIHelper::trialDisplayString(const std::shared_ptr<NamedObject> &object, const QString &format)
{
    return object ? trialDisplayString(*object, format) : QString();
}

UIHelper::SortOrder UIHelper::objectSortOrder(const QString &type)
{
    return sortOrders().value(type, 0);
}

void UIHelper::setObjectSortOrder(const QString &type, SortOrder order)
{
    sortOrders().insert(type, order);
}

std::vector<QMap<int, QVariant>> UIHelper::itemDataFromMimeData(const QMimeData *mimeData)
{
    std::vector<QMap<int, QVariant>> cells;
    if (!mimeData || !mimeData->hasFormat(itemModelMimeType()))
        return cells;
    // The stream operators of the object pointers must be known to read the variants.
    registerDomainMetaTypes();
    QByteArray encoded = mimeData->data(itemModelMimeType());
    QDataStream stream(&encoded, QIODevice::ReadOnly);
    while (!stream.atEnd()) {
        int row = 0;
        int column = 0;
        QMap<int, QVariant> roles;
        stream >> row >> column >> roles;
        if (stream.status() != QDataStream::Ok)
            break;
        cells.push_back(std::move(roles));
    }
    return cells;
}

std::vector<std::shared_ptr<BaseObject>> UIHelper::baseObjectsFromMimeData(const QMimeData *mimeData)
{
    std::vector<std::shared_ptr<BaseObject>> objects;
    const std::vector<QMap<int, QVariant>> cells = itemDataFromMimeData(mimeData);
    const int objectType = QMetaType::type("std::shared_ptr<vexa::BaseObject>");
    if (objectType == QMetaType::UnknownType)
        return objects;
    for (const QMap<int, QVariant> &roles : cells) {
        QVariant value = roles.value(Qt::UserRole);
        if (!value.isValid() || !value.canConvert(objectType) || !value.convert(objectType))
            continue;
        if (auto object = value.value<std::shared_ptr<BaseObject>>())
            objects.push_back(std::move(object));
    }
    return objects;
}

} // namespace vexa
