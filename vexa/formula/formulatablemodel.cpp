#include <vexa/formula/formulatablemodel.h>

#include <vexa/formula/recipewidgetsettings.h>
#include <vexa/widgets/imagerepository.h>
#include <vexa/widgets/uihelper.h>

#include <domain/colorant.h>
#include <domain/colorantrestriction.h>
#include <domain/formula.h>
#include <domain/formulationsettings.h>
#include <domain/ingredient.h>
#include <domain/recipe.h>
#include <domain/recipetrial.h>

#include <QApplication>
#include <QFontMetrics>
#include <QIcon>
#include <QLocale>
#include <QSize>

#include <algorithm>
#include <cmath>
#include <limits>
#include <stdexcept>

namespace vexa {

namespace {

constexpr double NaN = std::numeric_limits<double>::quiet_NaN();

using Kind = FormulaTableModel::ColumnKind;

bool isShareKind(Kind kind)
{
    return kind == Kind::FormulaPercent || kind == Kind::PreviousPercent || kind == Kind::CorrectedPercent
           || kind == Kind::DifferencePercent;
}

bool isAmountKind(Kind kind)
{
    return kind == Kind::Amount || kind == Kind::Accumulated || kind == Kind::PreviousAmount
           || kind == Kind::CorrectedAmount || kind == Kind::AddAmount;
}

QString colorantId(const std::shared_ptr<Colorant> &colorant)
{
    return colorant ? colorant->id() : QString();
}

// The ingredient of the formula with that colorant; null when there is none.
std::shared_ptr<Ingredient> ingredientOf(const std::shared_ptr<Formula> &formula, const std::shared_ptr<Colorant> &colorant)
{
    if (!formula || !colorant)
        return nullptr;
    for (const auto &ingredient : formula->ingredients()) {
        if (ingredient && ingredient->colorant() && ingredient->colorant()->id() == colorant->id())
            return ingredient;
    }
    return nullptr;
}

// The amounts of a formula's ingredients in a unit (see the class comment), their
// natural total in that unit and why any of them could not be computed.
struct Amounts
{
    std::vector<double> values;
    double naturalTotal = NaN;
    QStringList problems;
};

Amounts amountsOf(const Formula &formula, FormulaUnits unit, double canSize)
{
    const FormulaOutput &output = FormulaOutput::instance();
    Amounts result;
    const auto &ingredients = formula.ingredients();
    result.values.assign(ingredients.size(), NaN);
    FormulaUnits from = FormulaUnits::PercentWeight;
    try {
        from = output.unitOfFormula(formula);
    } catch (const std::logic_error &) {
        result.problems << FormulaTableModel::tr("The formula \"%1\" is given in the unknown unit \"%2\".")
                               .arg(formula.name(), formula.totalQuantityUnit());
        return result;
    }
    const bool toWeight = unit == FormulaUnits::PercentWeight || output.isWeightUnit(unit);
    std::vector<double> base(ingredients.size(), NaN); // kilograms or liters
    double sum = 0.0;
    for (size_t i = 0; i < ingredients.size(); ++i) {
        const auto &ingredient = ingredients[i];
        const double value = ingredient ? ingredient->concentration() : 0.0;
        const auto colorant = ingredient ? ingredient->colorant() : nullptr;
        const double density = colorant ? colorant->density() : NaN;
        base[i] = toWeight ? output.toKilograms(value, from, density) : output.toLiters(value, from, density);
        if (!std::isfinite(base[i]))
            result.problems << FormulaTableModel::tr("%1 has no usable density: its amount in %2 cannot be computed.")
                                   .arg(FormulaTableModel::colorantName(colorant), output.unitToDisplayString(unit));
        sum += base[i];
    }
    const bool percent = output.isPercentUnit(unit);
    const bool scaled = percent || canSize > 0.0;
    if (std::isfinite(sum))
        result.naturalTotal = percent ? (sum > 0.0 ? 100.0 : NaN) : sum / output.factor(unit);
    if (scaled && std::isfinite(sum) && sum <= 0.0) {
        result.problems << FormulaTableModel::tr("The formula \"%1\" has a total of 0.").arg(formula.name());
        return result;
    }
    const double target = percent ? 100.0 : canSize;
    for (size_t i = 0; i < ingredients.size(); ++i)
        result.values[i] = scaled ? target * base[i] / sum : base[i] / output.factor(unit);
    return result;
}

QString restrictionNumber(double value)
{
    return QLocale().toString(value, 'f', 3);
}

} // namespace

FormulaTableModel::FormulaTableModel(std::shared_ptr<RecipeWidgetSettings> settings, QObject *parent)
    : QAbstractTableModel(parent)
    , m_settings(std::move(settings))
{
    if (!m_settings)
        m_settings = std::make_shared<RecipeWidgetSettings>();
    m_unit = m_settings->formulaUnit();
    const auto kinds = allColumnKinds();
    for (int c = 0; c < kinds.size(); ++c)
        m_columns.insert(c, kinds[c]);
    m_settingsConnection = connect(m_settings.get(), &CommonSettings::settingsChanged, this,
                                   &FormulaTableModel::emitAllDataChanged);
}

FormulaTableModel::~FormulaTableModel()
{
    QObject::disconnect(m_settingsConnection);
}

QVector<FormulaTableModel::ColumnKind> FormulaTableModel::allColumnKinds()
{
    QVector<ColumnKind> kinds;
    for (int k = int(Kind::Icon); k <= int(Kind::Restrictions); ++k)
        kinds << Kind(k);
    return kinds;
}

void FormulaTableModel::setRecipeTrial(const std::shared_ptr<RecipeTrial> &recipeTrial, int formulaIndex)
{
    beginResetModel();
    m_recipeTrial = recipeTrial;
    m_formulaIndex = std::max(0, formulaIndex);
    readRestrictions();
    recompute();
    endResetModel();
    Q_EMIT totalQuantityChanged(m_totalAmount);
}

std::shared_ptr<Formula> FormulaTableModel::formula() const
{
    return m_recipeTrial ? m_recipeTrial->formula(m_formulaIndex) : nullptr;
}

std::shared_ptr<Formula> FormulaTableModel::previousFormula() const
{
    const auto previous = m_recipeTrial ? m_recipeTrial->previousRecipeTrial() : nullptr;
    return previous ? previous->formula(0) : nullptr;
}

void FormulaTableModel::setColumnKinds(const QVector<ColumnKind> &kinds)
{
    beginResetModel();
    m_columns.clear();
    for (int c = 0; c < kinds.size(); ++c)
        m_columns.insert(c, kinds[c]);
    endResetModel();
}

QVector<FormulaTableModel::ColumnKind> FormulaTableModel::columnKinds() const
{
    return m_columns.values().toVector();
}

FormulaTableModel::ColumnKind FormulaTableModel::columnKind(int column) const
{
    return m_columns.value(column, Kind::Icon);
}

int FormulaTableModel::columnOfKind(ColumnKind kind) const
{
    for (auto it = m_columns.cbegin(); it != m_columns.cend(); ++it) {
        if (it.value() == kind)
            return it.key();
    }
    return -1;
}

void FormulaTableModel::setUnit(FormulaUnits unit)
{
    setUnit(unit, m_canSize);
}

void FormulaTableModel::setUnit(FormulaUnits unit, double canSize)
{
    if (!std::isfinite(canSize) || canSize < 0.0)
        canSize = 0.0;
    if (unit == m_unit) {
        setCanSize(canSize);
        return;
    }
    m_unit = unit;
    m_canSize = canSize;
    recomputeAndNotify();
    const int amount = columnOfKind(Kind::Amount);
    const int accumulated = columnOfKind(Kind::Accumulated);
    const int first = std::min(amount < 0 ? columnCount() : amount, accumulated < 0 ? columnCount() : accumulated);
    const int last = std::max(amount, accumulated);
    if (last >= 0)
        Q_EMIT headerDataChanged(Qt::Horizontal, first, last);
}

double FormulaTableModel::naturalTotal(FormulaUnits unit) const
{
    const auto current = formula();
    return current ? amountsOf(*current, unit, 0.0).naturalTotal : NaN;
}

void FormulaTableModel::setCanSize(double canSize)
{
    if (!std::isfinite(canSize) || canSize < 0.0)
        canSize = 0.0;
    if (canSize == m_canSize)
        return;
    m_canSize = canSize;
    recomputeAndNotify();
}

void FormulaTableModel::recomputeAndNotify()
{
    const double before = m_totalAmount;
    recompute();
    emitAllDataChanged();
    const bool same = before == m_totalAmount || (std::isnan(before) && std::isnan(m_totalAmount));
    if (!same)
        Q_EMIT totalQuantityChanged(m_totalAmount);
}

void FormulaTableModel::emitAllDataChanged()
{
    if (rowCount() > 0 && columnCount() > 0)
        Q_EMIT dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1));
}

