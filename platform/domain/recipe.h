#pragma once

#include <domain/namedobject.h>
#include <domain/recipetrial.h>

namespace vexa {

// A colour matching session: its recipe trials in order (owned).
class VEXA_DOMAIN_EXPORT Recipe : public NamedObject
{
    VEXA_REFLECTABLE(Recipe)
public:
    const std::vector<std::shared_ptr<RecipeTrial>> &recipeTrials() const { return m_recipeTrials; }
    void setRecipeTrials(const std::vector<std::shared_ptr<RecipeTrial>> &trials) { m_recipeTrials = trials; }

private:
    std::vector<std::shared_ptr<RecipeTrial>> m_recipeTrials;
};

} // namespace vexa
