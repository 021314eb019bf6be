#pragma once

#include <vexa/plots/absolutecolorplot.h>

namespace vexa {

// The a*b* plane of the absolute colour plot.
class VEXA_EXPORT AbsoluteColorPlotAB : public AbsoluteColorPlot
{
    Q_OBJECT
public:
    explicit AbsoluteColorPlotAB(QWidget *parent = nullptr);
    ~AbsoluteColorPlotAB() override;

    void initialize(std::shared_ptr<ColorPlotSettings> settings) override;

protected:
    TrialGraphicsItem *createTrialItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry) override;
};

} // namespace vexa
