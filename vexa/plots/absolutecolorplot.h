#pragma once

#include <vexa/plots/plotwidget.h>

namespace vexa {

class ColorPlotSettings;

// A colour plot that places every colour at its own coordinates (the axes show\n// CIELAB values).
class VEXA_EXPORT AbsoluteColorPlot : public PlotWidget
{
    Q_OBJECT
public:
    ~AbsoluteColorPlot() override;

    // Creates the view and the scene and takes the plot's settings (null: the defaults).
    virtual void initialize(std::shared_ptr<ColorPlotSettings> settings) = 0;

protected:
    AbsoluteColorPlot(Plane plane, QWidget *parent = nullptr);
};

} // namespace vexa
