#pragma once

#include <vexa/vexa_export.h>

#include <QByteArray>
#include <QColor>
#include <QCoreApplication>
#include <QImage>
#include <QString>
#include <QStringList>
#include <QVariant>

#include <map>
#include <memory>
#include <vector>

namespace vexa {

// The look of a spreadsheet cell: number format, background fill and font weight.
// A default format changes nothing.
class VEXA_EXPORT XlsxFormat
{
public:
    XlsxFormat() = default;

    QString numberFormat() const { return m_numberFormat; }
    void setNumberFormat(const QString &format) { m_numberFormat = format; }
    // A solid fill in this colour; an invalid colour means no fill.
    QColor patternBackgroundColor() const { return m_background; }
    void setPatternBackgroundColor(const QColor &color) { m_background = color; }
    bool fontBold() const { return m_bold; }
    void setFontBold(bool bold) { m_bold = bold; }
    // Font size in points; 0 keeps the workbook's default.
    double fontSize() const { return m_fontSize; }
    void setFontSize(double size) { m_fontSize = size; }

    bool isEmpty() const;
    bool operator==(const XlsxFormat &other) const;
    bool operator!=(const XlsxFormat &other) const { return !(*this == other); }
    // A text that identifies the format (equal formats, equal keys).
    QString key() const;

private:
    QString m_numberFormat;
    QColor m_background;
    bool m_bold = false;
    double m_fontSize = 0.0;
};

// An Excel workbook built in memory and written in one go by saveAs(). Rows and columns
// count from 1. Cells, column widths, row heights and images are kept per worksheet;
// write() goes to the current sheet, which addSheet() and selectSheet() choose (a first
// sheet "Sheet1" is made on the first write when there is none).
class VEXA_EXPORT XlsxDocument
{
    Q_DECLARE_TR_FUNCTIONS(vexa::XlsxDocument)
public:
    // Excel's limits.
    static constexpr int MaxRows = 1048576;
    static constexpr int MaxColumns = 16384;

    XlsxDocument();
    ~XlsxDocument();
    XlsxDocument(const XlsxDocument &) = delete;
    XlsxDocument &operator=(const XlsxDocument &) = delete;

    // Adds a sheet and makes it current. An empty name gives "Sheet<n>". False for a name
    // Excel refuses (longer than 31 characters, one of []:*?/\ , or already taken).
    bool addSheet(const QString &name = QString());
    bool selectSheet(const QString &name);
    QStringList sheetNames() const;
    QString currentSheetName() const;

    // Writes a value into the current sheet: numbers (double, float, integers) as numbers,
    // bool as a boolean, QDateTime/QDate/QTime as dates (with a date format unless the
    // format names one), anything else as its text. An invalid value writes a blank cell
    // (kept only when it carries a format). False outside the sheet's limits.
    bool write(int row, int column, const QVariant &value, const XlsxFormat &format = XlsxFormat());
    // The value and format stored for a cell of the current sheet (invalid when empty).
    QVariant read(int row, int column) const;
    XlsxFormat cellFormat(int row, int column) const;
    // The last row and column holding a cell in the current sheet (0 when empty).
    int lastRow() const;
    int lastColumn() const;

    // Widths in characters, heights in points.
    bool setColumnWidth(int firstColumn, int lastColumn, double width);
    bool setRowHeight(int row, double height);
    // Places the image (stored as PNG) with its top-left corner in the cell.
    bool insertImage(int row, int column, const QImage &image);

    // Writes the workbook to path, replacing the file. False with errorString() set when
    // the file cannot be written; the document is kept and can be saved again.
    bool saveAs(const QString &path);
    QString errorString() const { return m_errorString; }

private:
    struct Cell
    {
        QVariant value;
        XlsxFormat format;
    };
    struct Image
    {
        int row = 1;
        int column = 1;
        QByteArray png;
    };
    struct Sheet
    {
        QString name;
        std::map<quint64, Cell> cells; // Keyed by row << 16 | column.
        std::map<int, double> columnWidths;
        std::map<int, double> rowHeights;
        std::vector<Image> images;
    };

    Sheet *currentSheet();
    const Sheet *currentSheet() const;
    Sheet &ensureSheet();
    static quint64 cellKey(int row, int column) { return (quint64(row) << 16) | quint64(column); }

    std::vector<Sheet> m_sheets;
    int m_current = -1;
    QString m_errorString;
};

} // namespace vexa
