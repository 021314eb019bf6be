#pragma once

#include <domain/ingredient.h>
#include <domain/namedobject.h>

namespace vexa {

class Colorant;

// The colorants of a colour and their amounts.
class VEXA_DOMAIN_EXPORT Formula : public NamedObject
{
    VEXA_REFLECTABLE(Formula)
public:
    const std::vector<std::shared_ptr<Ingredient>> &ingredients() const { return m_ingredients; }
    void setIngredients(const std::vector<std::shared_ptr<Ingredient>> &ingredients) { m_ingredients = ingredients; }
    // The batch size the formula is given for, and its unit (a FormulaUnits key).
    double totalQuantity() const { return m_totalQuantity; }
    void setTotalQuantity(double quantity) { m_totalQuantity = quantity; }
    QString totalQuantityUnit() const { return m_totalQuantityUnit; }
    void setTotalQuantityUnit(const QString &unit) { m_totalQuantityUnit = unit; }

    // The sum of the ingredients' concentrations.
    double calculatedTotalAmount() const;
    // The colorant of an ingredient by colorant id; null when none.
    std::shared_ptr<Colorant> colorantWithID(const QString &colorantId) const;
    std::shared_ptr<Ingredient> ingredientWithMatchingColorantId(const QString &colorantId) const;

private:
    std::vector<std::shared_ptr<Ingredient>> m_ingredients;
    double m_totalQuantity = 0.0;
    QString m_totalQuantityUnit;
};

} // namespace vexa
