#include <tolerances/tolerancefactory.h>

#include <tolerances/boxlimit.h>
#include <tolerances/colordifferencerule.h>
#include <tolerances/effectcolorrule.h>
#include <tolerances/flopindexrule.h>
#include <tolerances/toleranceruletools.h>
#include <tolerances/tolerancetypes.h>

#include <domain/parameterchoice.h>
#include <domain/tolerance.h>
#include <domain/toleranceparameter.h>
#include <domain/toleranceruleregistry.h>
#include <domain/toleranceset.h>
#include <domain/tolerancesetparameters.h>
#include <domain/tolerancevalue.h>

#include <utilities/logger.h>

namespace vexa {

namespace {

using Type = ToleranceParameter::ParameterType;
using Parameters = std::vector<std::shared_ptr<ToleranceParameter>>;
using Values = std::vector<std::shared_ptr<ToleranceValue>>;
namespace T = ToleranceTypes;

std::shared_ptr<ToleranceValue> limitValue(const QString &name, double value)
{
    return std::make_shared<ToleranceValue>(name, name, value);
}

std::shared_ptr<ToleranceParameter> number(const QString &name, double value, bool visible = true)
{
    auto parameter = std::make_shared<ToleranceParameter>(name, name, Type::Double, value);
    parameter->setIsVisible(visible);
    parameter->setIsEditable(visible);
    return parameter;
}

std::shared_ptr<ToleranceParameter> choice(const QString &name, const QString &value,
                                           const QVector<QPair<QString, QString>> &choices, bool visible = true)
{
    auto parameter = std::make_shared<ToleranceParameter>(name, name, Type::Choice, value);
    std::vector<std::shared_ptr<ParameterChoice>> possible;
    for (const auto &c : choices)
        possible.push_back(std::make_shared<ParameterChoice>(c.first, c.second));
    parameter->setPossibleValues(possible);
    parameter->setIsVisible(visible);
    parameter->setIsEditable(visible);
    return parameter;
}

Values boxValues(std::initializer_list<const char *> axes)
{
    Values values;
    for (const char *axis : axes) {
        values.push_back(limitValue(QString::fromLatin1(axis) + QLatin1Char('-'), -1.0));
        values.push_back(limitValue(QString::fromLatin1(axis) + QLatin1Char('+'), 1.0));
    }
    return values;
}

Parameters effectParameters()
{
    Parameters p;
    for (const char *g : {"gL", "gC", "gH", "ga", "gb"})
        p.push_back(number(QString::fromLatin1(g), 1.0));
    p.push_back(choice(QStringLiteral("Form"), QStringLiteral("Effective"),
                       {{QStringLiteral("Effective"), QStringLiteral("Effective")},
                        {QStringLiteral("Polar"), QStringLiteral("Polar (L*C*H*)")},
                        {QStringLiteral("Cartesian"), QStringLiteral("Cartesian (L*a*b*)")}}));
    p.push_back(choice(QStringLiteral("Weighting reference"), QStringLiteral("Geometric mean"),
                       {{QStringLiteral("Geometric mean"), QStringLiteral("Geometric mean")},
                        {QStringLiteral("Standard"), QStringLiteral("Standard")}}));
    const std::pair<const char *, double> coefficients[] = {
        {"SL a", 0.15}, {"SL b", 31.5}, {"SC a", 0.48}, {"SC b", 0.35}, {"SC c", 42.0},  {"SH a", 0.14},
        {"SH b", 0.20}, {"SH c", 21.0}, {"SH d", 0.7},  {"S floor", 0.7}, {"Sa", 0.7},   {"Sb", 0.7},
        {"C0 base", 10.0}, {"C0 step", 8.0}, {"C0 L", 27.0}};
    for (const auto &c : coefficients)
        p.push_back(number(QString::fromLatin1(c.first), c.second, false));
    return p;
}

QVector<Geometry> geometriesOf(std::initializer_list<const char *> names)
{
    QVector<Geometry> result;
    for (const char *name : names)
        result.append(Geometry(name));
    return result;
}

const QVector<Geometry> &allGeometries()
{
    static const QVector<Geometry> geometries = geometriesOf(
        {Geometry::ANGLE_45as15, Geometry::ANGLE_45as25, Geometry::ANGLE_45as45, Geometry::ANGLE_45as75,
         Geometry::ANGLE_45as110, Geometry::ANGLE_45asN15, Geometry::ANGLE_15as15, Geometry::ANGLE_15as45,
         Geometry::ANGLE_15as80, Geometry::ANGLE_15asN15, Geometry::ANGLE_15asN30, Geometry::ANGLE_15asN45,
         Geometry::ANGLE_diffuse});
    return geometries;
}

const QVector<Geometry> &effectGeometries()
{
    static const QVector<Geometry> geometries =
        geometriesOf({Geometry::ANGLE_45as15, Geometry::ANGLE_45as25, Geometry::ANGLE_45as45, Geometry::ANGLE_45as75,
                      Geometry::ANGLE_45as110});
    return geometries;
}

// The CIE94 factors shown follow the application in force (the set-wide one rules); the rule
// itself never reads the stored numbers, so a stale number cannot change a verdict.
void applyCie94Application(Tolerance &tolerance)
{
    const ToleranceRuleTools::Cie94Application application = ToleranceRuleTools::cie94Application(tolerance);
    if (application.name.isEmpty())
        return; // Unknown: validation says so; nothing to fill in.
    if (const auto own = tolerance.toleranceParameter(QStringLiteral("Application")))
        own->setValue(application.name);
    const std::pair<const char *, double> factors[] = {
        {"kL", application.kL}, {"K1", application.K1}, {"K2", application.K2}};
    for (const auto &factor : factors) {
        if (const auto parameter = tolerance.toleranceParameter(QString::fromLatin1(factor.first)))
            parameter->setValue(factor.second);
    }
}

// A limit pair typed the wrong way round is stored the right way round.
void orderBoxLimits(Tolerance &tolerance)
{
    for (const auto &value : tolerance.toleranceValues()) {
        if (!value || !value->name().endsWith(QLatin1Char('-')))
            continue;
        const QString axis = value->name().chopped(1);
        const auto upper = tolerance.toleranceValue(axis + QLatin1Char('+'));
        if (!upper)
            continue;
        double low = value->valueAsDouble();
        double high = upper->valueAsDouble();
        BoxLimit::order(&low, &high);
        value->setValue(low);
        upper->setValue(high);
    }
}

} // namespace

ToleranceFactory *ToleranceFactory::toleranceFactory()
{
    static ToleranceFactory *const factory = new ToleranceFactory;
    return factory;
}

ToleranceFactory::ToleranceFactory()
{
    auto &registry = ToleranceRuleRegistry::instance();
    using K = ColorDifferenceRule::Kind;
    registry.registerRule(T::CIELabBox, std::make_shared<ColorDifferenceRule>(K::LabBox));
    registry.registerRule(T::CIELChBox, std::make_shared<ColorDifferenceRule>(K::LChBox));
    registry.registerRule(T::CIELabDE, std::make_shared<ColorDifferenceRule>(K::CIELab));
    registry.registerRule(T::CIE94, std::make_shared<ColorDifferenceRule>(K::CIE94));
    registry.registerRule(T::CMC, std::make_shared<ColorDifferenceRule>(K::CMC));
    registry.registerRule(T::CIEDE2000, std::make_shared<ColorDifferenceRule>(K::CIEDE2000));
    registry.registerRule(T::DIN99, std::make_shared<ColorDifferenceRule>(K::DIN99));
    registry.registerRule(T::DIN99o, std::make_shared<ColorDifferenceRule>(K::DIN99o));
    registry.registerRule(T::DIN6175_2, std::make_shared<EffectColorRule>(false));
    registry.registerRule(T::Audi2000, std::make_shared<EffectColorRule>(true));
    registry.registerRule(T::FlopIndex, std::make_shared<FlopIndexRule>());
}

QStringList ToleranceFactory::allToleranceTypes() const
{
    return {T::CIELabBox, T::CIELChBox, T::CIELabDE, T::CIE94, T::CMC, T::CIEDE2000,
            T::DIN99,     T::DIN99o,    T::DIN6175_2, T::Audi2000, T::FlopIndex};
}

QStringList ToleranceFactory::allToleranceGroups() const
{
    return {T::GroupCIEL, T::GroupDIN6175_2, T::GroupAudi};
}

QString ToleranceFactory::toleranceGroup(const QString &toleranceType) const
{
    if (toleranceType == T::DIN6175_2)
        return T::GroupDIN6175_2;
    if (toleranceType == T::Audi2000)
        return T::GroupAudi;
    return isKnownType(toleranceType) ? T::GroupCIEL : QString();
}

bool ToleranceFactory::isKnownType(const QString &toleranceType) const
{
    return allToleranceTypes().contains(toleranceType);
}

QVector<Geometry> ToleranceFactory::supportedGeometries(const QString &toleranceType) const
{
    if (toleranceType == T::DIN6175_2 || toleranceType == T::Audi2000)
        return effectGeometries();
    if (toleranceType == T::FlopIndex || !isKnownType(toleranceType))
        return {};
    return allGeometries();
}

std::shared_ptr<Tolerance> ToleranceFactory::createTolerance(const QString &toleranceType,
                                                             const Geometry &geometry) const
{
    if (!isKnownType(toleranceType)) {
        Logger::instance().error(LogCategory::Colorimetry,
                                 QStringLiteral("ToleranceFactory::createTolerance: unknown tolerance type \"%1\"")
                                     .arg(toleranceType));
        return nullptr;
    }
    if (geometry.isValid() && !supportedGeometries(toleranceType).contains(geometry)) {
        Logger::instance().error(LogCategory::Colorimetry,
                                 QStringLiteral("ToleranceFactory::createTolerance: \"%1\" does not support %2")
                                     .arg(toleranceType, geometry.toString()));
        return nullptr;
    }
    auto tolerance = std::make_shared<Tolerance>();
    tolerance->setToleranceType(toleranceType);
    tolerance->setToleranceGroup(toleranceGroup(toleranceType));
    tolerance->setGeometry(geometry.isValid() ? geometry.toString() : QString());
    tolerance->setPassThreshold(1.0);
    tolerance->setCheckThreshold(0.8);

    Values values;
    Parameters parameters;
    auto weights = [&parameters](std::initializer_list<std::pair<const char *, double>> list) {
        for (const auto &w : list)
            parameters.push_back(number(QString::fromLatin1(w.first), w.second));
    };
    if (toleranceType == T::CIELabBox) {
        values = boxValues({"dL", "da", "db"});
    } else if (toleranceType == T::CIELChBox) {
        values = boxValues({"dL", "dC", "dH"});
    } else if (toleranceType == T::FlopIndex) {
        values = boxValues({"dFI"});
    } else {
        values = {limitValue(QStringLiteral("dE"), 1.0)};
        if (toleranceType == T::CIE94) {
            parameters.push_back(choice(QStringLiteral("Application"), QStringLiteral("Graphic arts"),
                                        {{QStringLiteral("Graphic arts"), QStringLiteral("Graphic arts")},
                                         {QStringLiteral("Textiles"), QStringLiteral("Textiles")}}));
            // kL follows the application: shown, not edited.
            weights({{"kL", 1.0}, {"kC", 1.0}, {"kH", 1.0}});
            parameters[1]->setIsEditable(false);
            parameters.push_back(choice(QStringLiteral("Chroma reference"), QStringLiteral("Standard"),
                                        {{QStringLiteral("Standard"), QStringLiteral("Standard")},
                                         {QStringLiteral("Geometric mean"), QStringLiteral("Geometric mean")}}));
            parameters.push_back(number(QStringLiteral("K1"), 0.045, false));
            parameters.push_back(number(QStringLiteral("K2"), 0.015, false));
        } else if (toleranceType == T::CMC) {
            weights({{"l", 2.0}, {"c", 1.0}});
        } else if (toleranceType == T::CIEDE2000) {
            weights({{"kL", 1.0}, {"kC", 1.0}, {"kH", 1.0}});
        } else if (toleranceType == T::DIN99 || toleranceType == T::DIN99o) {
            weights({{"kE", 1.0}, {"kCH", 1.0}});
        } else if (toleranceType == T::DIN6175_2 || toleranceType == T::Audi2000) {
            parameters = effectParameters();
        }
    }
    tolerance->setToleranceValues(values);
    tolerance->setToleranceParameters(parameters);
    return tolerance;
}

std::shared_ptr<ToleranceSet> ToleranceFactory::createToleranceSet(const QString &toleranceType, const QString &name,
                                                                   const QVector<Geometry> &geometries) const
{
    if (!isKnownType(toleranceType))
        return nullptr;
    auto set = std::make_shared<ToleranceSet>();
    set->setName(name);
    set->setToleranceSetParameters(std::make_shared<ToleranceSetParameters>());
    std::vector<std::shared_ptr<Tolerance>> tolerances;
    const QVector<Geometry> wanted = geometries.isEmpty() ? supportedGeometries(toleranceType) : geometries;
    if (wanted.isEmpty()) {
        tolerances.push_back(createTolerance(toleranceType));
    } else {
        for (const Geometry &geometry : wanted) {
            if (auto tolerance = createTolerance(toleranceType, geometry))
                tolerances.push_back(tolerance);
        }
    }
    for (const auto &tolerance : tolerances)
        tolerance->setToleranceSetParameters(set->toleranceSetParameters());
    set->setTolerances(tolerances);
    return set;
}

void ToleranceFactory::recomputeToleranceSet(ToleranceSet &toleranceSet) const
{
    // Re-links the tolerances to the set's parameters (a set assembled by hand may not be).
    toleranceSet.setTolerances(toleranceSet.tolerances());
    for (const auto &tolerance : toleranceSet.tolerances()) {
        if (!tolerance)
            continue;
        orderBoxLimits(*tolerance);
        if (tolerance->toleranceType() == T::CIE94)
            applyCie94Application(*tolerance);
    }
}

QStringList ToleranceFactory::validationErrors(const ToleranceSet &toleranceSet) const
{
    QStringList errors;
    if (toleranceSet.tolerances().empty())
        errors << QStringLiteral("The tolerance set \"%1\" holds no tolerance.").arg(toleranceSet.name());
    for (const auto &tolerance : toleranceSet.tolerances()) {
        if (!tolerance)
            continue;
        const QString problem = tolerance->validationError();
        if (!problem.isEmpty())
            errors << problem;
    }
    return errors;
}

std::shared_ptr<ToleranceSet> ToleranceFactory::recomputeToleranceSet(std::shared_ptr<ToleranceSet> toleranceSet) const
{
    if (toleranceSet)
        recomputeToleranceSet(*toleranceSet);
    return toleranceSet;
}

} // namespace vexa
