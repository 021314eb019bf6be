#include <vexa/plots/textitem.h>

#include <QFontMetricsF>
#include <QPainter>

namespace vexa {

namespace {
constexpr double kPadding = 2.0;
}

TextItem::TextItem(const QString &text, QGraphicsItem *parent)
    : QGraphicsItem(parent)
    , m_text(text)
{
    setFlag(ItemIgnoresTransformations);
}

void TextItem::setText(const QString &text)
{
    prepareGeometryChange();
    m_text = text;
}

void TextItem::setFont(const QFont &font)
{
    prepareGeometryChange();
    m_font = font;
}

void TextItem::setTextColor(const QColor &color)
{
    m_textColor = color;
    update();
}

void TextItem::setBackground(const QBrush &brush)
{
    m_background = brush;
    update();
}

void TextItem::setAlignment(Qt::Alignment alignment)
{
    prepareGeometryChange();
    m_alignment = alignment;
}

void TextItem::setOffset(double pixels)
{
    prepareGeometryChange();
    m_offset = pixels;
}

QRectF TextItem::textRect() const
{
    const QFontMetricsF metrics(m_font);
    const QSizeF size(metrics.horizontalAdvance(m_text), metrics.height());
    double x = m_offset;
    if (m_alignment & Qt::AlignRight)
        x = -size.width() - m_offset;
    else if (m_alignment & Qt::AlignHCenter)
        x = -size.width() / 2.0;
    double y = m_offset;
    if (m_alignment & Qt::AlignBottom)
        y = -size.height() - m_offset;
    else if (m_alignment & Qt::AlignVCenter)
        y = -size.height() / 2.0;
    return QRectF(QPointF(x, y), size);
}

QRectF TextItem::boundingRect() const
{
    return textRect().adjusted(-kPadding - 1, -kPadding - 1, kPadding + 1, kPadding + 1);
}

void TextItem::paint(QPainter *painter, const QStyleOptionGraphicsItem *, QWidget *)
{
    if (m_text.isEmpty())
        return;
    painter->save();
    const QRectF rect = textRect();
    if (m_background.style() != Qt::NoBrush) {
        painter->setRenderHint(QPainter::Antialiasing, true);
        painter->setPen(Qt::NoPen);
        painter->setBrush(m_background);
        painter->drawRoundedRect(rect.adjusted(-kPadding, -kPadding / 2, kPadding, kPadding / 2), 3, 3);
    }
    painter->setRenderHint(QPainter::TextAntialiasing, true);
    painter->setFont(m_font);
    painter->setPen(m_textColor);
    painter->drawText(rect, Qt::AlignCenter, m_text);
    painter->restore();
}

} // namespace vexa
