#pragma once

#include <vexa/vexa_export.h>

#include <QColor>
#include <QGraphicsItem>

namespace vexa {

// A two-ring marker (outer radius 5, inner radius 3 pixels) that keeps its size when the view
// zooms. The plots mark the standard with it; the inner ring shows whether it is enabled.
class VEXA_EXPORT CheckGraphicsItem : public QGraphicsItem
{
public:
    static constexpr double OuterRadius = 5.0;
    static constexpr double InnerRadius = 3.0;

    explicit CheckGraphicsItem(QGraphicsItem *parent = nullptr);

    void setOuterColor(const QColor &color);
    QColor outerColor() const { return m_outerColor; }
    void setInnerColors(const QColor &enabledColor, const QColor &disabledColor);
    // The colour the inner ring is painted in now.
    QColor innerColor() const { return isEnabled() ? m_innerEnabledColor : m_innerDisabledColor; }

    QRectF boundingRect() const override;
    void paint(QPainter *painter, const QStyleOptionGraphicsItem *option, QWidget *widget) override;

private:
    QColor m_outerColor = Qt::black;
    QColor m_innerEnabledColor = Qt::white;
    QColor m_innerDisabledColor = Qt::gray;
};

} // namespace vexa
