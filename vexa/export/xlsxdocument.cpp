#include <vexa/export/xlsxdocument.h>

#include <QBuffer>
#include <QDate>
#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QTemporaryFile>
#include <QTime>

#include <xlsxwriter.h>

#include <algorithm>
#include <cmath>

namespace vexa {

namespace {

bool isValidSheetName(const QString &name)
{
    if (name.isEmpty() || name.size() > 31)
        return false;
    static const QString forbidden = QStringLiteral("[]:*?/\\");
    for (const QChar c : name) {
        if (forbidden.contains(c))
            return false;
    }
    return !name.startsWith(QLatin1Char('\'')) && !name.endsWith(QLatin1Char('\''));
}

bool isNumber(const QVariant &value)
{
    switch (value.userType()) {
    case QMetaType::Double:
    case QMetaType::Float:
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::LongLong:
    case QMetaType::ULongLong:
    case QMetaType::Short:
    case QMetaType::UShort:
    case QMetaType::Long:
    case QMetaType::ULong:
        return true;
    default:
        return false;
    }
}

bool isDateOrTime(const QVariant &value)
{
    const int type = value.userType();
    return type == QMetaType::QDateTime || type == QMetaType::QDate || type == QMetaType::QTime;
}

// Days since 1899-12-30 with the time of day as the fraction: Excel's serial date.
double excelSerial(const QVariant &value)
{
    static const QDate epoch(1899, 12, 30);
    QDate date;
    QTime time(0, 0);
    switch (value.userType()) {
    case QMetaType::QDateTime: {
        const QDateTime local = value.toDateTime().toLocalTime();
        date = local.date();
        time = local.time();
        break;
    }
    case QMetaType::QDate:
        date = value.toDate();
        break;
    default:
        time = value.toTime();
        break;
    }
    const double days = date.isValid() ? double(epoch.daysTo(date)) : 0.0;
    return days + (time.isValid() ? time.msecsSinceStartOfDay() / 86400000.0 : 0.0);
}

QString defaultDateFormat(const QVariant &value)
{
    switch (value.userType()) {
    case QMetaType::QDate: return QStringLiteral("yyyy-mm-dd");
    case QMetaType::QTime: return QStringLiteral("hh:mm:ss");
    default: return QStringLiteral("yyyy-mm-dd hh:mm:ss");
    }
}

lxw_color_t toLxwColor(const QColor &color)
{
    const lxw_color_t rgb = lxw_color_t(color.rgb() & 0xffffff);
    return rgb == 0 ? lxw_color_t(LXW_COLOR_BLACK) : rgb;
}

QString lxwErrorText(lxw_error error)
{
    return QString::fromUtf8(lxw_strerror(error));
}

} // namespace

// XlsxFormat -------------------------------------------------------------------------

bool XlsxFormat::isEmpty() const
{
    return m_numberFormat.isEmpty() && !m_background.isValid() && !m_bold && m_fontSize <= 0.0;
}

bool XlsxFormat::operator==(const XlsxFormat &other) const
{
    return m_numberFormat == other.m_numberFormat && m_background == other.m_background && m_bold == other.m_bold
        && m_fontSize == other.m_fontSize;
}

QString XlsxFormat::key() const
{
    return QStringLiteral("%1|%2|%3|%4")
        .arg(m_numberFormat, m_background.isValid() ? m_background.name() : QString())
        .arg(m_bold ? 1 : 0)
        .arg(m_fontSize);
}

// XlsxDocument -----------------------------------------------------------------------

XlsxDocument::XlsxDocument() = default;
XlsxDocument::~XlsxDocument() = default;

bool XlsxDocument::addSheet(const QString &name)
{
    QString sheetName = name;
    if (sheetName.isEmpty()) {
        int n = int(m_sheets.size()) + 1;
        do {
            sheetName = QStringLiteral("Sheet%1").arg(n++);
        } while (sheetNames().contains(sheetName, Qt::CaseInsensitive));
    }
    if (!isValidSheetName(sheetName) || sheetNames().contains(sheetName, Qt::CaseInsensitive))
        return false;
    Sheet sheet;
    sheet.name = sheetName;
    m_sheets.push_back(std::move(sheet));
    m_current = int(m_sheets.size()) - 1;
    return true;
}

bool XlsxDocument::selectSheet(const QString &name)
{
    for (size_t i = 0; i < m_sheets.size(); ++i) {
        if (m_sheets[i].name == name) {
            m_current = int(i);
            return true;
        }
    }
    return false;
}

QStringList XlsxDocument::sheetNames() const
{
    QStringList names;
    for (const Sheet &sheet : m_sheets)
        names << sheet.name;
    return names;
}

QString XlsxDocument::currentSheetName() const
{
    const Sheet *sheet = currentSheet();
    return sheet ? sheet->name : QString();
}

XlsxDocument::Sheet *XlsxDocument::currentSheet()
{
    return m_current >= 0 && m_current < int(m_sheets.size()) ? &m_sheets[size_t(m_current)] : nullptr;
}

const XlsxDocument::Sheet *XlsxDocument::currentSheet() const
{
    return m_current >= 0 && m_current < int(m_sheets.size()) ? &m_sheets[size_t(m_current)] : nullptr;
}

XlsxDocument::Sheet &XlsxDocument::ensureSheet()
{
    if (!currentSheet())
        addSheet();
    return *currentSheet();
}

bool XlsxDocument::write(int row, int column, const QVariant &value, const XlsxFormat &format)
{
    if (row < 1 || row > MaxRows || column < 1 || column > MaxColumns)
        return false;
    Sheet &sheet = ensureSheet();
    const quint64 key = cellKey(row, column);
    if (!value.isValid() && format.isEmpty()) {
        sheet.cells.erase(key);
        return true;
    }
    sheet.cells[key] = Cell{value, format};
    return true;
}

QVariant XlsxDocument::read(int row, int column) const
{
    const Sheet *sheet = currentSheet();
    if (!sheet)
        return QVariant();
    const auto it = sheet->cells.find(cellKey(row, column));
    return it == sheet->cells.end() ? QVariant() : it->second.value;
}

XlsxFormat XlsxDocument::cellFormat(int row, int column) const
{
    const Sheet *sheet = currentSheet();
    if (!sheet)
        return XlsxFormat();
    const auto it = sheet->cells.find(cellKey(row, column));
    return it == sheet->cells.end() ? XlsxFormat() : it->second.format;
}

int XlsxDocument::lastRow() const
{
    const Sheet *sheet = currentSheet();
    if (!sheet || sheet->cells.empty())
        return 0;
    return int(sheet->cells.rbegin()->first >> 16);
}

int XlsxDocument::lastColumn() const
{
    const Sheet *sheet = currentSheet();
    int last = 0;
    if (sheet) {
        for (const auto &cell : sheet->cells)
            last = std::max(last, int(cell.first & 0xffff));
    }
    return last;
}

bool XlsxDocument::setColumnWidth(int firstColumn, int lastColumn, double width)
{
    if (firstColumn < 1 || lastColumn < firstColumn || lastColumn > MaxColumns || !(width >= 0.0))
        return false;
    Sheet &sheet = ensureSheet();
    for (int c = firstColumn; c <= lastColumn; ++c)
        sheet.columnWidths[c] = width;
    return true;
}

bool XlsxDocument::setRowHeight(int row, double height)
{
    if (row < 1 || row > MaxRows || !(height >= 0.0))
        return false;
    ensureSheet().rowHeights[row] = height;
    return true;
}

bool XlsxDocument::insertImage(int row, int column, const QImage &image)
{
    if (row < 1 || row > MaxRows || column < 1 || column > MaxColumns || image.isNull())
        return false;
    QByteArray png;
    QBuffer buffer(&png);
    buffer.open(QIODevice::WriteOnly);
    if (!image.save(&buffer, "PNG"))
        return false;
    ensureSheet().images.push_back(Image{row, column, png});
    return true;
}

bool XlsxDocument::saveAs(const QString &path)
{
    m_errorString.clear();
    if (path.isEmpty()) {
        m_errorString = tr("No file name given");
        return false;
    }
    const QFileInfo target(path);
    const QDir folder = target.absoluteDir();
    if (!folder.exists()) {
        m_errorString = tr("The folder %1 does not exist").arg(QDir::toNativeSeparators(folder.path()));
        return false;
    }
    if (target.exists() && !target.isWritable()) {
        m_errorString = tr("%1 is not writable").arg(QDir::toNativeSeparators(target.absoluteFilePath()));
        return false;
    }

    // Written beside the target first, so that a failed save leaves an existing file intact.
    QString tempPath;
    {
        QTemporaryFile temp(folder.filePath(QStringLiteral(".%1.XXXXXX").arg(target.fileName())));
        if (!temp.open()) {
            m_errorString = tr("Cannot write into %1: %2")
                                .arg(QDir::toNativeSeparators(folder.path()), temp.errorString());
            return false;
        }
        temp.setAutoRemove(false);
        tempPath = temp.fileName();
    }
    const QByteArray tempName = QFile::encodeName(tempPath);

    lxw_workbook *workbook = workbook_new(tempName.constData());
    if (!workbook) {
        QFile::remove(tempPath);
        m_errorString = tr("Cannot create the workbook");
        return false;
    }

    lxw_error firstError = LXW_NO_ERROR;
    const auto note = [&firstError](lxw_error error) {
        if (error != LXW_NO_ERROR && firstError == LXW_NO_ERROR)
            firstError = error;
    };
    QHash<QString, lxw_format *> formats;
    const auto formatFor = [&](const XlsxFormat &format) -> lxw_format * {
        if (format.isEmpty())
            return nullptr;
        const QString key = format.key();
        auto it = formats.find(key);
        if (it != formats.end())
            return it.value();
        lxw_format *lxw = workbook_add_format(workbook);
        if (!format.numberFormat().isEmpty())
            format_set_num_format(lxw, format.numberFormat().toUtf8().constData());
        if (format.patternBackgroundColor().isValid()) {
            format_set_pattern(lxw, LXW_PATTERN_SOLID);
            format_set_bg_color(lxw, toLxwColor(format.patternBackgroundColor()));
        }
        if (format.fontBold())
            format_set_bold(lxw);
        if (format.fontSize() > 0.0)
            format_set_font_size(lxw, format.fontSize());
        formats.insert(key, lxw);
        return lxw;
    };

    std::vector<Sheet> sheets = m_sheets;
    if (sheets.empty()) {
        Sheet sheet;
        sheet.name = QStringLiteral("Sheet1");
        sheets.push_back(sheet);
    }
    for (const Sheet &sheet : sheets) {
        lxw_worksheet *worksheet = workbook_add_worksheet(workbook, sheet.name.toUtf8().constData());
        if (!worksheet) {
            note(LXW_ERROR_SHEETNAME_ALREADY_USED);
            continue;
        }
        for (const auto &width : sheet.columnWidths)
            note(worksheet_set_column(worksheet, lxw_col_t(width.first - 1), lxw_col_t(width.first - 1),
                                      width.second, nullptr));
        for (const auto &height : sheet.rowHeights)
            note(worksheet_set_row(worksheet, lxw_row_t(height.first - 1), height.second, nullptr));
        for (const auto &entry : sheet.cells) {
            const lxw_row_t row = lxw_row_t((entry.first >> 16) - 1);
            const lxw_col_t column = lxw_col_t((entry.first & 0xffff) - 1);
            const QVariant &value = entry.second.value;
            XlsxFormat format = entry.second.format;
            if (!value.isValid()) {
                note(worksheet_write_blank(worksheet, row, column, formatFor(format)));
            } else if (value.userType() == QMetaType::Bool) {
                note(worksheet_write_boolean(worksheet, row, column, value.toBool() ? 1 : 0, formatFor(format)));
            } else if (isNumber(value)) {
                const double number = value.toDouble();
                if (std::isfinite(number))
                    note(worksheet_write_number(worksheet, row, column, number, formatFor(format)));
                else
                    note(worksheet_write_blank(worksheet, row, column, formatFor(format)));
            } else if (isDateOrTime(value)) {
                if (format.numberFormat().isEmpty())
                    format.setNumberFormat(defaultDateFormat(value));
                note(worksheet_write_number(worksheet, row, column, excelSerial(value), formatFor(format)));
            } else {
                const QByteArray text = value.toString().toUtf8();
                if (text.isEmpty())
                    note(worksheet_write_blank(worksheet, row, column, formatFor(format)));
                else
                    note(worksheet_write_string(worksheet, row, column, text.constData(), formatFor(format)));
            }
        }
        for (const Image &image : sheet.images)
            note(worksheet_insert_image_buffer(worksheet, lxw_row_t(image.row - 1), lxw_col_t(image.column - 1),
                                               reinterpret_cast<const unsigned char *>(image.png.constData()),
                                               size_t(image.png.size())));
    }

    const lxw_error closeError = workbook_close(workbook);
    note(closeError);
    if (firstError != LXW_NO_ERROR) {
        QFile::remove(tempPath);
        m_errorString = tr("Cannot write %1: %2")
                            .arg(QDir::toNativeSeparators(target.absoluteFilePath()), lxwErrorText(firstError));
        return false;
    }
    if (QFile::exists(path) && !QFile::remove(path)) {
        QFile::remove(tempPath);
        m_errorString = tr("Cannot replace %1").arg(QDir::toNativeSeparators(target.absoluteFilePath()));
        return false;
    }
    if (!QFile::rename(tempPath, path)) {
        QFile::remove(tempPath);
        m_errorString = tr("Cannot write %1").arg(QDir::toNativeSeparators(target.absoluteFilePath()));
        return false;
    }
    // The temporary file was private to the user; the workbook gets the usual permissions.
    QFile::setPermissions(path, QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ReadGroup
                                    | QFileDevice::ReadOther);
    return true;
}

} // namespace vexa
