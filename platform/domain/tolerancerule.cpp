#include "tolerancerule.h"

#include "tolerance.h"

#include <cmath>

namespace vexa {

ToleranceRule::~ToleranceRule() = default;

QString ToleranceRule::validate(const Tolerance &tolerance) const
{
    const double pass = tolerance.passThreshold();
    const double check = tolerance.checkThreshold();
    if (!std::isfinite(pass) || pass <= 0.0)
        return QStringLiteral("%1: the pass threshold (%2) must be a number above 0.")
            .arg(tolerance.describe(), QString::number(pass));
    if (!std::isfinite(check) || check < 0.0)
        return QStringLiteral("%1: the check threshold (%2) must be a number of 0 or more.")
            .arg(tolerance.describe(), QString::number(check));
    if (check > pass)
        return QStringLiteral("%1: the check threshold (%2) is above the pass threshold (%3).")
            .arg(tolerance.describe(), QString::number(check), QString::number(pass));
    return QString();
}

} // namespace vexa
