#include <colorimetry/colorindicescalculator.h>

#include <domain/labvalue.h>

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

} // namespace vexa
