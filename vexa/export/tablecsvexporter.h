#pragma once

#include <vexa/vexa_export.h>

#include <QLocale>
#include <QObject>
#include <QString>
#include <QVariant>

#include <memory>

class GeneralSettings;
class QAbstractItemModel;
class QAbstractTableModel;
class QWidget;

namespace vexa {

// Writes a table model as delimited text: a header line, then one line per row, every
// cell (the last one too) followed by the delimiter of the general settings. Cells
// coloured with a verdict colour carry the verdict word after their text ("1.23 FAIL").
// Texts are written as they are: not quoted, not escaped. Numbers are written as the table
// shows them, in the default locale; where that locale's decimal separator is the delimiter
// (a German locale and ","), the delimiter becomes ";" (or a tab where ";" is the decimal
// separator), as spreadsheets of that locale expect. Files are UTF-8 with a byte order mark,
// so that spreadsheets on Windows read names with accents right.
class VEXA_EXPORT TableCSVExporter : public QObject
{
    Q_OBJECT
public:
    TableCSVExporter(std::shared_ptr<GeneralSettings> settings, QString name, QObject *parent = nullptr);
    ~TableCSVExporter() override;

    // The delimiter of the general settings; ";" without settings.
    QString exportDelimiter() const;
    // The delimiter the text is written with: exportDelimiter(), unless it is the decimal
    // separator of `locale`; then ";" (a tab where ";" is the decimal separator).
    QString effectiveDelimiter(const QLocale &locale = QLocale()) const;
    // The whole table; empty for a null model.
    QString exportToString(std::shared_ptr<QAbstractTableModel> model) const;
    QString exportToString(const QAbstractItemModel *model) const;

    // Asks for a file name (remembered folder under "UI/<name>/CSVExportPath") and writes
    // the table. True when a file was written; false when there was nothing to write, the
    // user cancelled (errorString() empty) or the file could not be written (errorString()
    // says why).
    bool exportToFile(std::shared_ptr<QAbstractTableModel> model, QWidget *parent);
    bool exportToFile(QString text, QWidget *parent);
    // Writes the text to the file (UTF-8 with a byte order mark); false with errorString()
    // set when it cannot.
    bool writeToFile(const QString &text, const QString &fileName);

    QString name() const { return m_name; }
    QString errorString() const { return m_errorString; }

    // The verdict word of a cell's background ("PASS", "WARNING", "FAIL"); empty for
    // other backgrounds. Compares colours, whatever carries them (a QColor, a QBrush,
    // "#FF3D35" or "#ff3d35").
    static QString verdictOfBackground(const QVariant &background);

private:
    std::shared_ptr<GeneralSettings> m_settings;
    QString m_name;
    QString m_errorString;
};

} // namespace vexa
