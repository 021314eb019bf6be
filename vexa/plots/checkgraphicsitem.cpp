#include <vexa/plots/checkgraphicsitem.h>

#include <QPainter>
#include <QPen>

namespace vexa {

CheckGraphicsItem::CheckGraphicsItem(QGraphicsItem *parent)
    : QGraphicsItem(parent)
{
    setFlag(ItemIgnoresTransformations);
}

void CheckGraphicsItem::setOuterColor(const QColor &color)
{
    m_outerColor = color;
    update();
}

void CheckGraphicsItem::setInnerColors(const QColor &enabledColor, const QColor &disabledColor)
{
    m_innerEnabledColor = enabledColor;
    m_innerDisabledColor = disabledColor;
    update();
}

QRectF CheckGraphicsItem::boundingRect() const
{
    const double r = OuterRadius + 1.5;
    return QRectF(-r, -r, 2 * r, 2 * r);
}

void CheckGraphicsItem::paint(QPainter *painter, const QStyleOptionGraphicsItem *, QWidget *)
{
    painter->save();
    painter->setRenderHint(QPainter::Antialiasing, true);
    painter->setBrush(Qt::NoBrush);
    QPen outer(m_outerColor, 2);
    outer.setCosmetic(true);
    painter->setPen(outer);
    painter->drawEllipse(QPointF(0, 0), OuterRadius, OuterRadius);
    QPen inner(innerColor(), 2);
    inner.setCosmetic(true);
    painter->setPen(inner);
    painter->drawEllipse(QPointF(0, 0), InnerRadius, InnerRadius);
    painter->restore();
}

} // namespace vexa