void FormulaTableModel::recompute()
{
    m_rows.clear();
    m_problems.clear();
    m_naturalTotal = NaN;
    m_totalAmount = 0.0;
    const auto current = formula();
    if (!current)
        return;
    const FormulaOutput &output = FormulaOutput::instance();
    const auto &ingredients = current->ingredients();
    const double total = output.totalQuantity(*current);
    if (!(total > 0.0) && !ingredients.empty())
        m_problems << tr("The formula \"%1\" has a total of 0: its shares cannot be computed.").arg(current->name());

    const Amounts amounts = amountsOf(*current, m_unit, m_canSize);
    m_naturalTotal = amounts.naturalTotal;
    m_problems << amounts.problems;

    const auto previous = previousFormula();
    const double previousTotal = previous ? output.totalQuantity(*previous) : 0.0;
    Amounts previousAmounts;
    if (previous) {
        previousAmounts = amountsOf(*previous, m_unit, m_canSize);
        for (const QString &problem : previousAmounts.problems)
            m_problems << tr("Previous recipe trial: %1").arg(problem);
    }
    const auto previousAmountOf = [&](const std::shared_ptr<Colorant> &colorant) {
        if (!previous || !colorant)
            return 0.0;
        const auto &list = previous->ingredients();
        for (size_t i = 0; i < list.size(); ++i) {
            if (list[i] && list[i]->colorant() && list[i]->colorant()->id() == colorant->id())
                return previousAmounts.values[i];
        }
        return 0.0;
    };

    double accumulated = 0.0;
    m_rows.reserve(ingredients.size());
    for (size_t i = 0; i < ingredients.size(); ++i) {
        const auto &ingredient = ingredients[i];
        Row row;
        row.colorant = ingredient ? ingredient->colorant() : nullptr;
        const double concentration = ingredient ? ingredient->concentration() : 0.0;
        row.share = total > 0.0 ? concentration / total * 100.0 : NaN;
        row.amount = amounts.values[i];
        accumulated += row.amount;
        row.accumulated = accumulated;
        // The previous shares are shown raw where the previous total is not above 0.
        const auto previousIngredient = ingredientOf(previous, row.colorant);
        const double previousConcentration = previousIngredient ? previousIngredient->concentration() : 0.0;
        row.previousShare = previousTotal > 0.0 ? previousConcentration / previousTotal * 100.0 : previousConcentration;
        row.previousAmount = previousAmountOf(row.colorant);
        m_rows.push_back(row);
    }
    m_totalAmount = accumulated;

    // What to add to the previous batch: the smallest batch that keeps every previous
    // amount at this formula's proportions.
    double previousSum = 0.0;
    double batch = 0.0;
    for (const Row &row : m_rows) {
        previousSum += row.previousAmount;
        const double proportion = row.amount / m_totalAmount;
        if (proportion > 0.0)
            batch = std::max(batch, row.previousAmount / proportion);
        else if (std::isnan(proportion) || std::isnan(row.previousAmount))
            batch = NaN;
    }
    for (Row &row : m_rows) {
        if (!std::isfinite(previousSum) || !std::isfinite(batch)) {
            row.correctedAmount = row.add = NaN;
        } else if (previousSum <= 0.0) {
            row.correctedAmount = row.add = row.amount;
        } else {
            row.correctedAmount = std::max(row.previousAmount, batch * row.amount / m_totalAmount);
            row.add = row.correctedAmount - row.previousAmount;
        }
    }
}

