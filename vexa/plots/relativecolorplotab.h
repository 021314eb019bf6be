#pragma once

#include <vexa/plots/relativecolorplot.h>

namespace vexa {

// The a*b* plane of the relative colour plot.
class VEXA_EXPORT RelativeColorPlotAB : public RelativeColorPlot
{
    Q_OBJECT
public:
    explicit RelativeColorPlotAB(QWidget *parent = nullptr);
    ~RelativeColorPlotAB() override;

    void initialize(std::shared_ptr<ColorPlotSettings> settings) override;

protected:
    TrialGraphicsItem *createTrialItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry) override;
};

} // namespace vexa
