#include <colorimetry/colordifferencecalculator.h>

#include <colorimetry/colordifferenceformulas.h>

#include <domain/labvalue.h>

#include <utilities/logger.h>

#include <cmath>
#include <limits>
#include <stdexcept>

namespace vexa {

namespace {

enum class Formula { CIELab, CIE94, CMC, CIE2000, DIN99, DIN99o, Unknown };

Formula formulaOf(const QString &name)
{
    const QString n = name.trimmed();
    if (n.compare(QLatin1String("CIELab"), Qt::CaseInsensitive) == 0
        || n.compare(QLatin1String("CIE1976"), Qt::CaseInsensitive) == 0
        || n.compare(QLatin1String("CIE76"), Qt::CaseInsensitive) == 0)
        return Formula::CIELab;
    if (n.compare(QLatin1String("CIE94"), Qt::CaseInsensitive) == 0)
        return Formula::CIE94;
    if (n.compare(QLatin1String("CMC"), Qt::CaseInsensitive) == 0)
        return Formula::CMC;
    if (n.compare(QLatin1String("CIE2000"), Qt::CaseInsensitive) == 0
        || n.compare(QLatin1String("CIEDE2000"), Qt::CaseInsensitive) == 0)
        return Formula::CIE2000;
    if (n.compare(QLatin1String("DIN99"), Qt::CaseInsensitive) == 0)
        return Formula::DIN99;
    if (n.compare(QLatin1String("DIN99o"), Qt::CaseInsensitive) == 0)
        return Formula::DIN99o;
    return Formula::Unknown;
}

CieLab toCie(const LabValue &lab)
{
    return CieLab{lab.l(), lab.a(), lab.b()};
}

// Both values numbers, and measured under the same illuminant and observer: L*a*b* values of
// different conditions have different whites and no difference between them means anything.
bool usable(const LabValue &lab1, const LabValue &lab2)
{
    if (!lab1.isValid() || !lab2.isValid())
        return false;
    if (lab1.colorimetricCondition() != lab2.colorimetricCondition()) {
        Logger::instance().warning(LogCategory::Colorimetry,
                                   QStringLiteral("ColorDifferenceCalculator: no difference between %1 and %2: "
                                                  "the colorimetric conditions differ")
                                       .arg(lab1.toString(), lab2.toString()));
        return false;
    }
    return true;
}

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

} // namespace

QStringList ColorDifferenceCalculator::formulaNames()
{
    return {QStringLiteral("CIELab"), QStringLiteral("CIE94"), QStringLiteral("CMC"), QStringLiteral("CIE2000"),
            QStringLiteral("DIN99"), QStringLiteral("DIN99o")};
}

bool ColorDifferenceCalculator::isKnownFormula(const QString &formula)
{
    return formulaOf(formula) != Formula::Unknown;
}

double ColorDifferenceCalculator::Default_DE(const QString &formula, const LabValue &lab1, const LabValue &lab2,
                                             double l, double c, double h)
{
    const Formula kind = formulaOf(formula);
    if (kind == Formula::Unknown) {
        throw std::invalid_argument(
            QStringLiteral("Unknown colour-difference formula \"%1\" (known: %2)")
                .arg(formula, formulaNames().join(QStringLiteral(", ")))
                .toStdString());
    }
    if (!usable(lab1, lab2))
        return kNaN;
    const CieLab s = toCie(lab1);
    const CieLab t = toCie(lab2);
    switch (kind) {
    case Formula::CIELab: return ColorDifferenceFormulas::cie76(s, t).dE;
    case Formula::CIE94: return ColorDifferenceFormulas::cie94(s, t, l, c, h).dE;
    case Formula::CMC: return ColorDifferenceFormulas::cmc(s, t, l, c).dE;
    case Formula::CIE2000: return ColorDifferenceFormulas::ciede2000(s, t, l, c, h).dE;
    case Formula::DIN99: return ColorDifferenceFormulas::din99(s, t, l, c).dE;
    case Formula::DIN99o: return ColorDifferenceFormulas::din99o(s, t, l, c).dE;
    case Formula::Unknown: break;
    }
    return kNaN;
}

double ColorDifferenceCalculator::Delta_L(const LabValue &lab1, const LabValue &lab2)
{
    return usable(lab1, lab2) ? lab2.l() - lab1.l() : kNaN;
}

double ColorDifferenceCalculator::Delta_a(const LabValue &lab1, const LabValue &lab2)
{
    return usable(lab1, lab2) ? lab2.a() - lab1.a() : kNaN;
}

double ColorDifferenceCalculator::Delta_b(const LabValue &lab1, const LabValue &lab2)
{
    return usable(lab1, lab2) ? lab2.b() - lab1.b() : kNaN;
}

double ColorDifferenceCalculator::Delta_C(const LabValue &lab1, const LabValue &lab2)
{
    return usable(lab1, lab2) ? std::hypot(lab2.a(), lab2.b()) - std::hypot(lab1.a(), lab1.b()) : kNaN;
}

double ColorDifferenceCalculator::Delta_H(const LabValue &lab1, const LabValue &lab2, double l, double c, double h)
{
    Q_UNUSED(l)
    Q_UNUSED(c)
    if (!usable(lab1, lab2))
        return kNaN;
    return ColorDifferenceFormulas::cie76(toCie(lab1), toCie(lab2)).hue / h;
}

double ColorDifferenceCalculator::Delta_E(const LabValue &lab1, const LabValue &lab2)
{
    return usable(lab1, lab2) ? ColorDifferenceFormulas::cie76(toCie(lab1), toCie(lab2)).dE : kNaN;
}

} // namespace vexa
