#include <vexa/plots/relativecolorplot.h>

namespace vexa {

RelativeColorPlot::RelativeColorPlot(Plane plane, QWidget *parent)
    : PlotWidget(plane, Reference::Relative, parent)
{
}

RelativeColorPlot::~RelativeColorPlot() = default;

} // namespace vexa