void FormulaTableModel::readRestrictions()
{
    m_loading.clear();
    m_constant.clear();
    m_ratio.clear();
    m_ratioPartner.clear();
    const auto current = formula();
    const auto settings = m_recipeTrial ? m_recipeTrial->formulationSettings() : nullptr;
    if (!current || !settings)
        return;
    const auto &ingredients = current->ingredients();
    for (const auto &restriction : settings->colorantRestrictions()) {
        if (!restriction || !restriction->colorant())
            continue;
        for (int row = 0; row < int(ingredients.size()); ++row) {
            const auto &ingredient = ingredients[size_t(row)];
            if (!ingredient || colorantId(ingredient->colorant()) != restriction->colorant()->id())
                continue;
            switch (restriction->restrictionType()) {
            case ColorantRestrictionType::Loading: m_loading.insert(row, restriction->value()); break;
            case ColorantRestrictionType::Constant: m_constant.insert(row, restriction->value()); break;
            case ColorantRestrictionType::Ratio:
                m_ratio.insert(row, restriction->value());
                m_ratioPartner.insert(row, restriction->anchorColorant());
                break;
            }
            break;
        }
    }
}

// Replaces the row colorant's restrictions in the recipe trial by the row's current ones.
void FormulaTableModel::writeRestrictions(int row)
{
    const auto colorant = colorantAt(row);
    if (!m_recipeTrial || !colorant)
        return;
    auto settings = m_recipeTrial->formulationSettings();
    if (!settings) {
        settings = std::make_shared<FormulationSettings>();
        m_recipeTrial->setFormulationSettings(settings);
    }
    std::vector<std::shared_ptr<ColorantRestriction>> restrictions;
    for (const auto &restriction : settings->colorantRestrictions()) {
        if (restriction && colorantId(restriction->colorant()) != colorant->id())
            restrictions.push_back(restriction);
    }
    const auto add = [&](ColorantRestrictionType type, double value, const std::shared_ptr<Colorant> &anchor) {
        auto restriction = std::make_shared<ColorantRestriction>();
        restriction->setRestrictionType(type);
        restriction->setColorant(colorant);
        restriction->setAnchorColorant(anchor);
        restriction->setValue(value);
        restrictions.push_back(restriction);
    };
    if (loading(row) > 0.0)
        add(ColorantRestrictionType::Loading, loading(row), nullptr);
    if (constantAmount(row) > 0.0)
        add(ColorantRestrictionType::Constant, constantAmount(row), nullptr);
    if (ratio(row) > 0.0)
        add(ColorantRestrictionType::Ratio, ratio(row), ratioPartner(row));
    settings->setColorantRestrictions(restrictions);
}

