#pragma once

#include <vexa/vexa_export.h>
#include <vexa/graph/graphdata.h>

#include <memory>

namespace vexa {

class ReflectanceSpectrum;

// One reflectance spectrum as a curve: wavelength (nm) across, reflectance factor up.
// The colour comes from an index: 0 (or less) black, 1 blue, 2 green, 3 and more red.
class VEXA_EXPORT SpectralGraphData : public GraphData
{
public:
    // A null spectrum gives a curve without points.
    SpectralGraphData(std::shared_ptr<ReflectanceSpectrum> spectrum, int colorIndex);
    ~SpectralGraphData() override;

    // Empty: a spectrum's curve is named by the group it belongs to.
    std::string name() const override { return std::string(); }
    QColor color() const override { return colorForIndex(m_colorIndex); }
    const std::vector<GraphPoint> &points() const override { return m_points; }
    // Always empty.
    const std::vector<std::shared_ptr<GraphData>> &subData() const override { return m_subData; }

    const std::shared_ptr<ReflectanceSpectrum> &spectrum() const { return m_spectrum; }
    int colorIndex() const { return m_colorIndex; }

    static QColor colorForIndex(int index);
    // The points of a spectrum: value i at start + interval × i nm, the wavelength
    // computed in whole nanometres (start and interval truncated). No points for a grid
    // whose start or interval is not a finite number within the integer range.
    static std::vector<GraphPoint> spectrumPoints(const ReflectanceSpectrum &spectrum);

private:
    std::shared_ptr<ReflectanceSpectrum> m_spectrum;
    std::vector<GraphPoint> m_points;
    int m_colorIndex;
    std::vector<std::shared_ptr<GraphData>> m_subData;
};

} // namespace vexa
