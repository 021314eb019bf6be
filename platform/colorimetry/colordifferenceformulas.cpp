#include <colorimetry/colordifferenceformulas.h>

#include <colorimetry/colorspaceconversion.h>

#include <algorithm>
#include <cmath>

namespace vexa {

namespace {

constexpr double kPi = 3.14159265358979323846;

double radians(double degrees)
{
    return degrees * kPi / 180.0;
}

double chroma(const CieLab &lab)
{
    return std::hypot(lab.a, lab.b);
}

double pow7(double x)
{
    const double x2 = x * x;
    return x2 * x2 * x2 * x;
}

ColorDifferenceFormulas::Result euclidean(const CieLab &standard, const CieLab &trial)
{
    ColorDifferenceFormulas::Result r;
    r.lightness = trial.L - standard.L;
    r.chroma = chroma(trial) - chroma(standard);
    r.hue = ColorSpaceConversion::signedDeltaH(standard.a, standard.b, trial.a, trial.b);
    const double da = trial.a - standard.a;
    const double db = trial.b - standard.b;
    r.dE = std::sqrt(r.lightness * r.lightness + da * da + db * db);
    return r;
}

} // namespace

ColorDifferenceFormulas::Result ColorDifferenceFormulas::cie76(const CieLab &standard, const CieLab &trial)
{
    return euclidean(standard, trial);
}

ColorDifferenceFormulas::Result ColorDifferenceFormulas::cie94(const CieLab &standard, const CieLab &trial,
                                                                double kL, double kC, double kH, double k1,
                                                                double k2, ChromaReference reference)
{
    // lcms2's cmsCIE94DeltaE fixes the textile constants and the geometric-mean chroma, so the
    // CIE 116 form with the standard's chroma and selectable constants is written out here.
    const Result cielab = euclidean(standard, trial);
    const double c = reference == ChromaReference::Standard ? chroma(standard)
                                                            : std::sqrt(chroma(standard) * chroma(trial));
    const double sl = 1.0;
    const double sc = 1.0 + k1 * c;
    const double sh = 1.0 + k2 * c;
    Result r;
    r.lightness = cielab.lightness / (kL * sl);
    r.chroma = cielab.chroma / (kC * sc);
    r.hue = cielab.hue / (kH * sh);
    r.dE = std::sqrt(r.lightness * r.lightness + r.chroma * r.chroma + r.hue * r.hue);
    return r;
}

ColorDifferenceFormulas::Result ColorDifferenceFormulas::cmc(const CieLab &standard, const CieLab &trial, double l,
                                                              double c)
{
    // lcms2's cmsCMCdeltaE returns 0 whenever both L* are 0 and uses open hue bounds (164, 345);
    // the published formula has closed bounds, and the parts are needed for tolerances.
    const Result cielab = euclidean(standard, trial);
    const double cs = chroma(standard);
    const double hs = ColorSpaceConversion::hueAngle(standard.a, standard.b);
    const double sl = standard.L < 16.0 ? 0.511 : 0.040975 * standard.L / (1.0 + 0.01765 * standard.L);
    const double sc = 0.0638 * cs / (1.0 + 0.0131 * cs) + 0.638;
    const double c4 = cs * cs * cs * cs;
    const double f = std::sqrt(c4 / (c4 + 1900.0));
    const double t = (hs >= 164.0 && hs <= 345.0) ? 0.56 + std::fabs(0.2 * std::cos(radians(hs + 168.0)))
                                                  : 0.36 + std::fabs(0.4 * std::cos(radians(hs + 35.0)));
    const double sh = sc * (f * t + 1.0 - f);
    Result r;
    r.lightness = cielab.lightness / (l * sl);
    r.chroma = cielab.chroma / (c * sc);
    r.hue = cielab.hue / sh;
    r.dE = std::sqrt(r.lightness * r.lightness + r.chroma * r.chroma + r.hue * r.hue);
    return r;
}

ColorDifferenceFormulas::Result ColorDifferenceFormulas::ciede2000(const CieLab &standard, const CieLab &trial,
                                                                    double kL, double kC, double kH)
{
    // Written out (rather than lcms2's cmsCIE2000DeltaE) because tolerances report the three weighted
    // parts; the value agrees with lcms2 and with the Sharma test data.
    const CieLab &s = standard;
    const CieLab &t = trial;
    const double cBar = 0.5 * (chroma(s) + chroma(t));
    const double cBar7 = pow7(cBar);
    const double g = 0.5 * (1.0 - std::sqrt(cBar7 / (cBar7 + pow7(25.0))));
    const double a1 = (1.0 + g) * s.a;
    const double a2 = (1.0 + g) * t.a;
    const double c1 = std::hypot(a1, s.b);
    const double c2 = std::hypot(a2, t.b);
    const double h1 = ColorSpaceConversion::hueAngle(a1, s.b);
    const double h2 = ColorSpaceConversion::hueAngle(a2, t.b);

    const double dL = t.L - s.L;
    const double dC = c2 - c1;
    const double cProduct = c1 * c2;
    double dh = 0.0;
    if (cProduct != 0.0) {
        dh = h2 - h1;
        if (dh > 180.0)
            dh -= 360.0;
        else if (dh < -180.0)
            dh += 360.0;
    }
    const double dH = 2.0 * std::sqrt(cProduct) * std::sin(radians(dh) / 2.0);

    const double lBar = 0.5 * (s.L + t.L);
    const double cBarPrime = 0.5 * (c1 + c2);
    double hBar = h1 + h2;
    if (cProduct != 0.0) {
        if (std::fabs(h1 - h2) <= 180.0)
            hBar = 0.5 * (h1 + h2);
        else if (h1 + h2 < 360.0)
            hBar = 0.5 * (h1 + h2 + 360.0);
        else
            hBar = 0.5 * (h1 + h2 - 360.0);
    }
    const double tt = 1.0 - 0.17 * std::cos(radians(hBar - 30.0)) + 0.24 * std::cos(radians(2.0 * hBar))
        + 0.32 * std::cos(radians(3.0 * hBar + 6.0)) - 0.20 * std::cos(radians(4.0 * hBar - 63.0));
    const double dTheta = 30.0 * std::exp(-std::pow((hBar - 275.0) / 25.0, 2.0));
    const double cBarPrime7 = pow7(cBarPrime);
    const double rc = 2.0 * std::sqrt(cBarPrime7 / (cBarPrime7 + pow7(25.0)));
    const double rt = -std::sin(radians(2.0 * dTheta)) * rc;
    const double l50 = (lBar - 50.0) * (lBar - 50.0);
    const double sl = 1.0 + 0.015 * l50 / std::sqrt(20.0 + l50);
    const double sc = 1.0 + 0.045 * cBarPrime;
    const double sh = 1.0 + 0.015 * cBarPrime * tt;

    Result r;
    r.lightness = dL / (kL * sl);
    r.chroma = dC / (kC * sc);
    r.hue = dH / (kH * sh);
    const double sum = r.lightness * r.lightness + r.chroma * r.chroma + r.hue * r.hue + rt * r.chroma * r.hue;
    r.dE = std::sqrt(std::max(0.0, sum));
    return r;
}

CieLab ColorDifferenceFormulas::toDin99(const CieLab &lab, double kE, double kCH)
{
    const double cos16 = std::cos(radians(16.0));
    const double sin16 = std::sin(radians(16.0));
    const double e = lab.a * cos16 + lab.b * sin16;
    const double f = 0.7 * (-lab.a * sin16 + lab.b * cos16);
    const double g = std::hypot(e, f);
    const double c99 = std::log(1.0 + 0.045 * g) / (0.045 * kCH * kE);
    const double h99 = std::atan2(f, e);
    return CieLab{105.51 * std::log(1.0 + 0.0158 * lab.L) / kE, c99 * std::cos(h99), c99 * std::sin(h99)};
}

CieLab ColorDifferenceFormulas::toDin99o(const CieLab &lab, double kE, double kCH)
{
    const double cos26 = std::cos(radians(26.0));
    const double sin26 = std::sin(radians(26.0));
    const double e = lab.a * cos26 + lab.b * sin26;
    const double f = 0.83 * (-lab.a * sin26 + lab.b * cos26);
    const double g = std::hypot(e, f);
    const double c99 = std::log(1.0 + 0.075 * g) / (0.0435 * kCH * kE);
    const double h99 = std::atan2(f, e) + radians(26.0);
    return CieLab{303.67 * std::log(1.0 + 0.0039 * lab.L) / kE, c99 * std::cos(h99), c99 * std::sin(h99)};
}

ColorDifferenceFormulas::Result ColorDifferenceFormulas::din99(const CieLab &standard, const CieLab &trial,
                                                                double kE, double kCH)
{
    return euclidean(toDin99(standard, kE, kCH), toDin99(trial, kE, kCH));
}

ColorDifferenceFormulas::Result ColorDifferenceFormulas::din99o(const CieLab &standard, const CieLab &trial,
                                                                 double kE, double kCH)
{
    return euclidean(toDin99o(standard, kE, kCH), toDin99o(trial, kE, kCH));
}

} // namespace vexa
