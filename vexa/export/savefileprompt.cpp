#include <vexa/export/savefileprompt.h>

#include <vexa/export/dialogrunner.h>

#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QRegularExpression>
#include <QSettings>
#include <QStandardPaths>

namespace vexa {

QString SaveFilePrompt::csvFilter()
{
    return tr("CSV files (*.csv)");
}

QString SaveFilePrompt::excelFilter()
{
    return tr("Excel Workbook (*.xlsx)");
}

QString SaveFilePrompt::csvSettingsKey(const QString &name)
{
    return QStringLiteral("UI/") + name + QStringLiteral("/CSVExportPath");
}

QString SaveFilePrompt::excelSettingsKey(const QString &name)
{
    return QStringLiteral("UI/") + name + QStringLiteral("/ExcelExportPath");
}

QString SaveFilePrompt::startFolder(const QString &settingsKey)
{
    const QString remembered = QSettings().value(settingsKey).toString();
    if (!remembered.isEmpty())
        return remembered;
    const QStringList desktops = QStandardPaths::standardLocations(QStandardPaths::DesktopLocation);
    return desktops.isEmpty() ? QDir::homePath() : desktops.first();
}

QString SaveFilePrompt::getSaveFileName(const QString &settingsKey, const QString &nameFilter, QWidget *parent)
{
    QFileDialog dialog(parent, QString(), startFolder(settingsKey), nameFilter);
    dialog.setObjectName(QStringLiteral("saveFileDialog"));
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.setFileMode(QFileDialog::AnyFile);
    // "CSV files (*.csv)" gives the suffix "csv" to names typed without one.
    const QRegularExpressionMatch suffix =
        QRegularExpression(QStringLiteral("\\*\\.([A-Za-z0-9]+)")).match(nameFilter);
    if (suffix.hasMatch())
        dialog.setDefaultSuffix(suffix.captured(1));
    if (DialogRunner::exec(dialog) != QDialog::Accepted)
        return QString();
    const QStringList files = dialog.selectedFiles();
    if (files.isEmpty() || files.first().isEmpty())
        return QString();
    QSettings().setValue(settingsKey, dialog.directory().absolutePath());
    return files.first();
}

} // namespace vexa
