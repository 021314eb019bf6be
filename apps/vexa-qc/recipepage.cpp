#include "recipepage.h"

#include <vexa/formula/formulawidget.h>
#include <vexa/formula/recipewidgetsettings.h>
#include <vexa/widgets/imagerepository.h>

#include <domain/formula.h>
#include <domain/recipe.h>
#include <domain/recipetrial.h>

#include <QGroupBox>
#include <QHBoxLayout>
#include <QHash>
#include <QListWidget>
#include <QSet>
#include <QSplitter>
#include <QVBoxLayout>

#include <algorithm>

namespace vexa {

RecipePage::RecipePage(std::shared_ptr<RecipeWidgetSettings> settings, QWidget *parent)
    : QWidget(parent)
    , m_settings(std::move(settings))
    , m_list(new QListWidget(this))
    , m_formulaWidget(new FormulaWidget(m_settings, this))
{
    setObjectName(QStringLiteral("recipePage"));
    m_list->setObjectName(QStringLiteral("recipeList"));
    m_list->setIconSize(QSize(16, 16));
    m_list->setMinimumWidth(210);

    auto *listBox = new QGroupBox(tr("Formulas"), this);
    auto *listLayout = new QVBoxLayout(listBox);
    listLayout->addWidget(m_list);

    auto *splitter = new QSplitter(Qt::Horizontal, this);
    splitter->addWidget(listBox);
    splitter->addWidget(m_formulaWidget);
    splitter->setStretchFactor(0, 0);
    splitter->setStretchFactor(1, 1);
    splitter->setSizes({200, 1100});
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(6, 6, 6, 6);
    layout->addWidget(splitter);

    connect(m_list, &QListWidget::currentRowChanged, this, &RecipePage::onRecipeChosen);
}

RecipePage::~RecipePage() = default;

std::vector<std::vector<std::shared_ptr<RecipeTrial>>> RecipePage::chains(
    const std::vector<std::shared_ptr<RecipeTrial>> &recipeTrials)
{
    // References are separate objects with the same ids: chain by id, through the listed trials.
    QHash<QString, std::shared_ptr<RecipeTrial>> byId;
    QSet<QString> previousIds;
    for (const auto &trial : recipeTrials) {
        if (!trial)
            continue;
        byId.insert(trial->id(), trial);
        if (trial->previousRecipeTrial())
            previousIds.insert(trial->previousRecipeTrial()->id());
    }
    std::vector<std::vector<std::shared_ptr<RecipeTrial>>> result;
    for (const auto &trial : recipeTrials) {
        if (!trial || previousIds.contains(trial->id()))
            continue; // not the last of its recipe
        std::vector<std::shared_ptr<RecipeTrial>> chain;
        QSet<QString> seen;
        for (auto step = trial; step && !seen.contains(step->id()); ) {
            seen.insert(step->id());
            chain.push_back(step);
            const auto previous = step->previousRecipeTrial();
            step = previous ? byId.value(previous->id(), previous) : nullptr;
        }
        std::reverse(chain.begin(), chain.end());
        result.push_back(chain);
    }
    return result;
}

void RecipePage::showFormulas(const std::vector<std::shared_ptr<BaseObject>> &objects)
{
    // The folder's own objects come first; references (colorants, previous trials) follow.
    std::vector<std::shared_ptr<RecipeTrial>> trials;
    std::vector<std::shared_ptr<Formula>> formulas;
    for (const auto &object : objects) {
        if (auto trial = std::dynamic_pointer_cast<RecipeTrial>(object))
            trials.push_back(trial);
        else if (auto formula = std::dynamic_pointer_cast<Formula>(object))
            formulas.push_back(formula);
    }
    m_recipes = chains(trials);
    QStringList names;
    for (const auto &chain : m_recipes)
        names << chain.front()->name();
    for (const auto &formula : formulas) {
        auto trial = std::make_shared<RecipeTrial>();
        trial->setName(formula->name());
        trial->setFormulas({formula});
        m_recipes.push_back({trial});
        names << formula->name();
    }

    const QSignalBlocker blocker(m_list);
    m_list->clear();
    const ImageRepository &images = ImageRepository::instance();
    const size_t recipeCount = m_recipes.size() - formulas.size();
    for (size_t i = 0; i < m_recipes.size(); ++i) {
        const bool recipe = i < recipeCount;
        auto *item = new QListWidgetItem(
            images.iconForType(recipe ? Recipe::typeId() : Formula::typeId(), ImageRepository::Light), names[int(i)],
            m_list);
        item->setToolTip(recipe ? tr("%n recipe trial(s)", nullptr, int(m_recipes[i].size())) : tr("Formula"));
    }
    m_list->setCurrentRow(m_recipes.empty() ? -1 : 0);
    onRecipeChosen();
    Q_EMIT sgFormulasShown();
}

void RecipePage::onRecipeChosen()
{
    const int row = m_list->currentRow();
    if (row < 0 || row >= int(m_recipes.size()))
        m_formulaWidget->setRecipeTrials({});
    else
        m_formulaWidget->setRecipeTrials(m_recipes[size_t(row)]);
}

} // namespace vexa
