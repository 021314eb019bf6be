#include <vexa/plots/zoomgraphicsview.h>

#include <QGraphicsItem>
#include <QMouseEvent>
#include <QScrollBar>
#include <QWheelEvent>

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
    setSceneRect(rect);
    applyTransform(rect.center());
}

void ZoomGraphicsView::applyTransform(const QPointF &sceneCentre)
{
    if (!m_fitRect.isValid() || viewport()->width() <= 0 || viewport()->height() <= 0)
        return;
    const QRectF viewRect = viewport()->rect().adjusted(2, 2, -2, -2);
    double sx = viewRect.width() / m_fitRect.width();
    double sy = viewRect.height() / m_fitRect.height();
    if (m_aspectMode != Qt::IgnoreAspectRatio)
        sx = sy = std::min(sx, sy);
    setTransform(QTransform::fromScale(sx * m_zoom, sy * m_zoom));
    centerOn(sceneCentre);
}

bool ZoomGraphicsView::setZoom(double zoom)
{
    if (!(zoom > ZoomFloor) || !std::isfinite(zoom))
        return false;
    const QPointF centre = mapToScene(viewport()->rect().center());
    m_zoom = zoom;
    applyTransform(zoom == 1.0 ? m_fitRect.center() : centre);
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
    const QPointF anchor = mapToScene(viewPosition.toPoint());
    const QPointF centre = mapToScene(viewport()->rect().center());
    m_zoom = newZoom;
    // The anchor stays under the cursor: the centre moves towards it by the scale change.
    const QPointF newCentre = anchor + (centre - anchor) / factor;
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
        horizontalScrollBar()->setValue(horizontalScrollBar()->value() - delta.x());
        verticalScrollBar()->setValue(verticalScrollBar()->value() - delta.y());
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
    const QPointF centre = m_zoom == 1.0 ? m_fitRect.center() : mapToScene(viewport()->rect().center());
    QGraphicsView::resizeEvent(event);
    applyTransform(centre);
}

} // namespace vexa
