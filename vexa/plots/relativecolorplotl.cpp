#include <vexa/plots/relativecolorplotl.h>

#include <vexa/plots/zoomgraphicsview.h>
#include <vexa/plots/trialgraphicsitem.h>

namespace vexa {

RelativeColorPlotL::RelativeColorPlotL(QWidget *parent)
    : RelativeColorPlot(Plane::L, parent)
{
}

RelativeColorPlotL::~RelativeColorPlotL() = default;

void RelativeColorPlotL::initialize(std::shared_ptr<ColorPlotSettings> settings)
{
    if (view())
        return;
    setSettings(settings);
    auto *graphicsView = new ZoomGraphicsView(this);
    graphicsView->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    PlotWidget::initialize(graphicsView, QRect(-2, -6, 4, 12), QString(), tr("ΔL*"));

}

TrialGraphicsItem *RelativeColorPlotL::createTrialItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry)
{
    return new TrialGraphicsItem(trial, geometry, TrialGraphicsItem::Shape::Bar);
}

} // namespace vexa
