#include <colorimetry/colorconverter.h>

#include <colorimetry/colorspaceconversion.h>
#include <colorimetry/spectralweights.h>

#include <domain/appearancevalues.h>
#include <domain/geometry.h>
#include <domain/reflectancespectrum.h>

#include <utilities/logger.h>

#include <cmath>

namespace vexa {

namespace {

std::shared_ptr<const SpectralWeights> weightsFor(const ColorimetricCondition &condition, double start,
                                                  double interval, int count)
{
    return SpectralWeights::forGrid(condition.illuminant(), condition.observer(), start, interval, count);
}

/// XYZ and white of a spectrum; false (with a log line naming the reason) when it cannot be converted.
bool spectrumToXyz(const ReflectanceSpectrum &spectrum, const ColorimetricCondition &condition, CieXYZ *xyz,
                   CieXYZ *white)
{
    const QVector<double> values = spectrum.spectralValues();
    QString problem;
    if (values.isEmpty()) {
        problem = QStringLiteral("the spectrum is empty");
    } else {
        for (double v : values) {
            if (!std::isfinite(v)) {
                problem = QStringLiteral("the spectrum holds a value that is not a number");
                break;
            }
        }
    }
    std::shared_ptr<const SpectralWeights> weights;
    if (problem.isEmpty()) {
        if (SpectralWeights::illuminantName(condition.illuminant()).isEmpty()
            || SpectralWeights::observerName(condition.observer()).isEmpty()) {
            problem = QStringLiteral("unknown colorimetric condition \"%1\"").arg(condition.toString());
        } else {
            weights = weightsFor(condition, spectrum.startWavelength(), spectrum.wavelengthInterval(),
                                 values.size());
            if (!weights) {
                problem = QStringLiteral("unusable wavelength grid (start %1 nm, interval %2 nm, %3 values)")
                              .arg(spectrum.startWavelength())
                              .arg(spectrum.wavelengthInterval())
                              .arg(values.size());
            } else if (weights->unmeasuredShare() > SpectralWeights::maximumUnmeasuredShare) {
                problem = QStringLiteral("the wavelength grid (%1-%2 nm) leaves %3% of the colour matching weight "
                                         "of 360-830 nm unmeasured")
                              .arg(spectrum.startWavelength())
                              .arg(spectrum.startWavelength() + spectrum.wavelengthInterval() * (values.size() - 1))
                              .arg(qRound(weights->unmeasuredShare() * 100.0));
            }
        }
    }
    if (!problem.isEmpty()) {
        Logger::instance().error(LogCategory::Colorimetry,
                                 QStringLiteral("ColorConverter: no colour for the spectrum at %1: %2")
                                     .arg(spectrum.physicalCondition().geometry(), problem));
        return false;
    }
    *xyz = weights->tristimulus(values.constData());
    *white = weights->whitePoint();
    return true;
}

/// White of a condition for values that carry no wavelength grid (L*a*b*, XYZ values).
bool conditionWhite(const ColorimetricCondition &condition, CieXYZ *white)
{
    const auto weights = weightsFor(condition, 360.0, 1.0, 471);
    if (!weights)
        return false;
    *white = weights->whitePoint();
    return true;
}

} // namespace

LabValue ColorConverter::toLabValue(const AppearanceValues &values, const Geometry &geometry,
                                    const ColorimetricCondition &condition)
{
    if (!geometry.isValid())
        return LabValue();
    if (const std::shared_ptr<ReflectanceSpectrum> spectrum = values.reflectanceAt(geometry))
        return toLab(*spectrum, condition);
    for (const std::shared_ptr<ColorValues> &colorValues : values.colorValues()) {
        if (!colorValues || colorValues->geometry() != geometry)
            continue;
        if (const auto lab = std::dynamic_pointer_cast<LabValue>(colorValues)) {
            if (lab->colorimetricCondition() == condition)
                return *lab;
        } else if (const auto lch = std::dynamic_pointer_cast<LChValue>(colorValues)) {
            if (lch->colorimetricCondition() == condition)
                return toLab(*lch);
        }
    }
    return LabValue();
}

LabValue ColorConverter::toLab(const ReflectanceSpectrum &spectrum, const ColorimetricCondition &condition)
{
    CieXYZ xyz;
    CieXYZ white;
    if (!spectrumToXyz(spectrum, condition, &xyz, &white))
        return LabValue();
    const CieLab lab = ColorSpaceConversion::xyzToLab(xyz, white);
    LabValue result(lab.L, lab.a, lab.b, condition);
    result.setPhysicalCondition(spectrum.physicalCondition());
    return result;
}

LabValue ColorConverter::toLab(const LChValue &lch)
{
    if (!lch.isValid())
        return LabValue();
    const CieLab lab = ColorSpaceConversion::lchToLab(CieLCh{lch.l(), lch.c(), lch.h()});
    LabValue result(lab.L, lab.a, lab.b, lch.colorimetricCondition());
    result.setPhysicalCondition(lch.physicalCondition());
    return result;
}

LChValue ColorConverter::toLCh(const LabValue &lab)
{
    if (!lab.isValid())
        return LChValue();
    const CieLCh lch = ColorSpaceConversion::labToLCh(CieLab{lab.l(), lab.a(), lab.b()});
    LChValue result(lch.L, lch.C, lch.h, lab.colorimetricCondition());
    result.setPhysicalCondition(lab.physicalCondition());
    return result;
}

LChValue ColorConverter::toLCh(const ReflectanceSpectrum &spectrum, const ColorimetricCondition &condition)
{
    return toLCh(toLab(spectrum, condition));
}

XYZValue ColorConverter::toXYZ(const ReflectanceSpectrum &spectrum, const ColorimetricCondition &condition)
{
    CieXYZ xyz;
    CieXYZ white;
    if (!spectrumToXyz(spectrum, condition, &xyz, &white))
        return XYZValue();
    XYZValue result(xyz.X, xyz.Y, xyz.Z, condition);
    result.setPhysicalCondition(spectrum.physicalCondition());
    return result;
}

XYZValue ColorConverter::whitePoint(const ColorimetricCondition &condition)
{
    CieXYZ white;
    if (!conditionWhite(condition, &white))
        return XYZValue();
    return XYZValue(white.X, white.Y, white.Z, condition);
}

RGBValue ColorConverter::toRGB(const LabValue &lab)
{
    CieXYZ white;
    if (!lab.isValid() || !conditionWhite(lab.colorimetricCondition(), &white))
        return RGBValue();
    const auto rgb = ColorSpaceConversion::labToSrgb(CieLab{lab.l(), lab.a(), lab.b()}, white);
    return RGBValue(rgb[0], rgb[1], rgb[2]);
}

RGBValue ColorConverter::toRGB(const XYZValue &xyz)
{
    CieXYZ white;
    if (!xyz.isValid() || !conditionWhite(xyz.colorimetricCondition(), &white))
        return RGBValue();
    const auto rgb = ColorSpaceConversion::xyzToSrgb(CieXYZ{xyz.x(), xyz.y(), xyz.z()}, white);
    return RGBValue(rgb[0], rgb[1], rgb[2]);
}

} // namespace vexa
