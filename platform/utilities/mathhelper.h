#pragma once

#include <utilities/utilities_export.h>

#include <QPointF>

namespace vexa {

class VEXA_UTILITIES_EXPORT MathHelper
{
public:
    // Polar (radius, angle in degrees, counter-clockwise from +x) to Cartesian (x, y).
    static QPointF toCarthesianDeg(double radius, double degrees);
    static double toDegree(double radians);
    static double toRadiant(double degrees);
    // Rounds half away from zero to the given number of decimals; NaN and infinities pass through.
    static double roundDouble(double value, int decimals);
    // Maps any angle in degrees into [0, 360).
    static double normalizeDegrees(double degrees);
};

} // namespace vexa