std::shared_ptr<Colorant> FormulaTableModel::colorantAt(int row) const
{
    return isRow(row) ? m_rows[size_t(row)].colorant : nullptr;
}

double FormulaTableModel::valueAt(int row, ColumnKind kind) const
{
    if (!isRow(row))
        return NaN;
    const Row &r = m_rows[size_t(row)];
    switch (kind) {
    case Kind::FormulaPercent:
    case Kind::CorrectedPercent: return r.share;
    case Kind::Amount: return r.amount;
    case Kind::Accumulated: return r.accumulated;
    case Kind::PreviousPercent: return r.previousShare;
    case Kind::DifferencePercent: return r.share - r.previousShare;
    case Kind::PreviousAmount: return r.previousAmount;
    case Kind::CorrectedAmount: return r.correctedAmount;
    case Kind::AddAmount: return r.add;
    default: return NaN;
    }
}

namespace {

bool storeRestriction(QMap<int, double> &map, int row, double value)
{
    if (!std::isfinite(value) || value <= 0.0) {
        const bool had = map.contains(row);
        map.remove(row);
        return had;
    }
    if (map.value(row, 0.0) == value)
        return false;
    map.insert(row, value);
    return true;
}

} // namespace

void FormulaTableModel::restrictionEdited(int row)
{
    writeRestrictions(row);
    const int column = columnOfKind(Kind::Restrictions);
    if (column >= 0)
        Q_EMIT dataChanged(index(row, column), index(row, column));
    Q_EMIT restrictionsChanged();
}

