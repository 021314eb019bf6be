#pragma once

#include <QWidget>

#include <memory>
#include <vector>

class QListWidget;

namespace vexa {

class BaseObject;
class Formula;
class FormulaWidget;
class RecipeTrial;
class RecipeWidgetSettings;

// The "Recipe" page: the formulas of the store on the left — each recipe (a first recipe
// trial and the corrections that follow it) and each formula on its own — and the chosen
// one in a formula widget on the right, with its units, can size, correction view and
// restrictions.
class RecipePage : public QWidget
{
    Q_OBJECT
public:
    explicit RecipePage(std::shared_ptr<RecipeWidgetSettings> settings, QWidget *parent = nullptr);
    ~RecipePage() override;

    // The loaded objects of the "Formulas" folder with their references.
    void showFormulas(const std::vector<std::shared_ptr<BaseObject>> &objects);

    // The recipe trials of each entry of the list, first to last (a formula on its own is
    // one entry with one trial made for it).
    const std::vector<std::vector<std::shared_ptr<RecipeTrial>>> &recipes() const { return m_recipes; }
    QListWidget *recipeList() const { return m_list; }
    FormulaWidget *formulaWidget() const { return m_formulaWidget; }

    // Chains recipe trials by their previous trials: one list per recipe, first to last,
    // in the order of their last trials.
    static std::vector<std::vector<std::shared_ptr<RecipeTrial>>> chains(
        const std::vector<std::shared_ptr<RecipeTrial>> &recipeTrials);

Q_SIGNALS:
    // The formulas are listed and the first one is shown.
    void sgFormulasShown();

private:
    void onRecipeChosen();

    std::shared_ptr<RecipeWidgetSettings> m_settings;
    std::vector<std::vector<std::shared_ptr<RecipeTrial>>> m_recipes;
    QListWidget *m_list;             // Child.
    FormulaWidget *m_formulaWidget;  // Child.
};

} // namespace vexa
