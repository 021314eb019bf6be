#pragma once

#include <vexa/vexa_export.h>

#include <QCoreApplication>
#include <QMetaEnum>
#include <QObject>
#include <QPair>
#include <QString>
#include <QStringList>
#include <QVector>

#include <memory>

namespace vexa {

class Formula;

// The units a formula is shown in, their text forms and the conversions between them.
// One instance per process (instance()), created on first use; destroy() releases it.
//
// Weights convert through kilograms, volumes through liters; a conversion between a weight
// and a volume needs the density of the colorant in kilograms per liter (g/cm³). The two
// percent units behave as their base unit: PercentWeight as kilograms, PercentVolume as
// liters. A conversion that needs a density which is not a positive finite number, or that
// is given a value that is not finite, gives NaN: callers show an empty cell, never a number.
class VEXA_EXPORT FormulaOutput
{
    Q_GADGET
    Q_DECLARE_TR_FUNCTIONS(vexa::FormulaOutput)
public:
    // In this order; the keys are also the text form of unitToString/unitFromString.
    enum class FormulaUnits {
        PercentWeight,
        PercentVolume,
        Gram,
        Kilogram,
        Milliliter,
        Liter,
        Ounce,
        Pound,
        FluidOunce,
        Shot,
        Pint,
        Quart,
        Gallon,
        ImperialGallon,
    };
    Q_ENUM(FormulaUnits)

    // The two unit systems; the percent units belong to both.
    enum class UnitSystem {
        SI,
        US,
    };
    Q_ENUM(UnitSystem)

    // One group of a unit chooser: its heading ("Weight" or "Volume") and display strings.
    using UnitGroup = QPair<QString, QStringList>;

    static FormulaOutput &instance();
    static void destroy();

    FormulaOutput(const FormulaOutput &) = delete;
    FormulaOutput &operator=(const FormulaOutput &) = delete;

    // Every unit, in enumeration order.
    static QVector<FormulaUnits> allUnits();

    // The enumeration key ("Gram"); unitFromString throws std::logic_error
    // "Unsupported Formula Unit" for anything else (case matters).
    QString unitToString(FormulaUnits unit) const;
    FormulaUnits unitFromString(const QString &text) const;
    // The display string ("g", "fl oz"); unitFromDisplayString throws the same error for an
    // unknown text.
    QString unitToDisplayString(FormulaUnits unit) const;
    FormulaUnits unitFromDisplayString(const QString &text) const;
    // Accepts a key or a display string (a formula's stored unit may be either); false and
    // unit untouched for anything else.
    bool didGetUnit(const QString &text, FormulaUnits &unit) const;

    // The display strings grouped under "Weight" and "Volume" (each group starts with its
    // percent unit), all units or those of one system.
    QVector<UnitGroup> unitDisplayStrings() const;
    QVector<UnitGroup> unitDisplayStrings(UnitSystem system) const;
    // "SI" or "US".
    QString unitSystemName(UnitSystem system) const;
    QMetaEnum unitEnumerator() const;

    bool isSIUnit(FormulaUnits unit) const;
    bool isUSUnit(FormulaUnits unit) const;
    bool isUnitOfSystem(FormulaUnits unit, UnitSystem system) const;
    bool isWeightUnit(FormulaUnits unit) const;
    bool isVolumeUnit(FormulaUnits unit) const;
    bool isPercentUnit(FormulaUnits unit) const;
    // Kilograms or liters in one unit (1 for the percent units).
    double factor(FormulaUnits unit) const;

    // density in kg/l; used only where weight and volume meet.
    double toKilograms(double value, FormulaUnits unit, double density) const;
    double fromKilograms(double kilograms, FormulaUnits unit, double density) const;
    double toLiters(double value, FormulaUnits unit, double density) const;
    double fromLiters(double liters, FormulaUnits unit, double density) const;

    // The sum of the ingredients' concentrations; 0 for a null or empty formula.
    double totalQuantity(const Formula &formula) const;
    double totalQuantity(const std::shared_ptr<Formula> &formula) const;

    // A copy of the formula with every concentration rescaled to the unit and the unit noted
    // as its key. The formula's own unit is its totalQuantityUnit() (a key or a display
    // string; empty means PercentWeight). The percent conversions rescale so that the total
    // is 100. Throws std::logic_error "Unsupported Formula Unit" for an unknown stored unit and
    // std::invalid_argument naming the colorant when a needed density is missing or not
    // positive. Null for a null formula.
    std::shared_ptr<Formula> convertToUnit(const std::shared_ptr<Formula> &formula, FormulaUnits unit) const;
    std::shared_ptr<Formula> convertToPercentWeight(const std::shared_ptr<Formula> &formula) const;
    std::shared_ptr<Formula> convertToPercentVolume(const std::shared_ptr<Formula> &formula) const;

    // The unit a formula's concentrations are given in; PercentWeight when it names none.
    // Throws std::logic_error "Unsupported Formula Unit" for an unknown text.
    FormulaUnits unitOfFormula(const Formula &formula) const;

private:
    FormulaOutput();
    ~FormulaOutput();
    friend struct std::default_delete<FormulaOutput>;

    struct UnitInfo
    {
        FormulaUnits unit;
        const char *displayString;
        double factor;
    };
    const UnitInfo &info(FormulaUnits unit) const;
};

using FormulaUnits = FormulaOutput::FormulaUnits;

} // namespace vexa
