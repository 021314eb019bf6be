#pragma once

#include <vexa/vexa_export.h>

#include <QCoreApplication>
#include <QRectF>
#include <QSize>
#include <QString>

class QImage;
class QPrinter;
class QWidget;

namespace vexa {

// Prints a widget (a plot, a comparison view) as a picture scaled to fit one A4 page,
// keeping its aspect ratio.
class VEXA_EXPORT WidgetPrinter
{
    Q_DECLARE_TR_FUNCTIONS(vexa::WidgetPrinter)
public:
    // Shows the print dialog "Print Visual" (through DialogRunner) and prints the widget
    // when it is accepted. True when something was printed.
    static bool printWidget(QWidget *widget);
    // Writes the widget as a one-page PDF file without asking.
    static bool printWidgetToPdf(QWidget *widget, const QString &fileName);
    // Prints a picture taken of a widget (a snapshot) the same way: the dialog "Print Visual"
    // through DialogRunner, scaled to fit one A4 page. True when something was printed.
    static bool printImage(const QImage &image, QWidget *parent);
    // Paints the picture on the printer, scaled to its page. False when painting cannot start.
    static bool render(const QImage &image, QPrinter &printer);

    // The factor that fits a widget of that size into the page rectangle (one factor for
    // both axes); 0 for an empty widget.
    static double scaleFactor(const QRectF &pageRect, const QSize &widgetSize);
    // Paints the widget on the printer, scaled to its page. False when painting cannot start.
    static bool render(QWidget *widget, QPrinter &printer);
};

} // namespace vexa
