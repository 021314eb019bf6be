#pragma once

#include <vexa/vexa_export.h>

#include <QGraphicsPolygonItem>

namespace vexa {

// A polygon painted without antialiasing, so that adjoining polygons (the wedges of the
// tinted background) leave no light seams between them.
class VEXA_EXPORT NonAntiAliasedQGraphicsPolygonItem : public QGraphicsPolygonItem
{
public:
    using QGraphicsPolygonItem::QGraphicsPolygonItem;

    void paint(QPainter *painter, const QStyleOptionGraphicsItem *option, QWidget *widget) override;
};

} // namespace vexa
