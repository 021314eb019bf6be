#pragma once

#include <vexa/vexa_export.h>
#include <vexa/formula/formulaoutput.h>
#include <vexa/formula/formulatablemodel.h>

#include <QWidget>

#include <memory>
#include <vector>

class QComboBox;
class QDoubleSpinBox;
class QGroupBox;
class QLabel;
class QListWidget;

namespace vexa {

class Formula;
class FormulaSortModel;
class FormulaTable;
class RecipeTrial;
class RecipeWidgetSettings;

// The recipe view around the formula table. On the left the recipe trials of a recipe in
// order (the first formulation, then each correction); on the right, for the chosen trial,
// the view mode ("Formula": shares, amounts and running totals; "Correction": the comparison
// with the previous trial and what to add), the unit system ("SI"/"US") and a unit chooser
// grouped by "Weight" and "Volume", the can size, the table, its total, any reason why
// amounts cannot be shown, and an editor of the chosen colorant's restrictions.
//
// The unit and the decimals come from (and the unit goes back to) the RecipeWidgetSettings.
// Changing the unit keeps the can: the can size is converted with the formula's own
// weight-to-volume ratio.
class VEXA_EXPORT FormulaWidget : public QWidget
{
    Q_OBJECT
public:
    enum class ViewMode {
        Formula,
        Correction,
    };

    explicit FormulaWidget(std::shared_ptr<RecipeWidgetSettings> settings, QWidget *parent = nullptr);
    ~FormulaWidget() override;

    // The columns of a view mode.
    static QVector<FormulaTableModel::ColumnKind> columnsOf(ViewMode mode);

    // The recipe trials in order; the last one is shown.
    void setRecipeTrials(const std::vector<std::shared_ptr<RecipeTrial>> &recipeTrials);
    const std::vector<std::shared_ptr<RecipeTrial>> &recipeTrials() const { return m_recipeTrials; }
    // A formula on its own, shown as a single recipe trial.
    void setFormula(const std::shared_ptr<Formula> &formula);
    void setCurrentRecipeTrial(int index);
    int currentRecipeTrial() const;

    void setViewMode(ViewMode mode);
    ViewMode viewMode() const { return m_viewMode; }
    void setUnitSystem(FormulaOutput::UnitSystem system);
    FormulaOutput::UnitSystem unitSystem() const { return m_system; }
    // Switches to the unit's system when the current one does not hold it.
    void setUnit(FormulaUnits unit);
    FormulaUnits unit() const;
    // In the current unit; 0 shows the formula's own amounts.
    void setCanSize(double canSize);
    double canSize() const;

    FormulaTableModel *tableModel() const { return m_model; }
    FormulaSortModel *sortModel() const { return m_sortModel; }
    FormulaTable *table() const { return m_table; }
    QListWidget *recipeTrialList() const { return m_trialList; }
    QComboBox *viewModeBox() const { return m_viewModeBox; }
    QComboBox *systemBox() const { return m_systemBox; }
    QComboBox *unitBox() const { return m_unitBox; }
    QDoubleSpinBox *canSizeBox() const { return m_canSizeBox; }
    QLabel *totalLabel() const { return m_totalLabel; }
    QLabel *problemLabel() const { return m_problemLabel; }
    QGroupBox *restrictionBox() const { return m_restrictionBox; }

Q_SIGNALS:
    // A restriction of the shown recipe trial was edited (the trial holds the new ones).
    void restrictionsChanged();

private:
    QWidget *buildControls();
    QGroupBox *buildRestrictionEditor();
    void fillUnitBox();
    void onTrialChosen();
    void onViewModeChosen();
    void onSystemChosen();
    void onUnitChosen();
    void onCanSizeEdited(double value);
    void onTotalChanged(double total);
    void onCurrentRowChanged();
    void onRestrictionEdited();
    void updateProblems();
    void updateCanSizeBox();
    int currentSourceRow() const;

    std::shared_ptr<RecipeWidgetSettings> m_settings;
    std::vector<std::shared_ptr<RecipeTrial>> m_recipeTrials;
    ViewMode m_viewMode = ViewMode::Formula;
    FormulaOutput::UnitSystem m_system = FormulaOutput::UnitSystem::SI;
    bool m_updating = false;

    FormulaTableModel *m_model;     // Child.
    FormulaSortModel *m_sortModel;  // Child.
    FormulaTable *m_table = nullptr;
    QListWidget *m_trialList = nullptr;
    QComboBox *m_viewModeBox = nullptr;
    QComboBox *m_systemBox = nullptr;
    QComboBox *m_unitBox = nullptr;
    QDoubleSpinBox *m_canSizeBox = nullptr;
    QLabel *m_titleLabel = nullptr;
    QLabel *m_totalLabel = nullptr;
    QLabel *m_problemLabel = nullptr;
    QGroupBox *m_restrictionBox = nullptr;
    QDoubleSpinBox *m_loadingBox = nullptr;
    QDoubleSpinBox *m_constantBox = nullptr;
    QDoubleSpinBox *m_ratioBox = nullptr;
    QComboBox *m_partnerBox = nullptr;
};

} // namespace vexa
