#pragma once

#include <vexa/vexa_export.h>

#include <QBrush>
#include <QColor>
#include <QFont>
#include <QGraphicsItem>
#include <QString>

namespace vexa {

// A text label anchored at its position: the alignment says which side of the text touches
// the anchor (Qt::AlignHCenter | Qt::AlignTop puts the text centred below it). It keeps its
// pixel size when the view zooms. An optional background box sits behind the text.
class VEXA_EXPORT TextItem : public QGraphicsItem
{
public:
    explicit TextItem(const QString &text = QString(), QGraphicsItem *parent = nullptr);

    QString text() const { return m_text; }
    void setText(const QString &text);
    QFont font() const { return m_font; }
    void setFont(const QFont &font);
    QColor textColor() const { return m_textColor; }
    void setTextColor(const QColor &color);
    QBrush background() const { return m_background; }
    void setBackground(const QBrush &brush);
    Qt::Alignment alignment() const { return m_alignment; }
    void setAlignment(Qt::Alignment alignment);
    // Pixels between the anchor and the text.
    void setOffset(double pixels);

    QRectF boundingRect() const override;
    void paint(QPainter *painter, const QStyleOptionGraphicsItem *option, QWidget *widget) override;

private:
    QRectF textRect() const;

    QString m_text;
    QFont m_font;
    QColor m_textColor = Qt::black;
    QBrush m_background = Qt::NoBrush;
    Qt::Alignment m_alignment = Qt::AlignLeft | Qt::AlignTop;
    double m_offset = 0.0;
};

} // namespace vexa
