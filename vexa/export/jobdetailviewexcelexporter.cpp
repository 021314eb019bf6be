#include <vexa/export/jobdetailviewexcelexporter.h>

#include <vexa/export/savefileprompt.h>
#include <vexa/export/tableexcelexporter.h>
#include <vexa/export/xlsxdocument.h>
#include <vexa/models/appearanceviewdatamodel.h>

#include <domain/standard.h>
#include <settings/generalsettings.h>

#include <QAbstractTableModel>
#include <QWidget>

#include <algorithm>

namespace vexa {

JobDetailViewExcelExporter::JobDetailViewExcelExporter(std::shared_ptr<GeneralSettings> settings, QString name,
                                                       QWidget *parent)
    : QObject(parent)
    , m_settings(std::move(settings))
    , m_name(std::move(name))
    , m_parentWidget(parent)
{
}

JobDetailViewExcelExporter::~JobDetailViewExcelExporter() = default;

bool JobDetailViewExcelExporter::promptForFilename()
{
    const QString fileName = SaveFilePrompt::getSaveFileName(SaveFilePrompt::excelSettingsKey(m_name),
                                                             SaveFilePrompt::excelFilter(), m_parentWidget);
    if (fileName.isEmpty())
        return false;
    m_fileName = fileName;
    return true;
}

void JobDetailViewExcelExporter::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                           const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    m_dataModel = dataModel;
    m_selectionModel = selectionModel;
}

void JobDetailViewExcelExporter::setColorDataTableModel(std::shared_ptr<QAbstractTableModel> model)
{
    m_tableModel = std::move(model);
}

bool JobDetailViewExcelExporter::exportToDocument(XlsxDocument &document, const QList<QModelIndex> &selection) const
{
    if (!m_tableModel)
        return false;
    if (!document.selectSheet(tr("Color Data")) && !document.addSheet(tr("Color Data")))
        document.addSheet();

    XlsxFormat titleFormat;
    titleFormat.setFontBold(true);
    titleFormat.setFontSize(14);
    document.write(1, 1, m_name, titleFormat);
    document.setRowHeight(1, 20);
    if (m_dataModel) {
        XlsxFormat labelFormat;
        labelFormat.setFontBold(true);
        if (const auto &standard = m_dataModel->standard()) {
            document.write(2, 1, tr("Standard"), labelFormat);
            document.write(2, 2, standard->name());
        }
        document.write(3, 1, tr("Colorimetric condition"), labelFormat);
        document.write(3, 2, m_dataModel->colorimetricCondition().toString());
    }

    const int columns = m_tableModel->columnCount();
    if (columns > 0) {
        document.setColumnWidth(1, 1, 24);
        if (columns > 1)
            document.setColumnWidth(2, std::min(columns, XlsxDocument::MaxColumns), 13);
    }
    TableExcelExporter exporter(document);
    exporter.setTableModel(m_tableModel);
    int row = TableFirstRow;
    return exporter.exportToSelectedSheet(row, selection);
}

bool JobDetailViewExcelExporter::exportToFile(const QList<QModelIndex> &selection)
{
    m_errorString.clear();
    if (m_fileName.isEmpty()) {
        m_errorString = tr("No file name chosen");
        return false;
    }
    XlsxDocument document;
    if (!exportToDocument(document, selection)) {
        m_errorString = tr("There is no table to export");
        return false;
    }
    if (!document.saveAs(m_fileName)) {
        m_errorString = document.errorString();
        return false;
    }
    return true;
}

} // namespace vexa
