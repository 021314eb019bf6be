#pragma once

#include <domain/reflectable.h>

#include <memory>

namespace vexa {

class Colorant;

// One colorant of a formula and its amount (in the formula's unit).
class VEXA_DOMAIN_EXPORT Ingredient : public Reflectable
{
    VEXA_REFLECTABLE(Ingredient)
public:
    Ingredient();
    Ingredient(const std::shared_ptr<Colorant> &colorant, double concentration);
    ~Ingredient() override;

    // The colorant (a reference).
    std::shared_ptr<Colorant> colorant() const { return m_colorant; }
    void setColorant(const std::shared_ptr<Colorant> &colorant);
    double concentration() const { return m_concentration; }
    void setConcentration(double concentration) { m_concentration = concentration; }

private:
    std::shared_ptr<Colorant> m_colorant;
    double m_concentration = 0.0;
};

} // namespace vexa
