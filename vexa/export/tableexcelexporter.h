#pragma once

#include <vexa/vexa_export.h>

#include <QList>
#include <QModelIndex>
#include <QObject>

#include <memory>

class QAbstractTableModel;

namespace vexa {

class XlsxDocument;

// Writes a table model into the current sheet of a workbook: the header line, then the
// rows, numbers as numbers with the cells' number formats, dates as dates, verdict cells
// filled with their verdict colour. Several tables can be stacked on one sheet.
class VEXA_EXPORT TableExcelExporter : public QObject
{
    Q_OBJECT
public:
    // The number format of numbers whose cell names none.
    static QString defaultNumberFormat() { return QStringLiteral("##.####"); }

    // The document must outlive the exporter; its owner saves it.
    explicit TableExcelExporter(XlsxDocument &document, QObject *parent = nullptr);
    ~TableExcelExporter() override;

    void setTableModel(std::shared_ptr<QAbstractTableModel> model);
    std::shared_ptr<QAbstractTableModel> tableModel() const { return m_model; }

    // Writes the table starting at sheet line row (1 when below 1) and advances row past
    // it. With a selection only the rows holding a selected index are written, each on the
    // line of its model row (the lines of skipped rows stay empty). False, and nothing
    // written, without a model.
    bool exportToSelectedSheet(int &row, QList<QModelIndex> selection);

private:
    XlsxDocument &m_document;
    std::shared_ptr<QAbstractTableModel> m_model;
};

} // namespace vexa
