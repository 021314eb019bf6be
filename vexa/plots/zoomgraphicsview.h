#pragma once

#include <vexa/vexa_export.h>

#include <QGraphicsView>

namespace vexa {

// A graphics view that shows a fixed scene rectangle (the fit rectangle) at zoom 1.0 and lets
// the user zoom in with the wheel (about the point under the cursor) and pan by dragging
// with the left button on an empty spot or with the middle button. One cannot zoom out below
// the initial view: a zoom that would end at ZoomFloor or less is refused.
class VEXA_EXPORT ZoomGraphicsView : public QGraphicsView
{
    Q_OBJECT
public:
    static constexpr double ZoomBase = 1.0015;
    static constexpr double ZoomFloor = 0.97;

    explicit ZoomGraphicsView(QWidget *parent = nullptr);
    explicit ZoomGraphicsView(QGraphicsScene *scene, QWidget *parent = nullptr);
    ~ZoomGraphicsView() override;

    // The rectangle shown at zoom 1.0; mode says whether its aspect ratio is kept.
    void setFitRect(const QRectF &rect, Qt::AspectRatioMode mode = Qt::KeepAspectRatio);
    QRectF fitRect() const { return m_fitRect; }

    double zoom() const { return m_zoom; }
    // Sets the zoom relative to the fitted view (values at or below ZoomFloor are refused).
    bool setZoom(double zoom);
    // Multiplies the zoom by factor keeping the scene point under viewPosition in place.
    // False, and nothing changes, when the result would be at or below ZoomFloor.
    bool zoomBy(double factor, const QPointF &viewPosition);
    // Shows the fit rectangle at zoom 1.0 again.
    void resetZoom();

Q_SIGNALS:
    void sgZoomChanged(double zoom);

protected:
    void wheelEvent(QWheelEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;

private:
    void applyTransform(const QPointF &sceneCentre);

    QRectF m_fitRect;
    Qt::AspectRatioMode m_aspectMode = Qt::KeepAspectRatio;
    double m_zoom = 1.0;
    bool m_panning = false;
    QPoint m_lastPanPosition;
};

} // namespace vexa
