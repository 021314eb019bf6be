#include <vexa/formula/formulaoutput.h>

#include <domain/colorant.h>
#include <domain/formula.h>
#include <domain/ingredient.h>

#include <cmath>
#include <limits>
#include <stdexcept>

namespace vexa {

namespace {

std::unique_ptr<FormulaOutput> &holder()
{
    static std::unique_ptr<FormulaOutput> instance;
    return instance;
}

constexpr double NaN = std::numeric_limits<double>::quiet_NaN();

bool usableDensity(double density)
{
    return std::isfinite(density) && density > 0.0;
}

[[noreturn]] void unsupportedUnit()
{
    throw std::logic_error("Unsupported Formula Unit");
}

} // namespace

FormulaOutput &FormulaOutput::instance()
{
    auto &instance = holder();
    if (!instance)
        instance.reset(new FormulaOutput);
    return *instance;
}

void FormulaOutput::destroy()
{
    holder().reset();
}

FormulaOutput::FormulaOutput() = default;
FormulaOutput::~FormulaOutput() = default;

const FormulaOutput::UnitInfo &FormulaOutput::info(FormulaUnits unit) const
{
    // Kilograms or liters in one unit.
    static const UnitInfo table[] = {
        {FormulaUnits::PercentWeight, "%Weight", 1.0},
        {FormulaUnits::PercentVolume, "%Volume", 1.0},
        {FormulaUnits::Gram, "g", 0.001},
        {FormulaUnits::Kilogram, "kg", 1.0},
        {FormulaUnits::Milliliter, "ml", 0.001},
        {FormulaUnits::Liter, "l", 1.0},
        {FormulaUnits::Ounce, "oz", 0.0283495},
        {FormulaUnits::Pound, "lb", 0.453592},
        {FormulaUnits::FluidOunce, "fl oz", 0.0295735},
        {FormulaUnits::Shot, "shot", 0.0443602943},
        {FormulaUnits::Pint, "pt", 0.473176},
        {FormulaUnits::Quart, "qt", 0.946353},
        {FormulaUnits::Gallon, "gal", 3.78541},
        {FormulaUnits::ImperialGallon, "imp gal", 4.54609},
    };
    const int index = int(unit);
    if (index < 0 || index >= int(std::size(table)))
        unsupportedUnit();
    return table[index];
}

QVector<FormulaUnits> FormulaOutput::allUnits()
{
    QVector<FormulaUnits> units;
    for (int i = int(FormulaUnits::PercentWeight); i <= int(FormulaUnits::ImperialGallon); ++i)
        units << FormulaUnits(i);
    return units;
}

QString FormulaOutput::unitToString(FormulaUnits unit) const
{
    const char *key = unitEnumerator().valueToKey(int(unit));
    if (!key)
        unsupportedUnit();
    return QString::fromLatin1(key);
}

FormulaUnits FormulaOutput::unitFromString(const QString &text) const
{
    bool ok = false;
    const int value = unitEnumerator().keyToValue(text.toLatin1().constData(), &ok);
    // keyToValue also accepts a scoped "FormulaUnits::Gram"; only the bare key is a unit text.
    if (!ok || text.contains(QLatin1Char(':')))
        unsupportedUnit();
    return FormulaUnits(value);
}

QString FormulaOutput::unitToDisplayString(FormulaUnits unit) const
{
    return QString::fromLatin1(info(unit).displayString);
}

FormulaUnits FormulaOutput::unitFromDisplayString(const QString &text) const
{
    for (FormulaUnits unit : allUnits()) {
        if (text == QLatin1String(info(unit).displayString))
            return unit;
    }
    unsupportedUnit();
}

bool FormulaOutput::didGetUnit(const QString &text, FormulaUnits &unit) const
{
    for (FormulaUnits candidate : allUnits()) {
        if (text == unitToString(candidate) || text == QLatin1String(info(candidate).displayString)) {
            unit = candidate;
            return true;
        }
    }
    return false;
}

QVector<FormulaOutput::UnitGroup> FormulaOutput::unitDisplayStrings() const
{
    UnitGroup weight{tr("Weight"), {}};
    UnitGroup volume{tr("Volume"), {}};
    for (FormulaUnits unit : allUnits()) {
        if (unit == FormulaUnits::PercentWeight || isWeightUnit(unit))
            weight.second << unitToDisplayString(unit);
        else
            volume.second << unitToDisplayString(unit);
    }
    return {weight, volume};
}

QVector<FormulaOutput::UnitGroup> FormulaOutput::unitDisplayStrings(UnitSystem system) const
{
    QVector<UnitGroup> groups = unitDisplayStrings();
    for (UnitGroup &group : groups) {
        QStringList kept;
        for (const QString &text : group.second) {
            if (isUnitOfSystem(unitFromDisplayString(text), system))
                kept << text;
        }
        group.second = kept;
    }
    return groups;
}

QString FormulaOutput::unitSystemName(UnitSystem system) const
{
    return system == UnitSystem::SI ? QStringLiteral("SI") : QStringLiteral("US");
}

QMetaEnum FormulaOutput::unitEnumerator() const
{
    return QMetaEnum::fromType<FormulaUnits>();
}

bool FormulaOutput::isSIUnit(FormulaUnits unit) const
{
    return int(unit) >= 0 && int(unit) < int(FormulaUnits::Ounce);
}

bool FormulaOutput::isUSUnit(FormulaUnits unit) const
{
    // The percent units count for both systems.
    return isPercentUnit(unit) || (int(unit) >= int(FormulaUnits::Ounce) && int(unit) <= int(FormulaUnits::ImperialGallon));
}

bool FormulaOutput::isUnitOfSystem(FormulaUnits unit, UnitSystem system) const
{
    return system == UnitSystem::SI ? isSIUnit(unit) : isUSUnit(unit);
}

bool FormulaOutput::isWeightUnit(FormulaUnits unit) const
{
    return unit == FormulaUnits::Gram || unit == FormulaUnits::Kilogram || unit == FormulaUnits::Ounce
           || unit == FormulaUnits::Pound;
}

bool FormulaOutput::isVolumeUnit(FormulaUnits unit) const
{
    return unit == FormulaUnits::Milliliter || unit == FormulaUnits::Liter
           || (int(unit) >= int(FormulaUnits::FluidOunce) && int(unit) <= int(FormulaUnits::ImperialGallon));
}

bool FormulaOutput::isPercentUnit(FormulaUnits unit) const
{
    return unit == FormulaUnits::PercentWeight || unit == FormulaUnits::PercentVolume;
}

double FormulaOutput::factor(FormulaUnits unit) const
{
    return info(unit).factor;
}

// PercentVolume is a volume here and PercentWeight a weight.
double FormulaOutput::toKilograms(double value, FormulaUnits unit, double density) const
{
    const double base = value * factor(unit);
    if (isVolumeUnit(unit) || unit == FormulaUnits::PercentVolume)
        return usableDensity(density) ? base * density : NaN;
    return base;
}

double FormulaOutput::fromKilograms(double kilograms, FormulaUnits unit, double density) const
{
    if (isVolumeUnit(unit) || unit == FormulaUnits::PercentVolume)
        return usableDensity(density) ? kilograms / density / factor(unit) : NaN;
    return kilograms / factor(unit);
}

double FormulaOutput::toLiters(double value, FormulaUnits unit, double density) const
{
    const double base = value * factor(unit);
    if (isWeightUnit(unit) || unit == FormulaUnits::PercentWeight)
        return usableDensity(density) ? base / density : NaN;
    return base;
}

double FormulaOutput::fromLiters(double liters, FormulaUnits unit, double density) const
{
    if (isWeightUnit(unit) || unit == FormulaUnits::PercentWeight)
        return usableDensity(density) ? liters * density / factor(unit) : NaN;
    return liters / factor(unit);
}

double FormulaOutput::totalQuantity(const Formula &formula) const
{
    double total = 0.0;
    for (const auto &ingredient : formula.ingredients()) {
        if (ingredient)
            total += ingredient->concentration();
    }
    return total;
}

double FormulaOutput::totalQuantity(const std::shared_ptr<Formula> &formula) const
{
    return formula ? totalQuantity(*formula) : 0.0;
}

FormulaUnits FormulaOutput::unitOfFormula(const Formula &formula) const
{
    const QString text = formula.totalQuantityUnit().trimmed();
    if (text.isEmpty())
        return FormulaUnits::PercentWeight;
    FormulaUnits unit = FormulaUnits::PercentWeight;
    if (!didGetUnit(text, unit))
        unsupportedUnit();
    return unit;
}

std::shared_ptr<Formula> FormulaOutput::convertToUnit(const std::shared_ptr<Formula> &formula, FormulaUnits unit) const
{
    if (!formula)
        return nullptr;
    const FormulaUnits from = unitOfFormula(*formula);
    const bool toWeight = unit == FormulaUnits::PercentWeight || isWeightUnit(unit);
    const bool fromWeight = from == FormulaUnits::PercentWeight || isWeightUnit(from);

    std::vector<double> amounts; // kilograms or liters, as the target unit needs
    double sum = 0.0;
    for (const auto &ingredient : formula->ingredients()) {
        const double value = ingredient ? ingredient->concentration() : 0.0;
        const auto colorant = ingredient ? ingredient->colorant() : nullptr;
        const double density = colorant ? colorant->density() : NaN;
        if (toWeight != fromWeight && !usableDensity(density)) {
            const QString name = colorant ? colorant->name() : QString();
            throw std::invalid_argument(
                (name.isEmpty() ? tr("A colorant without a name has no usable density for converting %1 to %2.")
                                      .arg(unitToDisplayString(from), unitToDisplayString(unit))
                                : tr("The colorant \"%1\" has no usable density for converting %2 to %3.")
                                      .arg(name, unitToDisplayString(from), unitToDisplayString(unit)))
                    .toStdString());
        }
        const double amount = toWeight ? toKilograms(value, from, density) : toLiters(value, from, density);
        amounts.push_back(amount);
        sum += amount;
    }

    auto converted = std::make_shared<Formula>(*formula);
    std::vector<std::shared_ptr<Ingredient>> ingredients;
    double total = 0.0;
    size_t i = 0;
    for (const auto &ingredient : formula->ingredients()) {
        const double amount = amounts[i++];
        double value = 0.0;
        if (isPercentUnit(unit))
            value = sum > 0.0 ? amount / sum * 100.0 : 0.0;
        else
            value = amount / factor(unit);
        auto copy = ingredient ? std::make_shared<Ingredient>(*ingredient) : std::make_shared<Ingredient>();
        copy->setConcentration(value);
        ingredients.push_back(copy);
        total += value;
    }
    converted->setIngredients(ingredients);
    converted->setTotalQuantity(total);
    converted->setTotalQuantityUnit(unitToString(unit));
    return converted;
}

std::shared_ptr<Formula> FormulaOutput::convertToPercentWeight(const std::shared_ptr<Formula> &formula) const
{
    return convertToUnit(formula, FormulaUnits::PercentWeight);
}

std::shared_ptr<Formula> FormulaOutput::convertToPercentVolume(const std::shared_ptr<Formula> &formula) const
{
    return convertToUnit(formula, FormulaUnits::PercentVolume);
}

} // namespace vexa
