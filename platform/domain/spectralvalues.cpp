#include "spectralvalues.h"

#include "membertraits.h"

#include <cmath>

namespace vexa {

SpectralValues::SpectralValues(const QVector<double> &values, double startWavelength, double wavelengthInterval)
    : m_values(values), m_startWavelength(startWavelength), m_wavelengthInterval(wavelengthInterval)
{
}

const MemberList &SpectralValues::staticMembers()
{
    static const MemberList list(ColorValues::staticMembers(), {
        member("spectralValues", &SpectralValues::spectralValues, &SpectralValues::setSpectralValues),
        member("startWavelength", &SpectralValues::startWavelength, &SpectralValues::setStartWavelength),
        member("wavelengthInterval", &SpectralValues::wavelengthInterval, &SpectralValues::setWavelengthInterval),
    });
    return list;
}

double SpectralValues::endWavelength() const
{
    return m_values.isEmpty() ? m_startWavelength : m_startWavelength + (m_values.size() - 1) * m_wavelengthInterval;
}

QVector<double> SpectralValues::wavelengths() const
{
    QVector<double> out(m_values.size());
    for (int i = 0; i < out.size(); ++i)
        out[i] = m_startWavelength + i * m_wavelengthInterval;
    return out;
}

bool SpectralValues::isValid() const
{
    if (m_values.isEmpty() || !(m_wavelengthInterval > 0) || !std::isfinite(m_startWavelength))
        return false;
    for (double v : m_values) {
        if (!std::isfinite(v))
            return false;
    }
    return true;
}

QString SpectralValues::toString() const
{
    return ColorValues::toString()
        + QStringLiteral(" %1 values from %2 nm every %3 nm").arg(m_values.size()).arg(m_startWavelength).arg(m_wavelengthInterval);
}

} // namespace vexa
