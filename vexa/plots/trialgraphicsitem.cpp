#include <vexa/plots/trialgraphicsitem.h>

#include <domain/trial.h>

#include <QPainter>
#include <QPen>

namespace vexa {

TrialGraphicsItem::TrialGraphicsItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry, Shape shape,
                                     QGraphicsItem *parent)
    : QGraphicsItem(parent)
    , m_trial(trial)
    , m_geometry(geometry)
    , m_shape(shape)
{
    setFlag(ItemIgnoresTransformations);
    setFlag(ItemIsSelectable);
    setAcceptHoverEvents(true);
    if (m_trial)
        setToolTip(m_trial->name());
}

void TrialGraphicsItem::setFillColor(const QColor &color)
{
    m_fillColor = color;
    update();
}

void TrialGraphicsItem::setVerdictColor(const QColor &color)
{
    m_verdictColor = color;
    update();
}

QRectF TrialGraphicsItem::boundingRect() const
{
    // Room for the selected marker's halo (radius + 1.5 + 3.5, and half its pen).
    const double r = Radius + 6.0;
    const double w = m_shape == Shape::Bar ? BarHalfWidth + 2.0 : r;
    return QRectF(-w, -r, 2 * w, 2 * r);
}

QPainterPath TrialGraphicsItem::shape() const
{
    QPainterPath path;
    path.addRect(boundingRect());
    return path;
}

void TrialGraphicsItem::paint(QPainter *painter, const QStyleOptionGraphicsItem *, QWidget *)
{
    painter->save();
    painter->setRenderHint(QPainter::Antialiasing, true);
    const bool selected = isSelected();
    const bool enabled = isEnabled();
    QColor fill = m_fillColor;
    QColor ring = m_verdictColor;
    if (!enabled) {
        fill.setAlpha(90);
        ring = QColor(150, 150, 150, 140);
    }
    const double r = selected ? Radius + 1.5 : Radius;
    if (m_shape == Shape::Bar) {
        QPen bar(enabled ? QColor(60, 60, 60) : QColor(160, 160, 160), selected ? 2.5 : 1.5);
        bar.setCosmetic(true);
        painter->setPen(bar);
        painter->drawLine(QPointF(-BarHalfWidth, 0), QPointF(BarHalfWidth, 0));
    }
    if (selected) {
        QPen halo(QColor(20, 20, 20), 1.5);
        halo.setCosmetic(true);
        painter->setPen(halo);
        painter->setBrush(Qt::NoBrush);
        painter->drawEllipse(QPointF(0, 0), r + 3.5, r + 3.5);
    }
    // A dark edge and a light one around the verdict ring: the marker stands out on a light
    // tint and on a dark one, whatever the trial's own colour.
    if (enabled) {
        QPen light(QColor(255, 255, 255, 210), 1.0);
        light.setCosmetic(true);
        painter->setPen(light);
        painter->setBrush(Qt::NoBrush);
        painter->drawEllipse(QPointF(0, 0), r + 2.0, r + 2.0);
        QPen dark(QColor(25, 25, 25), 1.0);
        dark.setCosmetic(true);
        painter->setPen(dark);
        painter->drawEllipse(QPointF(0, 0), r + 1.0, r + 1.0);
    }
    QPen pen(ring, 2.0);
    pen.setCosmetic(true);
    painter->setPen(pen);
    painter->setBrush(fill);
    painter->drawEllipse(QPointF(0, 0), r, r);
    painter->restore();
}

} // namespace vexa
