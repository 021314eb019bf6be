#pragma once

#include <domain/colorantrestriction.h>

#include <vector>

namespace vexa {

// The settings a recipe trial was formulated with.
class VEXA_DOMAIN_EXPORT FormulationSettings : public Reflectable
{
    VEXA_REFLECTABLE(FormulationSettings)
public:
    const std::vector<std::shared_ptr<ColorantRestriction>> &colorantRestrictions() const { return m_restrictions; }
    void setColorantRestrictions(const std::vector<std::shared_ptr<ColorantRestriction>> &restrictions) { m_restrictions = restrictions; }

private:
    std::vector<std::shared_ptr<ColorantRestriction>> m_restrictions;
};

} // namespace vexa
