#include "mathhelper.h"

#include <cmath>

namespace vexa {

namespace {
constexpr double kPi = 3.14159265358979323846;
}

QPointF MathHelper::toCarthesianDeg(double radius, double degrees)
{
    const double rad = toRadiant(degrees);
    return QPointF(radius * std::cos(rad), radius * std::sin(rad));
}

double MathHelper::toDegree(double radians)
{
    return radians * 180.0 / kPi;
}

double MathHelper::toRadiant(double degrees)
{
    return degrees * kPi / 180.0;
}

double MathHelper::roundDouble(double value, int decimals)
{
    if (!std::isfinite(value))
        return value;
    const double factor = std::pow(10.0, decimals);
    const double scaled = value * factor;
    if (!std::isfinite(scaled))
        return value;
    return std::round(scaled) / factor;
}

double MathHelper::normalizeDegrees(double degrees)
{
    if (!std::isfinite(degrees))
        return degrees;
    double d = std::fmod(degrees, 360.0);
    if (d < 0)
        d += 360.0;
    if (d >= 360.0)
        d = 0.0;
    return d;
}

} // namespace vexa
