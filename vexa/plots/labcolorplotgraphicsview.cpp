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

QMarginsF LabColorPlotGraphicsView::fitMargins() const
{
    // Kept whether the bars show or not (a snapshot hides them), so the layout stays put.
    // Each bar is 1/100 of the visible size thick, centred on an edge of the viewport less
    // 10 pixels at the right and the bottom: keep its inner half and a pixel more free.
    const double halfX = viewport()->width() / 200.0 + 2.0;
    const double halfY = viewport()->height() / 200.0 + 2.0;
    return QMarginsF(halfX, halfY, 10.0 + halfX, 10.0 + halfY);
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
