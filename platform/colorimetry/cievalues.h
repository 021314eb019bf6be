#pragma once

// Plain colour triples used by the computing core of the colorimetry library. They carry no
// conditions and no identity, so the maths can be tested and run without domain objects.

namespace vexa {

struct CieXYZ
{
    double X = 0.0;
    double Y = 0.0;
    double Z = 0.0;
};

struct CieLab
{
    double L = 0.0;
    double a = 0.0;
    double b = 0.0;
};

/// L*, C*ab and the hue angle h in degrees, [0, 360).
struct CieLCh
{
    double L = 0.0;
    double C = 0.0;
    double h = 0.0;
};

} // namespace vexa
