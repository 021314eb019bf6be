#include <vexa/plots/nonantialiasedqgraphicspolygonitem.h>

#include <QPainter>

namespace vexa {

void NonAntiAliasedQGraphicsPolygonItem::paint(QPainter *painter, const QStyleOptionGraphicsItem *option,
                                               QWidget *widget)
{
    const bool antialiased = painter->testRenderHint(QPainter::Antialiasing);
    painter->setRenderHint(QPainter::Antialiasing, false);
    QGraphicsPolygonItem::paint(painter, option, widget);
    painter->setRenderHint(QPainter::Antialiasing, antialiased);
}

} // namespace vexa
