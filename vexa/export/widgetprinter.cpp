#include <vexa/export/widgetprinter.h>

#include <vexa/export/dialogrunner.h>

#include <QFile>
#include <QImage>
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

bool WidgetPrinter::render(const QImage &image, QPrinter &printer)
{
    if (image.isNull())
        return false;
    const QRectF page = printer.pageLayout().paintRectPixels(printer.resolution());
    const double scale = scaleFactor(page, image.size());
    if (scale <= 0.0)
        return false;
    QPainter painter;
    if (!painter.begin(&printer))
        return false;
    painter.setRenderHint(QPainter::SmoothPixmapTransform, true);
    painter.scale(scale, scale);
    painter.drawImage(QPoint(0, 0), image);
    painter.end();
    return true;
}

namespace {

// The print dialog every widget and snapshot print goes through.
bool askForPrinter(QPrinter &printer, QWidget *dialogParent)
{
    preparePrinter(printer);
    QPrintDialog dialog(&printer, dialogParent);
    dialog.setObjectName(QStringLiteral("widgetPrintDialog"));
    dialog.setWindowTitle(WidgetPrinter::tr("Print Visual"));
    return DialogRunner::exec(dialog) == QDialog::Accepted;
}

} // namespace

bool WidgetPrinter::printWidget(QWidget *widget)
{
    if (!widget)
        return false;
    QPrinter printer(QPrinter::HighResolution);
    if (!askForPrinter(printer, widget->parentWidget()))
        return false;
    return render(widget, printer);
}

bool WidgetPrinter::printImage(const QImage &image, QWidget *parent)
{
    if (image.isNull())
        return false;
    QPrinter printer(QPrinter::HighResolution);
    if (!askForPrinter(printer, parent ? parent->parentWidget() : nullptr))
        return false;
    return render(image, printer);
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