bool FormulaTableModel::setLoading(int row, double value)
{
    if (!colorantAt(row) || !storeRestriction(m_loading, row, value))
        return false;
    restrictionEdited(row);
    return true;
}

bool FormulaTableModel::setConstantAmount(int row, double value)
{
    if (!colorantAt(row) || !storeRestriction(m_constant, row, value))
        return false;
    restrictionEdited(row);
    return true;
}

bool FormulaTableModel::setRatio(int row, double value, const std::shared_ptr<Colorant> &partner)
{
    if (!colorantAt(row))
        return false;
    bool changed = storeRestriction(m_ratio, row, value);
    const auto keptPartner = m_ratio.contains(row) ? partner : nullptr;
    if (m_ratioPartner.value(row) != keptPartner) {
        if (keptPartner)
            m_ratioPartner.insert(row, keptPartner);
        else
            m_ratioPartner.remove(row);
        changed = true;
    }
    if (!changed)
        return false;
    restrictionEdited(row);
    return true;
}

QString FormulaTableModel::restrictionSummary(int row) const
{
    QString summary;
    if (loading(row) > 0.0)
        summary += QStringLiteral("L: ") + restrictionNumber(loading(row)) + QLatin1Char(' ');
    if (constantAmount(row) > 0.0)
        summary += QStringLiteral("C: ") + restrictionNumber(constantAmount(row)) + QLatin1Char(' ');
    if (ratio(row) > 0.0) {
        summary += QStringLiteral("R: ") + restrictionNumber(ratio(row));
        if (const auto partner = ratioPartner(row))
            summary += QStringLiteral(" A: ") + colorantName(partner);
    }
    return summary;
}

QString FormulaTableModel::colorantName(const std::shared_ptr<Colorant> &colorant)
{
    if (!colorant)
        return QString();
    return colorant->name().isEmpty() ? tr("(no name)") : colorant->name();
}

QFont FormulaTableModel::headerFont()
{
    QFont font = QApplication::font();
    font.setWeight(75);
    font.setPixelSize(14);
    return font;
}

int FormulaTableModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : int(m_rows.size());
}

int FormulaTableModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_columns.size();
}

QString FormulaTableModel::displayText(int row, ColumnKind kind) const
{
    switch (kind) {
    case Kind::Icon: return QString();
    case Kind::Colorant: {
        const auto colorant = colorantAt(row);
        return colorant ? colorantName(colorant) : tr("Select Colorant...");
    }
    case Kind::Restrictions: return restrictionSummary(row);
    default: break;
    }
    const double value = valueAt(row, kind);
    if (!std::isfinite(value))
        return QString();
    const int decimals = isShareKind(kind) ? m_settings->colorantPercentageDecimalPoints()
                                           : m_settings->colorantAmountDecimalPoints();
    return QLocale().toString(value, 'f', decimals);
}

