#include "colorspace.h"

#include <colorimetry/colorconverter.h>
#include <colorimetry/colordifferencecalculator.h>

#include <domain/labvalue.h>

#include <QCoreApplication>

#include <cmath>
#include <limits>
#include <stdexcept>

namespace vexa {

namespace {

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

const char *const kTranslationContext = "vexa::ColorCompareSettings";

struct DeltaInfo
{
    EColorSpaceDelta delta;
    const char *name;
    const char *displayName;
    const char *formula;
    EColorDifferenceComponent component;
};

// The order of this table is the order the metrics are offered in.
const DeltaInfo kDeltas[] = {
    {EColorSpaceDelta::dECIELab, "dECIELab", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394E*ab"), "CIELab",
     EColorDifferenceComponent::Total},
    {EColorSpaceDelta::dL, "dL", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394L*"), "CIELab",
     EColorDifferenceComponent::L},
    {EColorSpaceDelta::da, "da", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394a*"), "CIELab",
     EColorDifferenceComponent::a},
    {EColorSpaceDelta::db, "db", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394b*"), "CIELab",
     EColorDifferenceComponent::b},
    {EColorSpaceDelta::dC, "dC", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394C*"), "CIELab",
     EColorDifferenceComponent::C},
    {EColorSpaceDelta::dH, "dH", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394H*"), "CIELab",
     EColorDifferenceComponent::H},
    {EColorSpaceDelta::dE94, "dE94", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394E94"), "CIE94",
     EColorDifferenceComponent::Total},
    {EColorSpaceDelta::dECMC, "dECMC", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394E CMC"), "CMC",
     EColorDifferenceComponent::Total},
    {EColorSpaceDelta::dE2000, "dE2000", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394E00"), "CIE2000",
     EColorDifferenceComponent::Total},
    {EColorSpaceDelta::dE99, "dE99", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394E99"), "DIN99",
     EColorDifferenceComponent::Total},
    {EColorSpaceDelta::dE99o, "dE99o", QT_TRANSLATE_NOOP("vexa::ColorCompareSettings", "\u0394E99o"), "DIN99o",
     EColorDifferenceComponent::Total},
};

const DeltaInfo *deltaInfo(EColorSpaceDelta delta)
{
    for (const DeltaInfo &info : kDeltas)
        if (info.delta == delta)
            return &info;
    return nullptr;
}

struct CoordinateInfo
{
    EColorSpaceCoordinate coordinate;
    const char *name;
};

const CoordinateInfo kCoordinates[] = {
    {EColorSpaceCoordinate::L, "L*"}, {EColorSpaceCoordinate::a, "a*"}, {EColorSpaceCoordinate::b, "b*"},
    {EColorSpaceCoordinate::C, "C*"}, {EColorSpaceCoordinate::h, "h\u00B0"},
};

const QString &standardPrefix()
{
    static const QString prefix = QStringLiteral("Std_");
    return prefix;
}

} // namespace

QString colorSpaceName(EColorSpace colorSpace)
{
    switch (colorSpace) {
    case EColorSpace::CIELab:
        return QStringLiteral("CIELab");
    case EColorSpace::CIELCh:
        return QStringLiteral("CIELCh");
    case EColorSpace::CIELabCh:
        return QStringLiteral("CIELabCh");
    case EColorSpace::None:
        break;
    }
    return QStringLiteral("None");
}

bool didGetColorSpaceForName(const QString &name, EColorSpace &colorSpace)
{
    for (EColorSpace candidate :
         {EColorSpace::CIELab, EColorSpace::CIELCh, EColorSpace::CIELabCh, EColorSpace::None}) {
        if (colorSpaceName(candidate) == name) {
            colorSpace = candidate;
            return true;
        }
    }
    return false;
}

std::vector<EColorSpaceCoordinate> colorSpaceCoordinates(EColorSpace colorSpace)
{
    using C = EColorSpaceCoordinate;
    switch (colorSpace) {
    case EColorSpace::CIELab:
        return {C::L, C::a, C::b};
    case EColorSpace::CIELCh:
        return {C::L, C::C, C::h};
    case EColorSpace::CIELabCh:
        return {C::L, C::a, C::b, C::C, C::h};
    case EColorSpace::None:
        break;
    }
    return {};
}

QString colorSpaceCoordinateName(EColorSpaceCoordinate coordinate)
{
    for (const CoordinateInfo &info : kCoordinates)
        if (info.coordinate == coordinate)
            return QString::fromUtf8(info.name);
    return QString();
}

QString standardColorSpaceCoordinateName(EColorSpaceCoordinate coordinate)
{
    const QString name = colorSpaceCoordinateName(coordinate);
    return name.isEmpty() ? name : standardPrefix() + name;
}

bool didGetColorSpaceCoordinateForName(const QString &name, EColorSpaceCoordinate &coordinate)
{
    for (const CoordinateInfo &info : kCoordinates) {
        if (name == QString::fromUtf8(info.name)) {
            coordinate = info.coordinate;
            return true;
        }
    }
    return false;
}

bool didGetStandardColorSpaceCoordinateForName(const QString &name, EColorSpaceCoordinate &coordinate)
{
    if (!name.startsWith(standardPrefix()))
        return false;
    return didGetColorSpaceCoordinateForName(name.mid(standardPrefix().size()), coordinate);
}

double colorSpaceCoordinateValue(EColorSpaceCoordinate coordinate, const LabValue &lab)
{
    if (!lab.isValid())
        return kNaN;
    switch (coordinate) {
    case EColorSpaceCoordinate::L:
        return lab.l();
    case EColorSpaceCoordinate::a:
        return lab.a();
    case EColorSpaceCoordinate::b:
        return lab.b();
    case EColorSpaceCoordinate::C:
        return ColorConverter::toLCh(lab).c();
    case EColorSpaceCoordinate::h:
        return ColorConverter::toLCh(lab).h();
    }
    return kNaN;
}

std::vector<EColorSpaceDelta> availableColorSpaceDeltas()
{
    std::vector<EColorSpaceDelta> deltas;
    for (const DeltaInfo &info : kDeltas)
        deltas.push_back(info.delta);
    return deltas;
}

QString colorSpaceDeltaName(EColorSpaceDelta delta)
{
    const DeltaInfo *info = deltaInfo(delta);
    return info ? QString::fromLatin1(info->name) : QString();
}

QString colorSpaceDeltaDisplayName(EColorSpaceDelta delta)
{
    const DeltaInfo *info = deltaInfo(delta);
    return info ? QCoreApplication::translate(kTranslationContext, info->displayName) : QString();
}

bool didGetColorSpaceDeltaForName(const QString &name, EColorSpaceDelta &delta)
{
    for (const DeltaInfo &info : kDeltas) {
        if (name == QLatin1String(info.name)) {
            delta = info.delta;
            return true;
        }
    }
    return false;
}

QString colorSpaceDeltaFormula(EColorSpaceDelta delta)
{
    const DeltaInfo *info = deltaInfo(delta);
    return info ? QString::fromLatin1(info->formula) : QString();
}

EColorDifferenceComponent colorSpaceDeltaComponent(EColorSpaceDelta delta)
{
    const DeltaInfo *info = deltaInfo(delta);
    return info ? info->component : EColorDifferenceComponent::Total;
}

double colorSpaceDeltaValue(EColorSpaceDelta delta, const LabValue &standard, const LabValue &trial, double l,
                            double c, double h)
{
    const DeltaInfo *info = deltaInfo(delta);
    if (!info || !standard.isValid() || !trial.isValid())
        return kNaN;
    switch (info->component) {
    case EColorDifferenceComponent::L:
        return ColorDifferenceCalculator::Delta_L(standard, trial);
    case EColorDifferenceComponent::a:
        return ColorDifferenceCalculator::Delta_a(standard, trial);
    case EColorDifferenceComponent::b:
        return ColorDifferenceCalculator::Delta_b(standard, trial);
    case EColorDifferenceComponent::C:
        return ColorDifferenceCalculator::Delta_C(standard, trial);
    case EColorDifferenceComponent::H:
        return ColorDifferenceCalculator::Delta_H(standard, trial, l, c, h);
    case EColorDifferenceComponent::Total:
        break;
    }
    try {
        return ColorDifferenceCalculator::Default_DE(QString::fromLatin1(info->formula), standard, trial, l, c, h);
    } catch (const std::invalid_argument &) {
        return kNaN;
    }
}

} // namespace vexa
