#pragma once

#include <vexa/vexa_export.h>
#include <vexa/formula/formulaoutput.h>

#include <settings/commonsettings.h>

#include <memory>

class IntSetting;
class StringListSetting;

namespace vexa {

// The persisted settings of the formula widget: the decimals of the shares
// ("colorantPercentageDecimalPoints", default 2) and of the amounts
// ("colorantAmountDecimalPoints", default 2), both 0 to 6, and the unit the amounts were
// last shown in ("formulaUnit", a FormulaUnits key, default "Gram").
// Register the group with the settings manager to persist it.
class VEXA_EXPORT RecipeWidgetSettings : public CommonSettings
{
    Q_OBJECT
public:
    static constexpr const char *OwnerName = "RecipeWidget";
    static constexpr int MaximumDecimals = 6;

    static QString percentageDecimalsKey();
    static QString amountDecimalsKey();
    static QString unitKey();

    RecipeWidgetSettings();
    ~RecipeWidgetSettings() override;

    void createSettings() override;

    int colorantPercentageDecimalPoints() const;
    bool setColorantPercentageDecimalPoints(int decimals);
    int colorantAmountDecimalPoints() const;
    bool setColorantAmountDecimalPoints(int decimals);
    FormulaUnits formulaUnit() const;
    void setFormulaUnit(FormulaUnits unit);

private:
    std::shared_ptr<IntSetting> m_percentageDecimals;
    std::shared_ptr<IntSetting> m_amountDecimals;
    std::shared_ptr<StringListSetting> m_unit;
};

} // namespace vexa