QVariant FormulaTableModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || index.model() != this || !isRow(index.row()) || !m_columns.contains(index.column()))
        return QVariant();
    const int row = index.row();
    const Kind kind = columnKind(index.column());
    switch (role) {
    case Qt::DisplayRole:
    case Qt::ToolTipRole: {
        const QString text = displayText(row, kind);
        return text.isEmpty() ? QVariant() : QVariant(text);
    }
    case Qt::DecorationRole: {
        const auto colorant = colorantAt(row);
        if (kind != Kind::Colorant || !colorant)
            return QVariant();
        return UIHelper::createRGBIcon(colorant->displayRGB(), QSize(16, 16));
    }
    case Qt::UserRole: {
        if (kind == Kind::Icon) {
            const auto colorant = colorantAt(row);
            return colorant ? colorant->type() : QString();
        }
        if (kind == Kind::Colorant)
            return displayText(row, kind);
        if (kind == Kind::Restrictions)
            return restrictionSummary(row);
        const double value = valueAt(row, kind);
        return std::isfinite(value) ? QVariant(value) : QVariant();
    }
    case Qt::TextAlignmentRole:
        if (isShareKind(kind) || isAmountKind(kind))
            return int(Qt::AlignRight | Qt::AlignVCenter);
        return int(Qt::AlignLeft | Qt::AlignVCenter);
    case LoadingRole: return kind == Kind::Restrictions ? QVariant(loading(row)) : QVariant();
    case ConstantRole: return kind == Kind::Restrictions ? QVariant(constantAmount(row)) : QVariant();
    case RatioRole: return kind == Kind::Restrictions ? QVariant(ratio(row)) : QVariant();
    case RatioPartnerRole:
        return kind == Kind::Restrictions ? QVariant(colorantId(ratioPartner(row))) : QVariant();
    default: return QVariant();
    }
}

QString FormulaTableModel::headerText(ColumnKind kind) const
{
    const QString unit = FormulaOutput::instance().unitToDisplayString(m_unit);
    switch (kind) {
    case Kind::Icon: return QString();
    case Kind::Colorant: return tr("Colorant");
    case Kind::FormulaPercent: return tr("Formula (%)");
    case Kind::Amount: return tr("Amount (%1)").arg(unit);
    case Kind::Accumulated: return tr("Accumulated (%1)").arg(unit);
    case Kind::PreviousPercent: return tr("Previous %");
    case Kind::CorrectedPercent: return tr("Corrected %");
    case Kind::DifferencePercent: return tr("Difference %");
    case Kind::PreviousAmount: return tr("Previous");
    case Kind::CorrectedAmount: return tr("Corrected");
    case Kind::AddAmount: return tr("Add");
    case Kind::Restrictions: return tr("Restrictions");
    }
    return QString();
}

QVariant FormulaTableModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || !m_columns.contains(section))
        return QAbstractTableModel::headerData(section, orientation, role);
    const Kind kind = columnKind(section);
    switch (role) {
    case Qt::DisplayRole: return headerText(kind);
    case Qt::DecorationRole:
        if (kind != Kind::Icon)
            return QVariant();
        return ImageRepository::instance().iconForType(Recipe::typeId(), ImageRepository::Light);
    case Qt::SizeHintRole: {
        const QFontMetrics metrics(headerFont());
        return QSize(metrics.horizontalAdvance(headerText(kind)) + 10, metrics.height() + 8);
    }
    default: return QAbstractTableModel::headerData(section, orientation, role);
    }
}

Qt::ItemFlags FormulaTableModel::flags(const QModelIndex &index) const
{
    Qt::ItemFlags flags = QAbstractTableModel::flags(index);
    if (index.isValid() && columnKind(index.column()) == Kind::Restrictions && colorantAt(index.row()))
        flags |= Qt::ItemIsEditable;
    return flags;
}

bool FormulaTableModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    if (!index.isValid() || index.model() != this || !(flags(index) & Qt::ItemIsEditable))
        return false;
    const int row = index.row();
    bool ok = true;
    switch (role) {
    case LoadingRole: {
        const double number = value.toDouble(&ok);
        return ok && setLoading(row, number);
    }
    case ConstantRole: {
        const double number = value.toDouble(&ok);
        return ok && setConstantAmount(row, number);
    }
    case RatioRole: {
        const double number = value.toDouble(&ok);
        return ok && setRatio(row, number, ratioPartner(row));
    }
    case RatioPartnerRole: {
        const QString id = value.toString();
        std::shared_ptr<Colorant> partner;
        if (!id.isEmpty()) {
            const auto current = formula();
            partner = current ? current->colorantWithID(id) : nullptr;
            if (!partner)
                return false;
        }
        if (ratio(row) <= 0.0)
            return false; // A partner belongs to a ratio.
        return setRatio(row, ratio(row), partner);
    }
    default: return false;
    }
}

} // namespace vexa
