#include <vexa/plots/colorplotwidget.h>

#include <vexa/export/widgetprinter.h>
#include <vexa/plots/plotwidget.h>
#include <vexa/plots/zoomgraphicsview.h>

#include <QAction>
#include <QHBoxLayout>
#include <QMenu>

namespace vexa {

ColorPlotWidget::ColorPlotWidget(QWidget *parent)
    : QWidget(parent)
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

bool ColorPlotWidget::print()
{
    return WidgetPrinter::printImage(snapshot(), this);
}

} // namespace vexa
