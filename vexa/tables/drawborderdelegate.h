#pragma once

#include <vexa/vexa_export.h>

#include <QStyledItemDelegate>

class QTableView;

namespace vexa {

// Paints the cells of a colour table with thin grid lines and shows the selected rows by
// a frame around the whole row instead of a fill, so that verdict colours stay visible
// on selected rows.
class VEXA_EXPORT DrawBorderDelegate : public QStyledItemDelegate
{
    Q_OBJECT
public:
    DrawBorderDelegate(QTableView *view, QObject *parent = nullptr);

    void paint(QPainter *painter, const QStyleOptionViewItem &option, const QModelIndex &index) const override;

    static QColor gridColor();
    static QColor selectionFrameColor();

private:
    QTableView *m_view; // Not owned.
};

} // namespace vexa
