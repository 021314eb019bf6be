#pragma once

// Formulas for the formula tests: the silver metallic of the sample data (in grams, Clear
// Binder first) and a correction of it, with colorant restrictions.

#include <domain/colorant.h>
#include <domain/colorantrestriction.h>
#include <domain/formula.h>
#include <domain/formulationsettings.h>
#include <domain/ingredient.h>
#include <domain/recipetrial.h>
#include <domain/rgbvalue.h>

#include <QString>

#include <memory>
#include <utility>
#include <vector>

namespace formulafixtures {

inline std::shared_ptr<vexa::Colorant> colorant(const QString &name, const char *type, double density,
                                                vexa::RGBValue rgb = vexa::RGBValue(128, 128, 128))
{
    auto c = std::make_shared<vexa::Colorant>();
    c->setName(name);
    c->setType(QString::fromLatin1(type));
    c->setDensity(density);
    c->setDisplayRGB(rgb);
    return c;
}

struct Colorants
{
    std::shared_ptr<vexa::Colorant> clear = colorant("Clear Binder", vexa::ColorantType::Clear, 1.02, {240, 240, 240});
    std::shared_ptr<vexa::Colorant> fine = colorant("Fine Aluminium", vexa::ColorantType::Metallic, 1.45, {190, 190, 195});
    std::shared_ptr<vexa::Colorant> coarse = colorant("Coarse Aluminium", vexa::ColorantType::Metallic, 1.50, {170, 172, 178});
    std::shared_ptr<vexa::Colorant> black = colorant("Carbon Black", vexa::ColorantType::Pigment, 1.10, {20, 20, 20});
};

inline std::shared_ptr<vexa::Formula> formula(const QString &name,
                                              const std::vector<std::pair<std::shared_ptr<vexa::Colorant>, double>> &parts,
                                              const QString &unit = QStringLiteral("Gram"))
{
    auto f = std::make_shared<vexa::Formula>();
    f->setName(name);
    std::vector<std::shared_ptr<vexa::Ingredient>> ingredients;
    double total = 0.0;
    for (const auto &[c, amount] : parts) {
        ingredients.push_back(std::make_shared<vexa::Ingredient>(c, amount));
        total += amount;
    }
    f->setIngredients(ingredients);
    f->setTotalQuantity(total);
    f->setTotalQuantityUnit(unit);
    return f;
}

// 62 g Clear Binder, 24 g Fine Aluminium, 12.5 g Coarse Aluminium, 1.5 g Carbon Black.
inline std::shared_ptr<vexa::Formula> silver(const Colorants &c = Colorants())
{
    return formula(QStringLiteral("Silver Metallic"), {{c.clear, 62.0}, {c.fine, 24.0}, {c.coarse, 12.5}, {c.black, 1.5}});
}

inline std::shared_ptr<vexa::ColorantRestriction> restriction(vexa::ColorantRestrictionType type,
                                                              const std::shared_ptr<vexa::Colorant> &colorant, double value,
                                                              const std::shared_ptr<vexa::Colorant> &anchor = nullptr)
{
    auto r = std::make_shared<vexa::ColorantRestriction>();
    r->setRestrictionType(type);
    r->setColorant(colorant);
    r->setAnchorColorant(anchor);
    r->setValue(value);
    return r;
}

inline std::shared_ptr<vexa::RecipeTrial> recipeTrial(const QString &name, const std::shared_ptr<vexa::Formula> &f,
                                                      const std::shared_ptr<vexa::RecipeTrial> &previous = nullptr,
                                                      const std::vector<std::shared_ptr<vexa::ColorantRestriction>> &restrictions = {})
{
    auto trial = std::make_shared<vexa::RecipeTrial>();
    trial->setName(name);
    trial->setFormulas({f});
    trial->setPreviousRecipeTrial(previous);
    auto settings = std::make_shared<vexa::FormulationSettings>();
    settings->setColorantRestrictions(restrictions);
    trial->setFormulationSettings(settings);
    return trial;
}

// The first silver trial (restrictions: Clear Binder loaded at 62 %, Coarse Aluminium at 0.5
// times Fine Aluminium) and its correction: 60 g Clear Binder, 28 g Fine Aluminium, 10 g Coarse
// Aluminium, 2 g Carbon Black (restriction: Carbon Black constant at 2).
struct Recipe
{
    Colorants colorants;
    std::shared_ptr<vexa::RecipeTrial> first;
    std::shared_ptr<vexa::RecipeTrial> correction;

    Recipe()
    {
        using T = vexa::ColorantRestrictionType;
        first = recipeTrial(QStringLiteral("Silver Recipe"), silver(colorants), nullptr,
                            {restriction(T::Loading, colorants.clear, 62.0),
                             restriction(T::Ratio, colorants.coarse, 0.5, colorants.fine)});
        // 60 + 28 + 10 + 2 = 100 g.
        correction = recipeTrial(QStringLiteral("Silver Correction 1"),
                                 formula(QStringLiteral("Silver Correction 1"),
                                         {{colorants.clear, 60.0}, {colorants.fine, 28.0}, {colorants.coarse, 10.0},
                                          {colorants.black, 2.0}}),
                                 first, {restriction(T::Constant, colorants.black, 2.0)});
    }
};

} // namespace formulafixtures
