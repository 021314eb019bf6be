#include "formula.h"

#include "colorant.h"
#include "membertraits.h"

namespace vexa {

const MemberList &Formula::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("ingredients", &Formula::ingredients, &Formula::setIngredients),
        member("totalQuantity", &Formula::totalQuantity, &Formula::setTotalQuantity),
        member("totalQuantityUnit", &Formula::totalQuantityUnit, &Formula::setTotalQuantityUnit),
    });
    return list;
}

double Formula::calculatedTotalAmount() const
{
    double sum = 0.0;
    for (const auto &i : m_ingredients) {
        if (i)
            sum += i->concentration();
    }
    return sum;
}

std::shared_ptr<Colorant> Formula::colorantWithID(const QString &colorantId) const
{
    const auto ingredient = ingredientWithMatchingColorantId(colorantId);
    return ingredient ? ingredient->colorant() : nullptr;
}

std::shared_ptr<Ingredient> Formula::ingredientWithMatchingColorantId(const QString &colorantId) const
{
    for (const auto &i : m_ingredients) {
        if (i && i->colorant() && i->colorant()->id() == colorantId)
            return i;
    }
    return nullptr;
}

} // namespace vexa
