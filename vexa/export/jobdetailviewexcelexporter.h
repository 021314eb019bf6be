#pragma once

#include <vexa/vexa_export.h>

#include <QList>
#include <QModelIndex>
#include <QObject>
#include <QPointer>
#include <QString>

#include <memory>

class GeneralSettings;
class QAbstractTableModel;
class QWidget;

namespace vexa {

class AppearanceViewDataModel;
class TrialSelectionModel;
class XlsxDocument;

// The Excel export of a job detail page: a workbook whose sheet "Color Data" holds the
// page's title, the standard and the colorimetric condition, and below them the colour
// table.
class VEXA_EXPORT JobDetailViewExcelExporter : public QObject
{
    Q_OBJECT
public:
    // The sheet line the colour table starts on.
    static constexpr int TableFirstRow = 5;

    JobDetailViewExcelExporter(std::shared_ptr<GeneralSettings> settings, QString name, QWidget *parent = nullptr);
    ~JobDetailViewExcelExporter() override;

    // Asks for the workbook's file name (remembered folder under "UI/<name>/ExcelExportPath").
    // False when the user cancels.
    bool promptForFilename();
    QString fileName() const { return m_fileName; }
    void setFileName(const QString &fileName) { m_fileName = fileName; }

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel = nullptr);
    void setColorDataTableModel(std::shared_ptr<QAbstractTableModel> model);

    // Fills the document: the title block and the table (only the rows holding a selected
    // index, at their model positions, when the selection is not empty).
    bool exportToDocument(XlsxDocument &document, const QList<QModelIndex> &selection) const;
    // Builds the workbook and saves it under fileName(). False with errorString() set when
    // there is no file name, no table or the file cannot be written.
    bool exportToFile(const QList<QModelIndex> &selection = QList<QModelIndex>());
    QString errorString() const { return m_errorString; }

    QString name() const { return m_name; }

private:
    std::shared_ptr<GeneralSettings> m_settings;
    QString m_name;
    QPointer<QWidget> m_parentWidget;
    QString m_fileName;
    QString m_errorString;
    std::shared_ptr<AppearanceViewDataModel> m_dataModel;
    std::shared_ptr<TrialSelectionModel> m_selectionModel;
    std::shared_ptr<QAbstractTableModel> m_tableModel;
};

} // namespace vexa
