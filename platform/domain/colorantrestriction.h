#pragma once

#include <domain/reflectable.h>

#include <memory>

namespace vexa {

class Colorant;

enum class ColorantRestrictionType {
    Loading,  // the colorant's share is fixed at value percent
    Ratio,    // the colorant stays at value times the anchor colorant
    Constant, // the colorant's amount is kept at value
};

// A user's restriction on one colorant during formulation.
class VEXA_DOMAIN_EXPORT ColorantRestriction : public Reflectable
{
    VEXA_REFLECTABLE(ColorantRestriction)
public:
    ColorantRestriction();
    ~ColorantRestriction() override;

    ColorantRestrictionType restrictionType() const { return m_type; }
    void setRestrictionType(ColorantRestrictionType type) { m_type = type; }
    std::shared_ptr<Colorant> colorant() const { return m_colorant; }
    void setColorant(const std::shared_ptr<Colorant> &colorant);
    // The partner of a Ratio restriction.
    std::shared_ptr<Colorant> anchorColorant() const { return m_anchorColorant; }
    void setAnchorColorant(const std::shared_ptr<Colorant> &colorant);
    double value() const { return m_value; }
    void setValue(double value) { m_value = value; }

private:
    ColorantRestrictionType m_type = ColorantRestrictionType::Loading;
    std::shared_ptr<Colorant> m_colorant;
    std::shared_ptr<Colorant> m_anchorColorant;
    double m_value = 0.0;
};

} // namespace vexa
