#pragma once

#include <domain/colorvalues.h>

#include <QVector>

namespace vexa {

// Values at equally spaced wavelengths: value i belongs to
// startWavelength() + i * wavelengthInterval() nanometres.
class VEXA_DOMAIN_EXPORT SpectralValues : public ColorValues
{
    VEXA_REFLECTABLE(SpectralValues)
public:
    SpectralValues() = default;
    SpectralValues(const QVector<double> &values, double startWavelength, double wavelengthInterval);

    QVector<double> spectralValues() const { return m_values; }
    void setSpectralValues(const QVector<double> &values) { m_values = values; }
    double startWavelength() const { return m_startWavelength; }
    void setStartWavelength(double nm) { m_startWavelength = nm; }
    double wavelengthInterval() const { return m_wavelengthInterval; }
    void setWavelengthInterval(double nm) { m_wavelengthInterval = nm; }

    double endWavelength() const;
    QVector<double> wavelengths() const;
    // Empty, a non-positive interval, or a NaN/infinite value.
    bool isEmpty() const { return m_values.isEmpty(); }
    bool isValid() const;

    QString toString() const override;

private:
    QVector<double> m_values;
    double m_startWavelength = 400.0;
    double m_wavelengthInterval = 10.0;
};

} // namespace vexa
