#include <vexa/export/tableprinter.h>

#include <vexa/export/dialogrunner.h>

#include <QFile>
#include <QLocale>
#include <QPrintDialog>
#include <QPrintPreviewDialog>
#include <QPrinter>
#include <QSortFilterProxyModel>
#include <QTextDocument>

namespace vexa {

namespace {

bool readsAsNumber(const QString &text)
{
    bool ok = false;
    text.toDouble(&ok);
    if (!ok)
        QLocale().toDouble(text, &ok);
    return ok;
}

// Every text goes into the page as text: a trial named "<b>A & B" prints as it is named.
// Line breaks of header texts stay line breaks.
QString escaped(const QString &text)
{
    QString html = text.toHtmlEscaped();
    html.replace(QLatin1Char('\n'), QStringLiteral("<br>"));
    return html;
}

} // namespace

TablePrinter::TablePrinter(std::shared_ptr<QSortFilterProxyModel> model, QObject *parent)
    : QObject(parent)
    , m_model(std::move(model))
    , m_document(new QTextDocument(this))
{
}

TablePrinter::~TablePrinter() = default;

void TablePrinter::setTitle(const std::string &title1, const std::string &title2, const std::string &title3)
{
    m_title1 = title1;
    m_title2 = title2;
    m_title3 = title3;
}

void TablePrinter::setTotal(const std::string &total)
{
    m_total = total;
}

QString TablePrinter::html() const
{
    QString html = QStringLiteral("<html><body><table border=\"0\" cellspacing=\"1\" cellpadding=\"4\">");
    bool anyTitle = false;
    for (const std::string *title : {&m_title1, &m_title2, &m_title3}) {
        if (title->empty())
            continue;
        anyTitle = true;
        html += QStringLiteral("<caption style=\"font-weight:bold\">") + escaped(QString::fromStdString(*title))
            + QStringLiteral("</caption>");
    }
    if (!anyTitle)
        html += QStringLiteral("<tr></tr>");

    if (m_model) {
        const int columns = m_model->columnCount();
        html += QStringLiteral("<tr>");
        for (int c = 0; c < columns; ++c)
            html += QStringLiteral("<th>") + escaped(m_model->headerData(c, Qt::Horizontal, Qt::DisplayRole).toString())
                + QStringLiteral("</th>");
        html += QStringLiteral("</tr>");
        const int rows = m_model->rowCount();
        for (int r = 0; r < rows; ++r) {
            html += QStringLiteral("<tr>");
            for (int c = 0; c < columns; ++c) {
                const QString text = m_model->data(m_model->index(r, c), Qt::DisplayRole).toString();
                html += (c >= 2 && readsAsNumber(text)) ? QStringLiteral("<td align=\"right\">")
                                                        : QStringLiteral("<td align=\"left\">");
                html += escaped(text) + QStringLiteral("</td>");
            }
            html += QStringLiteral("</tr>");
        }
    }

    if (!m_total.empty())
        html += QStringLiteral("<tr><th>") + tr("Total:") + QStringLiteral("</th><td align=\"left\">")
            + escaped(QString::fromStdString(m_total)) + QStringLiteral("</td></tr>");
    html += QStringLiteral("</table></body></html>");
    return html;
}

void TablePrinter::buildDocument()
{
    m_document->setHtml(html());
}

void TablePrinter::printDocument(QPrinter *printer)
{
    if (!printer)
        return;
    buildDocument();
    m_document->print(printer);
}

bool TablePrinter::print(QWidget *parent)
{
    QPrinter printer;
    QPrintDialog dialog(&printer, parent);
    dialog.setObjectName(QStringLiteral("tablePrintDialog"));
    if (DialogRunner::exec(dialog) != QDialog::Accepted)
        return false;
    printDocument(&printer);
    return true;
}

void TablePrinter::printPreview(QWidget *parent)
{
    QPrinter printer;
    QPrintPreviewDialog dialog(&printer, parent);
    dialog.setObjectName(QStringLiteral("tablePrintPreviewDialog"));
    connect(&dialog, &QPrintPreviewDialog::paintRequested, this, &TablePrinter::printDocument);
    DialogRunner::exec(dialog);
}

bool TablePrinter::printToPdf(const QString &fileName)
{
    QFile probe(fileName);
    if (fileName.isEmpty() || !probe.open(QIODevice::WriteOnly))
        return false;
    probe.close();
    QPrinter printer(QPrinter::HighResolution);
    printer.setOutputFormat(QPrinter::PdfFormat);
    printer.setOutputFileName(fileName);
    printDocument(&printer);
    return QFile(fileName).size() > 0;
}

} // namespace vexa
