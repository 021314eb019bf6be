#pragma once

#include <vexa/plots/relativecolorplot.h>

namespace vexa {

// The L* strip of the relative colour plot.
class VEXA_EXPORT RelativeColorPlotL : public RelativeColorPlot
{
    Q_OBJECT
public:
    explicit RelativeColorPlotL(QWidget *parent = nullptr);
    ~RelativeColorPlotL() override;

    void initialize(std::shared_ptr<ColorPlotSettings> settings) override;

protected:
    TrialGraphicsItem *createTrialItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry) override;
};

} // namespace vexa
