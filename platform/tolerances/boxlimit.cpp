#include <tolerances/boxlimit.h>

#include <cmath>
#include <limits>
#include <utility>

namespace vexa {

double BoxLimit::normalized(double delta, double lower, double upper)
{
    if (std::isnan(delta) || std::isnan(lower) || std::isnan(upper))
        return std::numeric_limits<double>::quiet_NaN();
    if (isDisabled(lower, upper))
        return 0.0;
    order(&lower, &upper);
    const double reference = (lower <= 0.0 && 0.0 <= upper) ? 0.0 : 0.5 * (lower + upper);
    const double offset = delta - reference;
    if (offset == 0.0)
        return 0.0;
    const double side = offset > 0.0 ? upper - reference : lower - reference;
    if (side == 0.0 || (offset > 0.0) != (side > 0.0))
        return std::numeric_limits<double>::infinity();
    return offset / side;
}

void BoxLimit::order(double *lower, double *upper)
{
    if (*lower > *upper)
        std::swap(*lower, *upper);
}

} // namespace vexa
