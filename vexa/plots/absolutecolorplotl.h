#pragma once

#include <vexa/plots/absolutecolorplot.h>

namespace vexa {

// The L* strip of the absolute colour plot.
class VEXA_EXPORT AbsoluteColorPlotL : public AbsoluteColorPlot
{
    Q_OBJECT
public:
    explicit AbsoluteColorPlotL(QWidget *parent = nullptr);
    ~AbsoluteColorPlotL() override;

    void initialize(std::shared_ptr<ColorPlotSettings> settings) override;

protected:
    TrialGraphicsItem *createTrialItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry) override;
};

} // namespace vexa
