#include <vexa/formula/recipewidgetsettings.h>

#include <settings/intsetting.h>
#include <settings/stringlistsetting.h>

#include <stdexcept>

namespace vexa {

QString RecipeWidgetSettings::percentageDecimalsKey()
{
    return QStringLiteral("colorantPercentageDecimalPoints");
}

QString RecipeWidgetSettings::amountDecimalsKey()
{
    return QStringLiteral("colorantAmountDecimalPoints");
}

QString RecipeWidgetSettings::unitKey()
{
    return QStringLiteral("formulaUnit");
}

RecipeWidgetSettings::RecipeWidgetSettings()
    : CommonSettings(QString::fromLatin1(OwnerName), tr("Recipe"))
{
    createSettings();
}

RecipeWidgetSettings::~RecipeWidgetSettings() = default;

void RecipeWidgetSettings::createSettings()
{
    if (!sections().empty())
        return;
    m_percentageDecimals = std::make_shared<IntSetting>(percentageDecimalsKey(), 2, tr("Decimals of shares"),
                                                        tr("The number of decimals of the colorants' shares in percent."));
    m_percentageDecimals->setRange(0, MaximumDecimals);
    m_amountDecimals = std::make_shared<IntSetting>(amountDecimalsKey(), 2, tr("Decimals of amounts"),
                                                    tr("The number of decimals of the colorants' amounts."));
    m_amountDecimals->setRange(0, MaximumDecimals);

    const FormulaOutput &output = FormulaOutput::instance();
    m_unit = std::make_shared<StringListSetting>(unitKey(), tr("Unit"), tr("The unit the amounts are shown in."));
    for (FormulaUnits unit : FormulaOutput::allUnits())
        m_unit->addPossibleValue(StringPair(output.unitToString(unit), output.unitToDisplayString(unit)),
                                 unit == FormulaUnits::Gram);
    m_unit->setSingleSelect(true);
    m_unit->setUseComboBox(true);

    addSetting(m_percentageDecimals);
    addSetting(m_amountDecimals);
    addSetting(m_unit);
}

int RecipeWidgetSettings::colorantPercentageDecimalPoints() const
{
    return m_percentageDecimals->value();
}

bool RecipeWidgetSettings::setColorantPercentageDecimalPoints(int decimals)
{
    return m_percentageDecimals->setValue(decimals);
}

int RecipeWidgetSettings::colorantAmountDecimalPoints() const
{
    return m_amountDecimals->value();
}

bool RecipeWidgetSettings::setColorantAmountDecimalPoints(int decimals)
{
    return m_amountDecimals->setValue(decimals);
}

FormulaUnits RecipeWidgetSettings::formulaUnit() const
{
    try {
        return FormulaOutput::instance().unitFromString(m_unit->selectedValue());
    } catch (const std::logic_error &) {
        return FormulaUnits::Gram; // Nothing selected.
    }
}

void RecipeWidgetSettings::setFormulaUnit(FormulaUnits unit)
{
    m_unit->setSelectedValue(FormulaOutput::instance().unitToString(unit));
}

} // namespace vexa
