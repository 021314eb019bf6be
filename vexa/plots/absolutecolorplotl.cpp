#include <vexa/plots/absolutecolorplotl.h>

#include <vexa/plots/zoomgraphicsview.h>
#include <vexa/plots/trialgraphicsitem.h>

namespace vexa {

AbsoluteColorPlotL::AbsoluteColorPlotL(QWidget *parent)
    : AbsoluteColorPlot(Plane::L, parent)
{
}

AbsoluteColorPlotL::~AbsoluteColorPlotL() = default;

void AbsoluteColorPlotL::initialize(std::shared_ptr<ColorPlotSettings> settings)
{
    if (view())
        return;
    setSettings(settings);
    auto *graphicsView = new ZoomGraphicsView(this);
    graphicsView->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    PlotWidget::initialize(graphicsView, QRect(-2, -6, 4, 12), QString(), tr("L*"));

}

TrialGraphicsItem *AbsoluteColorPlotL::createTrialItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry)
{
    return new TrialGraphicsItem(trial, geometry, TrialGraphicsItem::Shape::Bar);
}

} // namespace vexa
