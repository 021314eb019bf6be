#pragma once

// Stand-ins for the user at the library's modal dialogs (installed through DialogRunner),
// and the independent workbook reader of the export tests.

#include <vexa/export/dialogrunner.h>

#include <common/testprerequisites.h>

#include <QDialog>
#include <QFileDialog>
#include <QJsonDocument>
#include <QJsonObject>
#include <QPrintDialog>
#include <QPrinter>
#include <QProcess>
#include <QStringList>

#include <functional>

// Runs save dialogs by choosing the given file (or cancelling when it is empty) and
// records what the dialog showed.
struct ChooseFile
{
    explicit ChooseFile(QString file)
    {
        vexa::DialogRunner::setFunction([file, this](QDialog &dialog) {
            auto *fileDialog = qobject_cast<QFileDialog *>(&dialog);
            if (!fileDialog)
                return int(QDialog::Rejected);
            shownFolder = fileDialog->directory().absolutePath();
            shownFilter = fileDialog->nameFilters().join(";;");
            ++shown;
            if (file.isEmpty())
                return int(QDialog::Rejected);
            fileDialog->selectFile(file);
            return int(QDialog::Accepted);
        });
    }
    ~ChooseFile() { vexa::DialogRunner::setFunction(nullptr); }
    ChooseFile(const ChooseFile &) = delete;
    ChooseFile &operator=(const ChooseFile &) = delete;

    QString shownFolder;
    QString shownFilter;
    int shown = 0;
};

// Runs every dialog through a function for the duration of a scope.
struct RunDialogs
{
    explicit RunDialogs(std::function<int(QDialog &)> function)
    {
        vexa::DialogRunner::setFunction(std::move(function));
    }
    ~RunDialogs() { vexa::DialogRunner::setFunction(nullptr); }
    RunDialogs(const RunDialogs &) = delete;
    RunDialogs &operator=(const RunDialogs &) = delete;
};

// Runs print dialogs by printing into a PDF file and records what the dialog showed; any
// other dialog is cancelled. `before` runs first, when the dialog is shown.
struct PrintToPdf
{
    explicit PrintToPdf(QString file, std::function<void(QDialog &)> before = nullptr)
    {
        vexa::DialogRunner::setFunction([file, before, this](QDialog &dialog) {
            ++shown;
            title = dialog.windowTitle();
            parent = dialog.parentWidget();
            if (before)
                before(dialog);
            auto *printDialog = qobject_cast<QPrintDialog *>(&dialog);
            if (!printDialog)
                return int(QDialog::Rejected);
            printDialog->printer()->setOutputFormat(QPrinter::PdfFormat);
            printDialog->printer()->setOutputFileName(file);
            return int(QDialog::Accepted);
        });
    }
    ~PrintToPdf() { vexa::DialogRunner::setFunction(nullptr); }
    PrintToPdf(const PrintToPdf &) = delete;
    PrintToPdf &operator=(const PrintToPdf &) = delete;

    int shown = 0;
    QString title;
    QWidget *parent = nullptr;
};

// Debian's Python with python3-openpyxl and python3-pil (openpyxl reads images through Pillow).
inline QString workbookReaderPython()
{
    return testprerequisites::python();
}

// The workbook as openpyxl reads it (see read_xlsx.py); an empty object when it cannot be read,
// with the reason in *error.
inline QJsonObject readWorkbook(const QString &path, QString *error = nullptr)
{
    QProcess process;
    process.start(workbookReaderPython(),
                  {QStringLiteral(VEXA_SOURCE_DIR "/tests/vexa/export/read_xlsx.py"), path});
    if (!process.waitForFinished(60000) || process.exitCode() != 0) {
        if (error)
            *error = QString::fromUtf8(process.readAllStandardError());
        return QJsonObject();
    }
    return QJsonDocument::fromJson(process.readAllStandardOutput()).object();
}
