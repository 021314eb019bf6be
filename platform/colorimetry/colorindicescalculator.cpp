#include <colorimetry/colorindicescalculator.h>

#include <colorimetry/colorconverter.h>
#include <colorimetry/colordifferencecalculator.h>
#include <colorimetry/colorspaceconversion.h>

#include <domain/labvalue.h>
#include <domain/reflectancespectrum.h>

#include <cmath>
#include <limits>

namespace vexa {

double ColorIndicesCalculator::flopIndex(double l15, double l45, double l110)
{
    if (!std::isfinite(l15) || !std::isfinite(l45) || !std::isfinite(l110) || l45 <= 0.0)
        return std::numeric_limits<double>::quiet_NaN();
    const double d = l15 - l110;
    const double magnitude = 2.69 * std::pow(std::fabs(d), 1.11) / std::pow(l45, 0.86);
    return d < 0.0 ? -magnitude : magnitude;
}

double ColorIndicesCalculator::FlopIndex(const LabValue &lab15, const LabValue &lab45, const LabValue &lab110)
{
    if (!lab15.isValid() || !lab45.isValid() || !lab110.isValid())
        return std::numeric_limits<double>::quiet_NaN();
    return flopIndex(lab15.l(), lab45.l(), lab110.l());
}

double ColorIndicesCalculator::MetamerismIndex(const ReflectanceSpectrum &standard, const ReflectanceSpectrum &trial,
                                               const ColorimetricCondition &reference,
                                               const ColorimetricCondition &test, const QString &formula)
{
    constexpr double NaN = std::numeric_limits<double>::quiet_NaN();
    const XYZValue standardReference = ColorConverter::toXYZ(standard, reference);
    const XYZValue trialReference = ColorConverter::toXYZ(trial, reference);
    const XYZValue trialTest = ColorConverter::toXYZ(trial, test);
    const LabValue standardTest = ColorConverter::toLab(standard, test);
    if (!standardReference.isValid() || !trialReference.isValid() || !trialTest.isValid() || !standardTest.isValid())
        return NaN;
    if (trialReference.x() == 0.0 || trialReference.y() == 0.0 || trialReference.z() == 0.0)
        return NaN;
    // The white of the trial's own wavelength grid under the test condition: the perfect
    // diffuser sampled like the trial, so the corrected trial is scaled like the standard.
    ReflectanceSpectrum perfectWhite(QVector<double>(trial.spectralValues().size(), 1.0), trial.startWavelength(),
                                     trial.wavelengthInterval());
    const XYZValue white = ColorConverter::toXYZ(perfectWhite, test);
    if (!white.isValid())
        return NaN;
    const CieXYZ corrected{trialTest.x() * standardReference.x() / trialReference.x(),
                           trialTest.y() * standardReference.y() / trialReference.y(),
                           trialTest.z() * standardReference.z() / trialReference.z()};
    const CieLab lab = ColorSpaceConversion::xyzToLab(corrected, CieXYZ{white.x(), white.y(), white.z()});
    return ColorDifferenceCalculator::Default_DE(formula, standardTest, LabValue(lab.L, lab.a, lab.b, test));
}

} // namespace vexa
