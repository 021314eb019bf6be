#pragma once

// A small table model for the export tests: headers and cells given as lists, each cell
// with its display text and optionally a background, an export value and a number format.

#include <QAbstractTableModel>
#include <QColor>
#include <QStringList>
#include <QVariant>
#include <QVector>

class FixtureTableModel : public QAbstractTableModel
{
public:
    struct Cell
    {
        QString display;
        QVariant background;
        QVariant exportValue;
        QVariant numberFormat;
    };

    FixtureTableModel(QStringList headers, QVector<QVector<Cell>> rows)
        : m_headers(std::move(headers))
        , m_rows(std::move(rows))
    {
    }

    // Rows of plain texts.
    static FixtureTableModel *fromTexts(const QStringList &headers, const QVector<QStringList> &texts)
    {
        QVector<QVector<Cell>> rows;
        for (const QStringList &line : texts) {
            QVector<Cell> row;
            for (const QString &text : line)
                row.append(Cell{text, QVariant(), QVariant(), QVariant()});
            rows.append(row);
        }
        return new FixtureTableModel(headers, rows);
    }

    int rowCount(const QModelIndex &parent = QModelIndex()) const override
    {
        return parent.isValid() ? 0 : m_rows.size();
    }
    int columnCount(const QModelIndex &parent = QModelIndex()) const override
    {
        return parent.isValid() ? 0 : m_headers.size();
    }
    QVariant data(const QModelIndex &index, int role) const override
    {
        if (!index.isValid() || index.row() >= m_rows.size() || index.column() >= m_rows[index.row()].size())
            return QVariant();
        const Cell &cell = m_rows[index.row()][index.column()];
        switch (role) {
        case Qt::DisplayRole: return cell.display;
        case Qt::BackgroundRole: return cell.background;
        case Qt::UserRole + 20: return cell.exportValue;
        case Qt::UserRole + 21: return cell.numberFormat;
        default: return QVariant();
        }
    }
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override
    {
        if (orientation == Qt::Horizontal && role == Qt::DisplayRole && section >= 0 && section < m_headers.size())
            return m_headers[section];
        return QAbstractTableModel::headerData(section, orientation, role);
    }

private:
    QStringList m_headers;
    QVector<QVector<Cell>> m_rows;
};
