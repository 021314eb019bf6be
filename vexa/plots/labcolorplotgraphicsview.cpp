#include <vexa/plots/labcolorplotgraphicsview.h>

#include <QPainter>

namespace vexa {

void LabColorPlotGraphicsView::setDirectionMarkersVisible(bool visible)
{
    m_directionMarkers = visible;
    viewport()->update();
}

QVector<QRectF> LabColorPlotGraphicsView::directionMarkerRects() const
{
    const QRect area = viewport()->rect().adjusted(0, 0, -10, -10);
    const QRectF visible = mapToScene(area).boundingRect();
    const double w = visible.width();
    const double h = visible.height();
    const QPointF c = visible.center();
    return {
        QRectF(visible.left() - w / 200.0, c.y() - h / 8.0, w / 100.0, h / 4.0),
        QRectF(visible.right() - w / 200.0, c.y() - h / 8.0, w / 100.0, h / 4.0),
        QRectF(c.x() - w / 8.0, visible.top() - h / 200.0, w / 4.0, h / 100.0),
        QRectF(c.x() - w / 8.0, visible.bottom() - h / 200.0, w / 4.0, h / 100.0),
    };
}

void LabColorPlotGraphicsView::drawForeground(QPainter *painter, const QRectF &rect)
{
    ZoomGraphicsView::drawForeground(painter, rect);
    if (!m_directionMarkers)
        return;
    const QVector<QRectF> bars = directionMarkerRects();
    const Qt::GlobalColor colours[] = {Qt::green, Qt::red, Qt::yellow, Qt::blue};
    painter->save();
    for (int i = 0; i < bars.size(); ++i)
        painter->fillRect(bars.at(i), colours[i]);
    painter->restore();
}

} // namespace vexa
