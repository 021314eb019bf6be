#pragma once

#include <domain/formula.h>
#include <domain/formulationsettings.h>
#include <domain/namedobject.h>

namespace vexa {

// One step of a recipe: the formulas it proposes (index 0 the chosen one), the
// settings it was formulated with and the step before it.
class VEXA_DOMAIN_EXPORT RecipeTrial : public NamedObject
{
    VEXA_REFLECTABLE(RecipeTrial)
public:
    // The formula at index; null when there is none.
    std::shared_ptr<Formula> formula(int index = 0) const;
    const std::vector<std::shared_ptr<Formula>> &formulas() const { return m_formulas; }
    void setFormulas(const std::vector<std::shared_ptr<Formula>> &formulas) { m_formulas = formulas; }
    std::shared_ptr<FormulationSettings> formulationSettings() const { return m_settings; }
    void setFormulationSettings(const std::shared_ptr<FormulationSettings> &settings) { m_settings = settings; }
    // The previous step (a reference); null for the first one.
    std::shared_ptr<RecipeTrial> previousRecipeTrial() const { return m_previous; }
    void setPreviousRecipeTrial(const std::shared_ptr<RecipeTrial> &previous) { m_previous = previous; }
    QString recipeType() const { return m_recipeType; }
    void setRecipeType(const QString &type) { m_recipeType = type; }

private:
    std::vector<std::shared_ptr<Formula>> m_formulas;
    std::shared_ptr<FormulationSettings> m_settings;
    std::shared_ptr<RecipeTrial> m_previous;
    QString m_recipeType;
};

} // namespace vexa
