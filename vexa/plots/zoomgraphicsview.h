#pragma once

#include <vexa/vexa_export.h>

#include <QGraphicsView>
#include <QMarginsF>

namespace vexa {

// A graphics view that shows a fixed scene rectangle (the fit rectangle) at zoom 1.0 and lets
// the user zoom in with the wheel (about the point under the cursor) and pan by dragging
// with the left button on an empty spot or with the middle button. One cannot zoom out below
// the initial view: a zoom that would end at ZoomFloor or less is refused. Panning works at
// every zoom, the initial one included: the view's centre may move up to one fit rectangle
// beyond each side of it, so a user who zoomed and panned can always bring any part back to
// the middle (resetZoom() shows the initial view again).
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
    // The scene point at the middle of the free area (see fitMargins()).
    QPointF centre() const { return m_centre; }
    // The part of the viewport the fit rectangle is fitted into: the viewport less fitMargins().
    QRectF freeArea() const;
    // Moves the view by a distance in viewport pixels, as a drag does (the scene moves with
    // the cursor).
    void panBy(const QPoint &viewDelta);
    // Where the centre may go: the fit rectangle grown by its own size on every side.
    QRectF panArea() const;

Q_SIGNALS:
    void sgZoomChanged(double zoom);
    // The mapping of scene to viewport changed (zoom, pan, resize).
    void sgTransformChanged();

protected:
    void wheelEvent(QWheelEvent *event) override;
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;

    // Pixels kept free at each side of the viewport when the fit rectangle is fitted (2 each);
    // a view that draws over its edges keeps its own drawings clear of the scene.
    virtual QMarginsF fitMargins() const;

private:
    void applyTransform(const QPointF &sceneCentre);

    QRectF m_fitRect;
    Qt::AspectRatioMode m_aspectMode = Qt::KeepAspectRatio;
    double m_zoom = 1.0;
    QPointF m_centre;
    bool m_panning = false;
    QPoint m_lastPanPosition;
};

} // namespace vexa
