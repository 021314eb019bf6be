#include <vexa/graph/spectralgraphdata.h>

#include <domain/reflectancespectrum.h>

#include <cmath>
#include <limits>

namespace vexa {

namespace {

bool fitsInt(double v)
{
    return std::isfinite(v) && v > double(std::numeric_limits<int>::min())
        && v < double(std::numeric_limits<int>::max());
}

} // namespace

SpectralGraphData::SpectralGraphData(std::shared_ptr<ReflectanceSpectrum> spectrum, int colorIndex)
    : m_spectrum(std::move(spectrum))
    , m_colorIndex(colorIndex)
{
    if (m_spectrum)
        m_points = spectrumPoints(*m_spectrum);
}

SpectralGraphData::~SpectralGraphData() = default;

QColor SpectralGraphData::colorForIndex(int index)
{
    if (index <= 0)
        return QColor(0, 0, 0, 255);
    if (index == 1)
        return QColor(50, 50, 250, 255);
    if (index == 2)
        return QColor(50, 250, 50, 255);
    return QColor(250, 50, 50, 255);
}

std::vector<GraphPoint> SpectralGraphData::spectrumPoints(const ReflectanceSpectrum &spectrum)
{
    std::vector<GraphPoint> points;
    if (!fitsInt(spectrum.startWavelength()) || !fitsInt(spectrum.wavelengthInterval()))
        return points;
    const long long start = static_cast<int>(spectrum.startWavelength());
    const long long interval = static_cast<int>(spectrum.wavelengthInterval());
    const QVector<double> values = spectrum.spectralValues();
    points.reserve(size_t(values.size()));
    for (int i = 0; i < values.size(); ++i)
        points.emplace_back(double(start + interval * i), values[i]);
    return points;
}

} // namespace vexa
