#pragma once

#include <vexa/vexa_export.h>

#include <domain/geometry.h>

#include <QColor>
#include <QGraphicsItem>

#include <memory>

namespace vexa {

class Trial;

// The marker of one trial in a colour plot, placed for one geometry. It keeps its pixel size
// when the view zooms. The fill is the trial's own colour, the ring the colour of its verdict
// (grey without one). A selected marker is drawn larger with a dark halo; a disabled one
// (an inactive trial) pale.
class VEXA_EXPORT TrialGraphicsItem : public QGraphicsItem
{
public:
    enum class Shape {
        Circle, // a*b* plots
        Bar,    // L* plots: a short horizontal bar with a dot
    };
    static constexpr double Radius = 4.5;
    static constexpr double BarHalfWidth = 9.0;

    TrialGraphicsItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry, Shape shape = Shape::Circle,
                      QGraphicsItem *parent = nullptr);

    const std::shared_ptr<Trial> &trial() const { return m_trial; }
    const Geometry &geometry() const { return m_geometry; }
    Shape markerShape() const { return m_shape; }

    QColor fillColor() const { return m_fillColor; }
    void setFillColor(const QColor &color);
    QColor verdictColor() const { return m_verdictColor; }
    void setVerdictColor(const QColor &color);

    QRectF boundingRect() const override;
    QPainterPath shape() const override;
    void paint(QPainter *painter, const QStyleOptionGraphicsItem *option, QWidget *widget) override;

private:
    std::shared_ptr<Trial> m_trial;
    Geometry m_geometry;
    Shape m_shape;
    QColor m_fillColor = Qt::lightGray;
    QColor m_verdictColor = Qt::gray;
};

} // namespace vexa
