#pragma once

#include <vexa/vexa_export.h>

#include <QCoreApplication>
#include <QString>

class QWidget;

namespace vexa {

// The save-file prompt of the exports. It opens in the folder remembered under a settings
// key of the application's QSettings (the first desktop location the first time) and
// remembers the folder of an accepted choice under the same key.
class VEXA_EXPORT SaveFilePrompt
{
    Q_DECLARE_TR_FUNCTIONS(vexa::SaveFilePrompt)
public:
    // "CSV files (*.csv)" and "Excel Workbook (*.xlsx)".
    static QString csvFilter();
    static QString excelFilter();
    // "UI/<name>/CSVExportPath" and "UI/<name>/ExcelExportPath".
    static QString csvSettingsKey(const QString &name);
    static QString excelSettingsKey(const QString &name);

    // The folder remembered under the key, else the first desktop location.
    static QString startFolder(const QString &settingsKey);
    // The chosen file; empty when the user cancels. Dialogs run through DialogRunner.
    static QString getSaveFileName(const QString &settingsKey, const QString &nameFilter, QWidget *parent);
};

} // namespace vexa
