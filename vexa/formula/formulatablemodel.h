#pragma once

#include <vexa/vexa_export.h>
#include <vexa/formula/formulaoutput.h>

#include <QAbstractTableModel>
#include <QFont>
#include <QMap>
#include <QMetaObject>
#include <QVector>

#include <memory>
#include <vector>

namespace vexa {

class Colorant;
class Formula;
class RecipeTrial;
class RecipeWidgetSettings;

// The colorants of one recipe trial's formula, one row per ingredient in formula order,
// with their shares, their amounts in a chosen unit, running totals, the comparison with
// the previous recipe trial and the restrictions put on single colorants.
//
// Which quantity a column shows is its kind (ColumnKind); the host lays the columns out
// with setColumnKinds() (by default every kind in order).
//
// Shares are concentration ÷ the sum of the formula's concentrations × 100. Amounts: the
// concentrations, given in the formula's own unit (Formula::totalQuantityUnit(), a key or a
// display string; none means %Weight), become kilograms or liters through the colorants'
// densities, as the shown unit needs. In a percent unit the amount is the colorant's part
// of the formula's weight (or volume) in percent. In any other unit it is the colorant's
// part of the can size when a can size is set, else the formula's own amount converted.
//
// The correction columns compare with the previous recipe trial's chosen formula (index 0),
// matched by colorant id; a colorant it lacks counts as 0. Its amounts are computed the same
// way for the same can. "Add" is what must go into the previous batch to reach this
// formula without taking anything out: the smallest batch k that holds every previous
// amount at this formula's proportions, k = max(previous ÷ proportion); corrected =
// proportion × k, add = corrected − previous (never below 0). Without a previous batch the
// whole amount is to be added.
//
// Values that cannot be computed (a total of 0, a missing density, an unknown stored unit)
// are empty cells; problems() says why. Restrictions are read from the recipe trial's
// formulation settings and edited through setData with the restriction roles, which write
// them back into the recipe trial.
class VEXA_EXPORT FormulaTableModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    enum class ColumnKind {
        Icon,              // empty cells; the header carries the recipe icon; UserRole the colorant type
        Colorant,          // the colorant's name, its swatch as decoration
        FormulaPercent,    // share of the formula
        Amount,            // amount in the unit
        Accumulated,       // running sum of the amounts
        PreviousPercent,   // share in the previous recipe trial
        CorrectedPercent,  // share in this recipe trial
        DifferencePercent, // corrected share − previous share
        PreviousAmount,    // amount of the previous recipe trial
        CorrectedAmount,   // previous amount + add
        AddAmount,         // amount to add
        Restrictions,      // "L: … C: … R: … A: …"
    };
    Q_ENUM(ColumnKind)

    // setData roles of the restrictions column (0 or a negative value clears; the partner is
    // a colorant id, empty clears).
    enum RestrictionRole {
        LoadingRole = Qt::UserRole + 1,
        ConstantRole,
        RatioRole,
        RatioPartnerRole,
    };

    explicit FormulaTableModel(std::shared_ptr<RecipeWidgetSettings> settings, QObject *parent = nullptr);
    ~FormulaTableModel() override;

    static QVector<ColumnKind> allColumnKinds();

    // The recipe trial shown and which of its formulas; null clears the table.
    void setRecipeTrial(const std::shared_ptr<RecipeTrial> &recipeTrial, int formulaIndex = 0);
    std::shared_ptr<RecipeTrial> recipeTrial() const { return m_recipeTrial; }
    int formulaIndex() const { return m_formulaIndex; }
    std::shared_ptr<Formula> formula() const;
    std::shared_ptr<Formula> previousFormula() const;

    void setColumnKinds(const QVector<ColumnKind> &kinds);
    QVector<ColumnKind> columnKinds() const;
    // The kind of a visible column; Icon out of range.
    ColumnKind columnKind(int column) const;
    // The first visible column of that kind; -1 when not shown.
    int columnOfKind(ColumnKind kind) const;

    void setUnit(FormulaUnits unit);
    // Both at once (one recomputation, one notification).
    void setUnit(FormulaUnits unit, double canSize);
    FormulaUnits unit() const { return m_unit; }
    // The quantity of one can in the unit; 0 (or less) shows the formula's own amounts.
    // Not used by the percent units.
    void setCanSize(double canSize);
    double canSize() const { return m_canSize; }
    // The formula's own total in the unit (the can size that changes nothing); NaN when it
    // cannot be computed.
    double naturalTotal() const { return m_naturalTotal; }
    double naturalTotal(FormulaUnits unit) const;
    // The sum of the amount column; NaN when an amount cannot be computed.
    double totalAmount() const { return m_totalAmount; }
    // One line per problem that empties cells ("The colorant "X" has no density…").
    QStringList problems() const { return m_problems; }

    std::shared_ptr<RecipeWidgetSettings> settings() const { return m_settings; }

    // The colorant of a row; null out of range or when the row has none.
    std::shared_ptr<Colorant> colorantAt(int row) const;
    // The raw numbers behind the cells (NaN when not computed).
    double valueAt(int row, ColumnKind kind) const;

    // Restrictions of a row (0 when none), and setters that also update the recipe trial.
    double loading(int row) const { return m_loading.value(row, 0.0); }
    double constantAmount(int row) const { return m_constant.value(row, 0.0); }
    double ratio(int row) const { return m_ratio.value(row, 0.0); }
    std::shared_ptr<Colorant> ratioPartner(int row) const { return m_ratioPartner.value(row); }
    bool setLoading(int row, double value);
    bool setConstantAmount(int row, double value);
    bool setRatio(int row, double value, const std::shared_ptr<Colorant> &partner);
    // The restriction summary of a row.
    QString restrictionSummary(int row) const;

    // A colorant's shown name: its name, or "(no name)".
    static QString colorantName(const std::shared_ptr<Colorant> &colorant);
    // The bold 14-pixel header font.
    static QFont headerFont();

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;

Q_SIGNALS:
    // The sum of the amounts changed (NaN when it cannot be computed).
    void totalQuantityChanged(double newValue);
    // A restriction was edited.
    void restrictionsChanged();

private:
    struct Row
    {
        std::shared_ptr<Colorant> colorant;
        double share = 0.0;
        double amount = 0.0;
        double accumulated = 0.0;
        double previousShare = 0.0;
        double previousAmount = 0.0;
        double correctedAmount = 0.0;
        double add = 0.0;
    };

    void recompute();
    void recomputeAndNotify();
    void readRestrictions();
    void writeRestrictions(int row);
    // Writes the row's restrictions back and tells the views.
    void restrictionEdited(int row);
    bool isRow(int row) const { return row >= 0 && row < int(m_rows.size()); }
    QString displayText(int row, ColumnKind kind) const;
    QString headerText(ColumnKind kind) const;
    void emitAllDataChanged();

    std::shared_ptr<RecipeWidgetSettings> m_settings;
    std::shared_ptr<RecipeTrial> m_recipeTrial;
    int m_formulaIndex = 0;
    QMap<int, ColumnKind> m_columns; // visible column → kind
    FormulaUnits m_unit = FormulaUnits::Gram;
    double m_canSize = 0.0;

    // Restrictions by row.
    QMap<int, double> m_loading;
    QMap<int, double> m_constant;
    QMap<int, double> m_ratio;
    QMap<int, std::shared_ptr<Colorant>> m_ratioPartner;

    // Computed by recompute().
    std::vector<Row> m_rows;
    double m_naturalTotal = 0.0;
    double m_totalAmount = 0.0;
    QStringList m_problems;
    QMetaObject::Connection m_settingsConnection;
};

} // namespace vexa
