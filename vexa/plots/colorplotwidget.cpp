#include <vexa/plots/colorplotwidget.h>

#include <vexa/plots/plotwidget.h>
#include <vexa/plots/zoomgraphicsview.h>

#include <QAction>
#include <QFileDialog>
#include <QHBoxLayout>
#include <QMenu>
#include <QPainter>
#include <QPrintDialog>
#include <QPrinter>
#include <QPrinterInfo>

namespace vexa {

ColorPlotWidget::ColorPlotWidget(QWidget *parent)
    : QWidget(parent)
    , m_snapshotPrinter(&ColorPlotWidget::printWithDialog)
{
}

ColorPlotWidget::~ColorPlotWidget() = default;

void ColorPlotWidget::initialize(PlotWidget *abPlot, PlotWidget *lPlot)
{
    if (m_abPlot || m_lPlot || !abPlot || !lPlot)
        return;
    m_abPlot = abPlot;
    m_lPlot = lPlot;
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(4);
    abPlot->setParent(this);
    lPlot->setParent(this);
    layout->addWidget(abPlot, 4);
    layout->addWidget(lPlot, 1);
    if (lPlot->view())
        lPlot->view()->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);

    m_contextMenu = new QMenu(this);
    m_printAction = m_contextMenu->addAction(tr("Print Snapshot"));
    connect(m_printAction, SIGNAL(triggered()), this, SLOT(print()));
    for (PlotWidget *plot : {abPlot, lPlot}) {
        plot->setContextMenuPolicy(Qt::CustomContextMenu);
        connect(plot, SIGNAL(customContextMenuRequested(const QPoint &)), this,
                SLOT(onContextMenuRequested(const QPoint &)));
    }
}

void ColorPlotWidget::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    AppearanceViewBase::setModels(dataModel, selectionModel);
    if (m_abPlot)
        m_abPlot->setModels(dataModel, selectionModel);
    if (m_lPlot)
        m_lPlot->setModels(dataModel, selectionModel);
}

void ColorPlotWidget::settingsChanged()
{
    if (m_abPlot)
        m_abPlot->settingsChanged();
    if (m_lPlot)
        m_lPlot->settingsChanged();
}

void ColorPlotWidget::refreshAll()
{
    if (m_abPlot)
        m_abPlot->refreshAll();
    if (m_lPlot)
        m_lPlot->refreshAll();
}

void ColorPlotWidget::onContextMenuRequested(const QPoint &position)
{
    if (!m_contextMenu)
        return;
    auto *source = qobject_cast<QWidget *>(sender());
    m_contextMenu->popup(source ? source->mapToGlobal(position) : mapToGlobal(position));
}

void ColorPlotWidget::setSnapshotPrinter(SnapshotPrinter printer)
{
    m_snapshotPrinter = printer ? std::move(printer) : SnapshotPrinter(&ColorPlotWidget::printWithDialog);
}

QImage ColorPlotWidget::snapshot()
{
    for (PlotWidget *plot : {m_abPlot, m_lPlot}) {
        if (plot)
            plot->prepareForPrinting();
    }
    const QImage image = grab().toImage();
    for (PlotWidget *plot : {m_abPlot, m_lPlot}) {
        if (plot)
            plot->finishedPrinting();
    }
    return image;
}

void ColorPlotWidget::print()
{
    const QImage image = snapshot();
    if (image.isNull())
        return;
    m_snapshotPrinter(image, this);
}

bool ColorPlotWidget::printImage(const QImage &image, QPrinter &printer)
{
    if (image.isNull())
        return false;
    QPainter painter;
    if (!painter.begin(&printer))
        return false;
    const QRect page = painter.viewport();
    QSize size = image.size();
    size.scale(page.size(), Qt::KeepAspectRatio);
    const QRect target(page.x() + (page.width() - size.width()) / 2, page.y(), size.width(), size.height());
    painter.setRenderHint(QPainter::SmoothPixmapTransform, true);
    painter.drawImage(target, image);
    return painter.end();
}

void ColorPlotWidget::printWithDialog(const QImage &snapshot, QWidget *parent)
{
    if (QPrinterInfo::availablePrinters().isEmpty()) {
        const QString file = QFileDialog::getSaveFileName(parent, tr("Save Snapshot"), QString(),
                                                          tr("PDF files (*.pdf)"));
        if (file.isEmpty())
            return;
        QPrinter printer(QPrinter::HighResolution);
        printer.setOutputFormat(QPrinter::PdfFormat);
        printer.setOutputFileName(file.endsWith(QLatin1String(".pdf"), Qt::CaseInsensitive)
                                      ? file
                                      : file + QStringLiteral(".pdf"));
        printImage(snapshot, printer);
        return;
    }
    QPrinter printer(QPrinter::HighResolution);
    QPrintDialog dialog(&printer, parent);
    dialog.setWindowTitle(tr("Print Snapshot"));
    if (dialog.exec() == QDialog::Accepted)
        printImage(snapshot, printer);
}

} // namespace vexa
