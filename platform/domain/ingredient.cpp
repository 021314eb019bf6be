#include "ingredient.h"

#include "colorant.h"
#include "membertraits.h"

namespace vexa {

Ingredient::Ingredient() = default;

Ingredient::Ingredient(const std::shared_ptr<Colorant> &colorant, double concentration)
    : m_colorant(colorant), m_concentration(concentration)
{
}

Ingredient::~Ingredient() = default;

const MemberList &Ingredient::staticMembers()
{
    static const MemberList list{
        reference("colorant", &Ingredient::colorant, &Ingredient::setColorant),
        member("concentration", &Ingredient::concentration, &Ingredient::setConcentration),
    };
    return list;
}

void Ingredient::setColorant(const std::shared_ptr<Colorant> &colorant)
{
    m_colorant = colorant;
}

} // namespace vexa
