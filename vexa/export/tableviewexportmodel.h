#pragma once

#include <vexa/vexa_export.h>

#include <QAbstractTableModel>
#include <QPointer>
#include <QVector>

class QTableView;

namespace vexa {

// A table as its view shows it, for export and printing: the view's rows in their shown
// (sorted) order without hidden rows, and the shown columns in their visual order without
// hidden ones. Every role of a cell and of a header comes from the view's model; only the
// positions are mapped. The layout is taken when the model is made (an export reads it at once).
class VEXA_EXPORT TableViewExportModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    explicit TableViewExportModel(const QTableView *view, QObject *parent = nullptr);
    ~TableViewExportModel() override;

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;

    // The row of this model that shows the view model's row; -1 when it is hidden.
    int rowOfViewRow(int viewRow) const;
    // This model's indexes of the rows holding any of the view model's indexes (one per row).
    QList<QModelIndex> mapSelection(const QList<QModelIndex> &viewIndexes) const;

private:
    QPointer<QAbstractItemModel> m_source;
    QVector<int> m_rows;    // view model rows, in shown order
    QVector<int> m_columns; // view model columns, in visual order
};

} // namespace vexa
