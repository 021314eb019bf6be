#include <vexa/export/tableexcelexporter.h>

#include <vexa/export/xlsxdocument.h>
#include <vexa/widgets/verdictcolors.h>

#include <QAbstractTableModel>
#include <QColor>
#include <QSet>

namespace vexa {

namespace {

constexpr int kExportValueRole = Qt::UserRole + 20;
constexpr int kExportNumberFormatRole = Qt::UserRole + 21;

bool isFloatingPoint(const QVariant &value)
{
    return value.userType() == QMetaType::Double || value.userType() == QMetaType::Float;
}

bool isDateOrTime(const QVariant &value)
{
    const int type = value.userType();
    return type == QMetaType::QDateTime || type == QMetaType::QDate || type == QMetaType::QTime;
}

} // namespace

TableExcelExporter::TableExcelExporter(XlsxDocument &document, QObject *parent)
    : QObject(parent)
    , m_document(document)
{
}

TableExcelExporter::~TableExcelExporter() = default;

void TableExcelExporter::setTableModel(std::shared_ptr<QAbstractTableModel> model)
{
    m_model = std::move(model);
}

bool TableExcelExporter::exportToSelectedSheet(int &row, QList<QModelIndex> selection)
{
    if (!m_model)
        return false;
    QAbstractTableModel *model = m_model.get();
    if (row < 1)
        row = 1;
    const int columns = model->columnCount();
    const int rows = model->rowCount();

    for (int c = 0; c < columns; ++c) {
        QString header = model->headerData(c, Qt::Horizontal, Qt::DisplayRole).toString();
        header.replace(QLatin1Char('\n'), QLatin1Char(' '));
        m_document.write(row, c + 1, header, XlsxFormat());
    }
    ++row;

    QSet<int> selectedRows;
    for (const QModelIndex &index : qAsConst(selection)) {
        if (index.isValid() && index.model() == model)
            selectedRows.insert(index.row());
    }
    const bool filtered = !selection.isEmpty();

    for (int r = 0; r < rows; ++r) {
        if (filtered && !selectedRows.contains(r))
            continue;
        for (int c = 0; c < columns; ++c) {
            const QModelIndex index = model->index(r, c);
            XlsxFormat format;
            const QVariant background = model->data(index, Qt::BackgroundRole);
            const int verdict = VerdictColors::statusOfBackground(background);
            if (verdict != 0)
                format.setPatternBackgroundColor(VerdictColors::colorOfStatus(verdict));
            QVariant value = model->data(index, kExportValueRole);
            if (!value.isValid())
                value = model->data(index, Qt::DisplayRole);
            if (isFloatingPoint(value)) {
                QString numberFormat = model->data(index, kExportNumberFormatRole).toString();
                format.setNumberFormat(numberFormat.isEmpty() ? TableExcelExporter::defaultNumberFormat()
                                                              : numberFormat);
                m_document.write(row + r, c + 1, value.toDouble(), format);
            } else if (isDateOrTime(value)) {
                m_document.write(row + r, c + 1, value, format);
            } else {
                m_document.write(row + r, c + 1, value.isValid() ? QVariant(value.toString()) : QVariant(), format);
            }
        }
    }
    row += rows;
    return true;
}

} // namespace vexa
