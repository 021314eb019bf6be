#include "recipetrial.h"

#include "membertraits.h"

namespace vexa {

const MemberList &RecipeTrial::staticMembers()
{
    using C = RecipeTrial;
    static const MemberList list(NamedObject::staticMembers(), {
        member("formulas", &C::formulas, &C::setFormulas),
        member("formulationSettings", &C::formulationSettings, &C::setFormulationSettings),
        reference("previousRecipeTrial", &C::previousRecipeTrial, &C::setPreviousRecipeTrial),
        member("recipeType", &C::recipeType, &C::setRecipeType),
    });
    return list;
}

std::shared_ptr<Formula> RecipeTrial::formula(int index) const
{
    return (index >= 0 && size_t(index) < m_formulas.size()) ? m_formulas[size_t(index)] : nullptr;
}

} // namespace vexa
