#include <vexa/plots/absolutecolorplot.h>

namespace vexa {

AbsoluteColorPlot::AbsoluteColorPlot(Plane plane, QWidget *parent)
    : PlotWidget(plane, Reference::Absolute, parent)
{
}

AbsoluteColorPlot::~AbsoluteColorPlot() = default;

} // namespace vexa
