#pragma once

#include <vexa/plots/zoomgraphicsview.h>

namespace vexa {

// The view of the a*b* plots: on top of the scene it marks the four directions of the plane
// at the middle of each edge of what is visible: -a* green (left), +a* red (right), +b*
// yellow (top), -b* blue (bottom). At the initial zoom the scene (tick labels included) is
// fitted into the part of the viewport the bars leave free, so no bar covers a label.
class VEXA_EXPORT LabColorPlotGraphicsView : public ZoomGraphicsView
{
    Q_OBJECT
public:
    using ZoomGraphicsView::ZoomGraphicsView;

    void setDirectionMarkersVisible(bool visible);
    bool directionMarkersVisible() const { return m_directionMarkers; }

    // The four bars in scene coordinates for the visible area: left, right, top, bottom.
    QVector<QRectF> directionMarkerRects() const;

protected:
    void drawForeground(QPainter *painter, const QRectF &rect) override;
    QMarginsF fitMargins() const override;

private:
    bool m_directionMarkers = true;
};

} // namespace vexa
