#pragma once

#include <vexa/vexa_export.h>

#include <QString>

#include <vector>

namespace vexa {

class LabValue;

// The coordinate systems a colour table can show.
enum class EColorSpace {
    None,
    CIELab,   // L*, a*, b*
    CIELCh,   // L*, C*, h°
    CIELabCh, // L*, a*, b*, C*, h°
};

// One colour coordinate, i.e. one column of a colour table.
enum class EColorSpaceCoordinate {
    L,
    a,
    b,
    C,
    h,
};

// The colour-difference metrics a table, trend plot or box plot can show.
// Each one is either the total difference of a formula or a component of the
// CIELAB difference.
enum class EColorSpaceDelta {
    dECIELab,
    dL,
    da,
    db,
    dC,
    dH,
    dE94,
    dECMC,
    dE2000,
    dE99,
    dE99o,
};

// What part of a colour difference a metric reports.
enum class EColorDifferenceComponent {
    Total, // the formula's total difference
    L,
    a,
    b,
    C,
    H,
};

// "CIELab", "CIELCh", "CIELabCh", "None".
VEXA_EXPORT QString colorSpaceName(EColorSpace colorSpace);
// Exact, case-sensitive match of the names above.
VEXA_EXPORT bool didGetColorSpaceForName(const QString &name, EColorSpace &colorSpace);
// The coordinates a system consists of, in column order; empty for None.
VEXA_EXPORT std::vector<EColorSpaceCoordinate> colorSpaceCoordinates(EColorSpace colorSpace);

// Column names of the coordinates: "L*", "a*", "b*", "C*", "h°".
VEXA_EXPORT QString colorSpaceCoordinateName(EColorSpaceCoordinate coordinate);
// Column names of the standard's coordinates: "Std_L*", "Std_a*", "Std_b*", "Std_C*", "Std_h°".
VEXA_EXPORT QString standardColorSpaceCoordinateName(EColorSpaceCoordinate coordinate);
VEXA_EXPORT bool didGetColorSpaceCoordinateForName(const QString &name, EColorSpaceCoordinate &coordinate);
VEXA_EXPORT bool didGetStandardColorSpaceCoordinateForName(const QString &name, EColorSpaceCoordinate &coordinate);
// The coordinate of a L*a*b* value (C* and h° derived from a* and b*); NaN for an invalid value.
VEXA_EXPORT double colorSpaceCoordinateValue(EColorSpaceCoordinate coordinate, const LabValue &lab);

// Every metric, in the order they are offered to the user.
VEXA_EXPORT std::vector<EColorSpaceDelta> availableColorSpaceDeltas();
// The stored name of a metric: "dECIELab", "dL", "da", "db", "dC", "dH", "dE94", "dECMC",
// "dE2000", "dE99", "dE99o".
VEXA_EXPORT QString colorSpaceDeltaName(EColorSpaceDelta delta);
// The text shown for a metric ("ΔE*ab", "ΔL*", ...), translated.
VEXA_EXPORT QString colorSpaceDeltaDisplayName(EColorSpaceDelta delta);
VEXA_EXPORT bool didGetColorSpaceDeltaForName(const QString &name, EColorSpaceDelta &delta);
// The ColorDifferenceCalculator formula a metric is computed with ("CIELab", "CIE94", "CMC",
// "CIE2000", "DIN99", "DIN99o"); the components of the CIELAB difference use "CIELab".
VEXA_EXPORT QString colorSpaceDeltaFormula(EColorSpaceDelta delta);
VEXA_EXPORT EColorDifferenceComponent colorSpaceDeltaComponent(EColorSpaceDelta delta);
// The metric of a trial against a standard (trial minus standard) with the formula weights
// (l, c, h). NaN when either value is invalid.
VEXA_EXPORT double colorSpaceDeltaValue(EColorSpaceDelta delta, const LabValue &standard, const LabValue &trial,
                                        double l = 1.0, double c = 1.0, double h = 1.0);

} // namespace vexa
