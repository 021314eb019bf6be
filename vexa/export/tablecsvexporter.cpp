#include <vexa/export/tablecsvexporter.h>

#include <vexa/export/savefileprompt.h>
#include <vexa/widgets/verdictcolors.h>

#include <settings/generalsettings.h>

#include <QAbstractTableModel>
#include <QBrush>
#include <QColor>
#include <QDir>
#include <QFile>
#include <QTextStream>

namespace vexa {

TableCSVExporter::TableCSVExporter(std::shared_ptr<GeneralSettings> settings, QString name, QObject *parent)
    : QObject(parent)
    , m_settings(std::move(settings))
    , m_name(std::move(name))
{
}

TableCSVExporter::~TableCSVExporter() = default;

QString TableCSVExporter::exportDelimiter() const
{
    return m_settings ? m_settings->exportDelimiter() : QStringLiteral(";");
}

QString TableCSVExporter::effectiveDelimiter(const QLocale &locale) const
{
    const QString delimiter = exportDelimiter();
    const QString decimal(locale.decimalPoint());
    if (delimiter != decimal)
        return delimiter;
    return decimal == QLatin1String(";") ? QStringLiteral("\t") : QStringLiteral(";");
}

QString TableCSVExporter::verdictOfBackground(const QVariant &background)
{
    return VerdictColors::word(VerdictColors::statusOfBackground(background));
}

QString TableCSVExporter::exportToString(std::shared_ptr<QAbstractTableModel> model) const
{
    return exportToString(model.get());
}

QString TableCSVExporter::exportToString(const QAbstractItemModel *model) const
{
    if (!model)
        return QString();
    const QString delimiter = effectiveDelimiter();
    const int columns = model->columnCount();
    const int rows = model->rowCount();
    QString text;
    for (int c = 0; c < columns; ++c) {
        QString header = model->headerData(c, Qt::Horizontal, Qt::DisplayRole).toString();
        header.replace(QLatin1Char('\n'), QLatin1Char(' '));
        text += header;
        text += delimiter;
    }
    text += QLatin1Char('\n');
    for (int r = 0; r < rows; ++r) {
        for (int c = 0; c < columns; ++c) {
            const QModelIndex index = model->index(r, c);
            const QString verdict = verdictOfBackground(model->data(index, Qt::BackgroundRole));
            const QString display = model->data(index, Qt::DisplayRole).toString();
            text += verdict.isEmpty() ? display : QStringLiteral("%1 %2").arg(display, verdict);
            text += delimiter;
        }
        text += QLatin1Char('\n');
    }
    return text;
}

bool TableCSVExporter::exportToFile(std::shared_ptr<QAbstractTableModel> model, QWidget *parent)
{
    return exportToFile(exportToString(model), parent);
}

bool TableCSVExporter::exportToFile(QString text, QWidget *parent)
{
    m_errorString.clear();
    if (text.isEmpty())
        return false;
    const QString fileName =
        SaveFilePrompt::getSaveFileName(SaveFilePrompt::csvSettingsKey(m_name), SaveFilePrompt::csvFilter(), parent);
    if (fileName.isEmpty())
        return false;
    return writeToFile(text, fileName);
}

bool TableCSVExporter::writeToFile(const QString &text, const QString &fileName)
{
    m_errorString.clear();
    QFile file(fileName);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Text)) {
        m_errorString = tr("Cannot write %1: %2").arg(QDir::toNativeSeparators(fileName), file.errorString());
        return false;
    }
    QTextStream stream(&file);
    stream.setCodec("UTF-8");
    stream.setGenerateByteOrderMark(true);
    stream << text;
    stream.flush();
    if (stream.status() != QTextStream::Ok || !file.flush()) {
        m_errorString = tr("Cannot write %1: %2").arg(QDir::toNativeSeparators(fileName), file.errorString());
        return false;
    }
    return true;
}

} // namespace vexa
