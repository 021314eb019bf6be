#include <vexa/tables/drawborderdelegate.h>

#include <QHeaderView>
#include <QPainter>
#include <QTableView>

namespace vexa {

DrawBorderDelegate::DrawBorderDelegate(QTableView *view, QObject *parent)
    : QStyledItemDelegate(parent)
    , m_view(view)
{
}

QColor DrawBorderDelegate::gridColor()
{
    return QColor(0xd0, 0xd4, 0xda);
}

QColor DrawBorderDelegate::selectionFrameColor()
{
    return QColor(0x1f, 0x5f, 0xbf);
}

void DrawBorderDelegate::paint(QPainter *painter, const QStyleOptionViewItem &option, const QModelIndex &index) const
{
    QStyleOptionViewItem cell(option);
    const bool selected = cell.state & QStyle::State_Selected;
    cell.state &= ~QStyle::State_Selected;
    cell.state &= ~QStyle::State_HasFocus;

    const QVariant background = index.data(Qt::BackgroundRole);
    painter->save();
    if (selected && !background.isValid())
        painter->fillRect(cell.rect, option.palette.color(QPalette::Highlight).lighter(185));
    painter->restore();

    QStyledItemDelegate::paint(painter, cell, index);

    painter->save();
    painter->setPen(QPen(gridColor(), 1));
    const QRect r = cell.rect;
    painter->drawLine(r.bottomLeft(), r.bottomRight());
    painter->drawLine(r.topRight(), r.bottomRight());
    if (selected) {
        QPen frame(selectionFrameColor(), 2);
        painter->setPen(frame);
        const QRect inner = r.adjusted(0, 1, 0, -1);
        painter->drawLine(inner.topLeft(), inner.topRight());
        painter->drawLine(inner.bottomLeft(), inner.bottomRight());
        const int column = m_view ? m_view->horizontalHeader()->visualIndex(index.column()) : index.column();
        const int lastColumn = index.model() ? index.model()->columnCount(index.parent()) - 1 : column;
        if (column == 0)
            painter->drawLine(inner.topLeft() + QPoint(1, 0), inner.bottomLeft() + QPoint(1, 0));
        if (column == lastColumn)
            painter->drawLine(inner.topRight(), inner.bottomRight());
    }
    painter->restore();
}

} // namespace vexa
