#include <vexa/plots/relativecolorplotab.h>

#include <vexa/plots/labcolorplotgraphicsview.h>
#include <vexa/plots/trialgraphicsitem.h>

namespace vexa {

RelativeColorPlotAB::RelativeColorPlotAB(QWidget *parent)
    : RelativeColorPlot(Plane::AB, parent)
{
}

RelativeColorPlotAB::~RelativeColorPlotAB() = default;

void RelativeColorPlotAB::initialize(std::shared_ptr<ColorPlotSettings> settings)
{
    if (view())
        return;
    setSettings(settings);
    auto *graphicsView = new LabColorPlotGraphicsView(this);

    PlotWidget::initialize(graphicsView, QRect(-6, -6, 12, 12), tr("Δa*"), tr("Δb*"));
    addStandardLabel();
}

TrialGraphicsItem *RelativeColorPlotAB::createTrialItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry)
{
    return new TrialGraphicsItem(trial, geometry, TrialGraphicsItem::Shape::Circle);
}

} // namespace vexa
