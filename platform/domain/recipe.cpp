#include "recipe.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Recipe::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("recipeTrials", &Recipe::recipeTrials, &Recipe::setRecipeTrials),
    });
    return list;
}

} // namespace vexa
