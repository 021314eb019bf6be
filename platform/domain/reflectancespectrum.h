#pragma once

#include <domain/spectralvalues.h>

namespace vexa {

// A reflectance factor spectrum (values as fractions, 1.0 = perfect white): the
// spectral kind colour is computed from.
class VEXA_DOMAIN_EXPORT ReflectanceSpectrum : public SpectralValues
{
    VEXA_REFLECTABLE(ReflectanceSpectrum)
public:
    ReflectanceSpectrum() = default;
    ReflectanceSpectrum(const QVector<double> &values, double startWavelength, double wavelengthInterval)
        : SpectralValues(values, startWavelength, wavelengthInterval)
    {
    }
};

} // namespace vexa
