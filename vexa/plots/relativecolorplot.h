#pragma once

#include <vexa/plots/plotwidget.h>

namespace vexa {

class ColorPlotSettings;

// A colour plot that places every colour at its own coordinates relative to the standard (the\n// standard sits at the origin and the axes show differences).
class VEXA_EXPORT RelativeColorPlot : public PlotWidget
{
    Q_OBJECT
public:
    ~RelativeColorPlot() override;

    // Creates the view and the scene and takes the plot's settings (null: the defaults).
    virtual void initialize(std::shared_ptr<ColorPlotSettings> settings) = 0;

protected:
    RelativeColorPlot(Plane plane, QWidget *parent = nullptr);
};

} // namespace vexa
