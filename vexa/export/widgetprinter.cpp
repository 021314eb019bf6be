#include <vexa/export/widgetprinter.h>

#include <vexa/export/dialogrunner.h>

#include <QFile>
#include <QPainter>
#include <QPrintDialog>
#include <QPrinter>
#include <QWidget>

#include <algorithm>

namespace vexa {

namespace {

void preparePrinter(QPrinter &printer)
{
    printer.setPageSize(QPageSize(QPageSize::A4));
    printer.setResolution(600);
    printer.setPrintRange(QPrinter::AllPages);
}

} // namespace

double WidgetPrinter::scaleFactor(const QRectF &pageRect, const QSize &widgetSize)
{
    if (widgetSize.width() <= 0 || widgetSize.height() <= 0)
        return 0.0;
    return std::min(pageRect.width() / widgetSize.width(), pageRect.height() / widgetSize.height());
}

bool WidgetPrinter::render(QWidget *widget, QPrinter &printer)
{
    if (!widget)
        return false;
    const QRectF page = printer.pageLayout().paintRectPixels(printer.resolution());
    const double scale = scaleFactor(page, widget->size());
    if (scale <= 0.0)
        return false;
    QPainter painter;
    if (!painter.begin(&printer))
        return false;
    painter.scale(scale, scale);
    widget->render(&painter, QPoint(0, 0));
    painter.end();
    return true;
}

bool WidgetPrinter::printWidget(QWidget *widget)
{
    if (!widget)
        return false;
    QPrinter printer(QPrinter::HighResolution);
    preparePrinter(printer);
    QPrintDialog dialog(&printer, widget->parentWidget());
    dialog.setObjectName(QStringLiteral("widgetPrintDialog"));
    dialog.setWindowTitle(tr("Print Visual"));
    if (DialogRunner::exec(dialog) != QDialog::Accepted)
        return false;
    return render(widget, printer);
}

bool WidgetPrinter::printWidgetToPdf(QWidget *widget, const QString &fileName)
{
    if (!widget || fileName.isEmpty())
        return false;
    QFile probe(fileName);
    if (!probe.open(QIODevice::WriteOnly))
        return false;
    probe.close();
    QPrinter printer(QPrinter::HighResolution);
    printer.setOutputFormat(QPrinter::PdfFormat);
    printer.setOutputFileName(fileName);
    preparePrinter(printer);
    return render(widget, printer) && QFile(fileName).size() > 0;
}

} // namespace vexa
