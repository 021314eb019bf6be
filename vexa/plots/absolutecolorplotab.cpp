#include <vexa/plots/absolutecolorplotab.h>

#include <vexa/plots/labcolorplotgraphicsview.h>
#include <vexa/plots/trialgraphicsitem.h>

namespace vexa {

AbsoluteColorPlotAB::AbsoluteColorPlotAB(QWidget *parent)
    : AbsoluteColorPlot(Plane::AB, parent)
{
}

AbsoluteColorPlotAB::~AbsoluteColorPlotAB() = default;

void AbsoluteColorPlotAB::initialize(std::shared_ptr<ColorPlotSettings> settings)
{
    if (view())
        return;
    setSettings(settings);
    auto *graphicsView = new LabColorPlotGraphicsView(this);

    PlotWidget::initialize(graphicsView, QRect(-6, -6, 12, 12), tr("a*"), tr("b*"));
    addStandardLabel();
}

TrialGraphicsItem *AbsoluteColorPlotAB::createTrialItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry)
{
    return new TrialGraphicsItem(trial, geometry, TrialGraphicsItem::Shape::Circle);
}

} // namespace vexa
