#include <vexa/plots/zoomgraphicsview.h>

#include <QGraphicsItem>
#include <QMouseEvent>
#include <QWheelEvent>

#include <algorithm>
#include <cmath>

namespace vexa {

ZoomGraphicsView::ZoomGraphicsView(QWidget *parent)
    : ZoomGraphicsView(nullptr, parent)
{
}

ZoomGraphicsView::ZoomGraphicsView(QGraphicsScene *scene, QWidget *parent)
    : QGraphicsView(scene, parent)
{
    setTransformationAnchor(QGraphicsView::NoAnchor);
    setResizeAnchor(QGraphicsView::NoAnchor);
    setViewportUpdateMode(QGraphicsView::BoundingRectViewportUpdate);
    setDragMode(QGraphicsView::NoDrag);
    setFrameShape(QFrame::NoFrame);
    // Navigation is by wheel and drag; scroll bars appearing on zoom would shift the view.
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
}

ZoomGraphicsView::~ZoomGraphicsView() = default;

void ZoomGraphicsView::setFitRect(const QRectF &rect, Qt::AspectRatioMode mode)
{
    m_fitRect = rect;
    m_aspectMode = mode;
    m_zoom = 1.0;
    setSceneRect(panArea());
    applyTransform(rect.center());
}

QRectF ZoomGraphicsView::panArea() const
{
    return m_fitRect.adjusted(-m_fitRect.width(), -m_fitRect.height(), m_fitRect.width(), m_fitRect.height());
}

QMarginsF ZoomGraphicsView::fitMargins() const
{
    return QMarginsF(2, 2, 2, 2);
}

QRectF ZoomGraphicsView::freeArea() const
{
    return QRectF(viewport()->rect()).marginsRemoved(fitMargins());
}

void ZoomGraphicsView::panBy(const QPoint &viewDelta)
{
    if (!m_fitRect.isValid())
        return;
    const QTransform inverse = transform().inverted();
    const QPointF sceneDelta = inverse.map(QPointF(viewDelta)) - inverse.map(QPointF(0, 0));
    applyTransform(m_centre - sceneDelta);
}

void ZoomGraphicsView::applyTransform(const QPointF &sceneCentre)
{
    if (!m_fitRect.isValid())
        return;
    const QRectF area = panArea();
    m_centre = QPointF(std::clamp(sceneCentre.x(), area.left(), area.right()),
                       std::clamp(sceneCentre.y(), area.top(), area.bottom()));
    if (viewport()->width() <= 0 || viewport()->height() <= 0)
        return;
    const QRectF viewRect = freeArea();
    if (viewRect.width() <= 0 || viewRect.height() <= 0)
        return;
    double sx = viewRect.width() / m_fitRect.width();
    double sy = viewRect.height() / m_fitRect.height();
    if (m_aspectMode != Qt::IgnoreAspectRatio)
        sx = sy = std::min(sx, sy);
    setTransform(QTransform::fromScale(sx * m_zoom, sy * m_zoom));
    // m_centre sits at the middle of the free area, which may lie off the viewport's middle.
    const QPointF offset = QRectF(viewport()->rect()).center() - viewRect.center();
    centerOn(m_centre + QPointF(offset.x() / (sx * m_zoom), offset.y() / (sy * m_zoom)));
    Q_EMIT sgTransformChanged();
}

bool ZoomGraphicsView::setZoom(double zoom)
{
    if (!(zoom > ZoomFloor) || !std::isfinite(zoom))
        return false;
    m_zoom = zoom;
    applyTransform(zoom == 1.0 ? m_fitRect.center() : m_centre);
    Q_EMIT sgZoomChanged(m_zoom);
    return true;
}

void ZoomGraphicsView::resetZoom()
{
    m_zoom = 1.0;
    applyTransform(m_fitRect.center());
    Q_EMIT sgZoomChanged(m_zoom);
}

bool ZoomGraphicsView::zoomBy(double factor, const QPointF &viewPosition)
{
    const double newZoom = factor * m_zoom;
    if (!(newZoom > ZoomFloor) || !std::isfinite(newZoom))
        return false;
    const QTransform inverse = transform().inverted();
    const QPointF anchor = m_centre + inverse.map(viewPosition - freeArea().center()) - inverse.map(QPointF(0, 0));
    m_zoom = newZoom;
    // The anchor stays under the cursor: the centre moves towards it by the scale change.
    const QPointF newCentre = anchor + (m_centre - anchor) / factor;
    applyTransform(newCentre);
    Q_EMIT sgZoomChanged(m_zoom);
    return true;
}

void ZoomGraphicsView::wheelEvent(QWheelEvent *event)
{
    const int delta = event->angleDelta().y();
    if (delta == 0) {
        event->ignore();
        return;
    }
    zoomBy(std::pow(ZoomBase, delta), event->position());
    event->accept();
}

void ZoomGraphicsView::mousePressEvent(QMouseEvent *event)
{
    const bool onItem = itemAt(event->pos()) && (itemAt(event->pos())->flags() & QGraphicsItem::ItemIsSelectable);
    if (event->button() == Qt::MiddleButton || (event->button() == Qt::LeftButton && !onItem)) {
        m_panning = true;
        m_lastPanPosition = event->pos();
        viewport()->setCursor(Qt::ClosedHandCursor);
        event->accept();
        return;
    }
    QGraphicsView::mousePressEvent(event);
}

void ZoomGraphicsView::mouseMoveEvent(QMouseEvent *event)
{
    if (m_panning) {
        const QPoint delta = event->pos() - m_lastPanPosition;
        m_lastPanPosition = event->pos();
        panBy(delta);
        event->accept();
        return;
    }
    QGraphicsView::mouseMoveEvent(event);
}

void ZoomGraphicsView::mouseReleaseEvent(QMouseEvent *event)
{
    if (m_panning) {
        m_panning = false;
        viewport()->unsetCursor();
        event->accept();
        return;
    }
    QGraphicsView::mouseReleaseEvent(event);
}

void ZoomGraphicsView::resizeEvent(QResizeEvent *event)
{
    QGraphicsView::resizeEvent(event);
    applyTransform(m_centre);
}

} // namespace vexa
