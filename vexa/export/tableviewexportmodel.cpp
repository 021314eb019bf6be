#include <vexa/export/tableviewexportmodel.h>

#include <QHeaderView>
#include <QTableView>

namespace vexa {

TableViewExportModel::TableViewExportModel(const QTableView *view, QObject *parent)
    : QAbstractTableModel(parent)
{
    if (!view || !view->model())
        return;
    m_source = view->model();
    const int rows = m_source->rowCount();
    m_rows.reserve(rows);
    for (int r = 0; r < rows; ++r) {
        if (!view->isRowHidden(r))
            m_rows.append(r);
    }
    const QHeaderView *header = view->horizontalHeader();
    const int columns = m_source->columnCount();
    for (int visual = 0; visual < columns; ++visual) {
        const int logical = header ? header->logicalIndex(visual) : visual;
        if (logical >= 0 && !view->isColumnHidden(logical))
            m_columns.append(logical);
    }
}

TableViewExportModel::~TableViewExportModel() = default;

int TableViewExportModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() || !m_source ? 0 : m_rows.size();
}

int TableViewExportModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() || !m_source ? 0 : m_columns.size();
}

QVariant TableViewExportModel::data(const QModelIndex &index, int role) const
{
    if (!m_source || !index.isValid() || index.model() != this || index.row() >= m_rows.size()
        || index.column() >= m_columns.size())
        return QVariant();
    return m_source->index(m_rows.at(index.row()), m_columns.at(index.column())).data(role);
}

QVariant TableViewExportModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (!m_source)
        return QVariant();
    if (orientation == Qt::Horizontal)
        return section >= 0 && section < m_columns.size()
            ? m_source->headerData(m_columns.at(section), orientation, role)
            : QVariant();
    return section >= 0 && section < m_rows.size() ? m_source->headerData(m_rows.at(section), orientation, role)
                                                   : QVariant();
}

int TableViewExportModel::rowOfViewRow(int viewRow) const
{
    return m_rows.indexOf(viewRow);
}

QList<QModelIndex> TableViewExportModel::mapSelection(const QList<QModelIndex> &viewIndexes) const
{
    QList<QModelIndex> mapped;
    QVector<bool> taken(m_rows.size(), false);
    for (const QModelIndex &viewIndex : viewIndexes) {
        if (!viewIndex.isValid() || viewIndex.model() != m_source)
            continue;
        const int row = rowOfViewRow(viewIndex.row());
        if (row < 0 || taken.at(row))
            continue;
        taken[row] = true;
        mapped << index(row, 0);
    }
    return mapped;
}

} // namespace vexa
