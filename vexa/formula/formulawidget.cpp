#include <vexa/formula/formulawidget.h>

#include <vexa/formula/formulasortmodel.h>
#include <vexa/formula/formulatable.h>
#include <vexa/formula/recipewidgetsettings.h>
#include <vexa/widgets/imagerepository.h>
#include <vexa/widgets/uihelper.h>

#include <domain/colorant.h>
#include <domain/formula.h>
#include <domain/ingredient.h>
#include <domain/recipetrial.h>

#include <QComboBox>
#include <QDoubleSpinBox>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QItemSelectionModel>
#include <QLabel>
#include <QListWidget>
#include <QLocale>
#include <QSplitter>
#include <QStandardItemModel>
#include <QVBoxLayout>

#include <cmath>

namespace vexa {

namespace {

using Kind = FormulaTableModel::ColumnKind;
using System = FormulaOutput::UnitSystem;

constexpr int UnitRole = Qt::UserRole + 1;

QSize swatchSize()
{
    return QSize(14, 14);
}

} // namespace

FormulaWidget::FormulaWidget(std::shared_ptr<RecipeWidgetSettings> settings, QWidget *parent)
    : QWidget(parent)
    , m_settings(settings ? std::move(settings) : std::make_shared<RecipeWidgetSettings>())
    , m_model(new FormulaTableModel(m_settings, this))
    , m_sortModel(new FormulaSortModel(this))
{
    setObjectName(QStringLiteral("FormulaWidget"));
    m_sortModel->setSourceModel(m_model);

    m_trialList = new QListWidget(this);
    m_trialList->setObjectName(QStringLiteral("recipeTrialList"));
    m_trialList->setIconSize(QSize(16, 16));
    m_trialList->setMinimumWidth(290);

    auto *right = new QWidget(this);
    auto *rightLayout = new QVBoxLayout(right);
    rightLayout->setContentsMargins(0, 0, 0, 0);
    m_titleLabel = new QLabel(right);
    m_titleLabel->setObjectName(QStringLiteral("formulaTitle"));
    QFont titleFont = m_titleLabel->font();
    titleFont.setBold(true);
    m_titleLabel->setFont(titleFont);
    rightLayout->addWidget(m_titleLabel);
    rightLayout->addWidget(buildControls());

    m_table = new FormulaTable(right);
    m_table->setModel(m_sortModel);
    m_table->horizontalHeader()->setSortIndicator(0, Qt::AscendingOrder);
    m_table->setSortingEnabled(true);
    m_table->horizontalHeader()->setSectionResizeMode(QHeaderView::ResizeToContents);
    m_table->horizontalHeader()->setStretchLastSection(true);
    m_table->horizontalHeader()->setMinimumSectionSize(28);
    m_table->verticalHeader()->setDefaultSectionSize(24);
    m_table->setIconSize(swatchSize());
    rightLayout->addWidget(m_table, 1);

    m_totalLabel = new QLabel(right);
    m_totalLabel->setObjectName(QStringLiteral("formulaTotal"));
    m_totalLabel->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    rightLayout->addWidget(m_totalLabel);
    m_problemLabel = new QLabel(right);
    m_problemLabel->setObjectName(QStringLiteral("formulaProblems"));
    m_problemLabel->setWordWrap(true);
    m_problemLabel->setStyleSheet(QStringLiteral("color: #a4000f;"));
    m_problemLabel->hide();
    rightLayout->addWidget(m_problemLabel);
    rightLayout->addWidget(buildRestrictionEditor());

    auto *splitter = new QSplitter(Qt::Horizontal, this);
    splitter->addWidget(m_trialList);
    splitter->addWidget(right);
    splitter->setStretchFactor(0, 0);
    splitter->setStretchFactor(1, 1);
    splitter->setSizes({240, 760});
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(splitter);

    setViewMode(ViewMode::Formula);
    setUnit(m_settings->formulaUnit());

    connect(m_trialList, &QListWidget::currentRowChanged, this, &FormulaWidget::onTrialChosen);
    connect(m_model, &FormulaTableModel::totalQuantityChanged, this, &FormulaWidget::onTotalChanged);
    connect(m_model, &QAbstractItemModel::modelReset, this, &FormulaWidget::updateProblems);
    connect(m_model, &QAbstractItemModel::dataChanged, this, &FormulaWidget::updateProblems);
    connect(m_table->selectionModel(), &QItemSelectionModel::currentRowChanged, this,
            &FormulaWidget::onCurrentRowChanged);
    connect(m_model, &FormulaTableModel::restrictionsChanged, this, &FormulaWidget::restrictionsChanged);
    onTotalChanged(m_model->totalAmount());
    onCurrentRowChanged();
}

FormulaWidget::~FormulaWidget() = default;

QVector<FormulaTableModel::ColumnKind> FormulaWidget::columnsOf(ViewMode mode)
{
    if (mode == ViewMode::Correction)
        return {Kind::Icon,           Kind::Colorant,       Kind::PreviousPercent,
                Kind::CorrectedPercent, Kind::DifferencePercent, Kind::PreviousAmount,
                Kind::AddAmount,      Kind::CorrectedAmount, Kind::Restrictions};
    return {Kind::Icon, Kind::Colorant, Kind::FormulaPercent, Kind::Amount, Kind::Accumulated, Kind::Restrictions};
}

QWidget *FormulaWidget::buildControls()
{
    auto *bar = new QWidget(this);
    auto *layout = new QHBoxLayout(bar);
    layout->setContentsMargins(0, 0, 0, 0);

    m_viewModeBox = new QComboBox(bar);
    m_viewModeBox->setObjectName(QStringLiteral("viewModeBox"));
    m_viewModeBox->addItem(tr("Formula"), int(ViewMode::Formula));
    m_viewModeBox->addItem(tr("Correction"), int(ViewMode::Correction));
    m_viewModeBox->setToolTip(tr("Formula: shares and amounts. Correction: what to add to the previous trial's batch."));

    const FormulaOutput &output = FormulaOutput::instance();
    m_systemBox = new QComboBox(bar);
    m_systemBox->setObjectName(QStringLiteral("systemBox"));
    m_systemBox->addItem(output.unitSystemName(System::SI), int(System::SI));
    m_systemBox->addItem(output.unitSystemName(System::US), int(System::US));

    m_unitBox = new QComboBox(bar);
    m_unitBox->setObjectName(QStringLiteral("unitBox"));
    m_unitBox->setModel(new QStandardItemModel(m_unitBox));
    m_unitBox->setMinimumContentsLength(8);

    m_canSizeBox = new QDoubleSpinBox(bar);
    m_canSizeBox->setObjectName(QStringLiteral("canSizeBox"));
    m_canSizeBox->setRange(0.0, 1.0e7);
    m_canSizeBox->setSpecialValueText(tr("as formulated"));
    m_canSizeBox->setToolTip(tr("The quantity of the can the formula is mixed in; at 0 the formula's own amounts."));
    m_canSizeBox->setKeyboardTracking(false);
    m_canSizeBox->setMinimumWidth(130);

    layout->addWidget(new QLabel(tr("View"), bar));
    layout->addWidget(m_viewModeBox);
    layout->addSpacing(12);
    layout->addWidget(new QLabel(tr("Units"), bar));
    layout->addWidget(m_systemBox);
    layout->addWidget(m_unitBox);
    layout->addSpacing(12);
    layout->addWidget(new QLabel(tr("Can size"), bar));
    layout->addWidget(m_canSizeBox);
    layout->addStretch(1);

    connect(m_viewModeBox, QOverload<int>::of(&QComboBox::currentIndexChanged), this, &FormulaWidget::onViewModeChosen);
    connect(m_systemBox, QOverload<int>::of(&QComboBox::currentIndexChanged), this, &FormulaWidget::onSystemChosen);
    connect(m_unitBox, QOverload<int>::of(&QComboBox::currentIndexChanged), this, &FormulaWidget::onUnitChosen);
    connect(m_canSizeBox, QOverload<double>::of(&QDoubleSpinBox::valueChanged), this, &FormulaWidget::onCanSizeEdited);
    return bar;
}

QGroupBox *FormulaWidget::buildRestrictionEditor()
{
    m_restrictionBox = new QGroupBox(tr("Restrictions"), this);
    m_restrictionBox->setObjectName(QStringLiteral("restrictionBox"));
    auto *layout = new QHBoxLayout(m_restrictionBox);
    const auto spinBox = [this](const QString &name, double maximum, int decimals, const QString &tip) {
        auto *box = new QDoubleSpinBox(m_restrictionBox);
        box->setObjectName(name);
        box->setRange(0.0, maximum);
        box->setDecimals(decimals);
        box->setSpecialValueText(tr("none"));
        box->setToolTip(tip);
        box->setKeyboardTracking(false);
        connect(box, QOverload<double>::of(&QDoubleSpinBox::valueChanged), this, &FormulaWidget::onRestrictionEdited);
        return box;
    };
    m_loadingBox = spinBox(QStringLiteral("loadingBox"), 100.0, 3, tr("The colorant's share is fixed at this percentage."));
    m_loadingBox->setSuffix(QStringLiteral(" %"));
    m_constantBox = spinBox(QStringLiteral("constantBox"), 1.0e6, 3, tr("The colorant's amount is kept at this value."));
    m_ratioBox = spinBox(QStringLiteral("ratioBox"), 1000.0, 3, tr("The colorant stays at this multiple of the partner."));
    m_partnerBox = new QComboBox(m_restrictionBox);
    m_partnerBox->setObjectName(QStringLiteral("partnerBox"));
    m_partnerBox->setIconSize(swatchSize());
    connect(m_partnerBox, QOverload<int>::of(&QComboBox::activated), this, &FormulaWidget::onRestrictionEdited);

    layout->addWidget(new QLabel(tr("Loading"), m_restrictionBox));
    layout->addWidget(m_loadingBox);
    layout->addSpacing(8);
    layout->addWidget(new QLabel(tr("Constant"), m_restrictionBox));
    layout->addWidget(m_constantBox);
    layout->addSpacing(8);
    layout->addWidget(new QLabel(tr("Ratio"), m_restrictionBox));
    layout->addWidget(m_ratioBox);
    layout->addWidget(new QLabel(tr("to"), m_restrictionBox));
    layout->addWidget(m_partnerBox, 1);
    return m_restrictionBox;
}

void FormulaWidget::setRecipeTrials(const std::vector<std::shared_ptr<RecipeTrial>> &recipeTrials)
{
    m_recipeTrials.clear();
    for (const auto &trial : recipeTrials) {
        if (trial)
            m_recipeTrials.push_back(trial);
    }
    m_updating = true;
    m_trialList->clear();
    const QIcon icon = ImageRepository::instance().iconForType(QStringLiteral("Recipe"), ImageRepository::Light);
    for (size_t i = 0; i < m_recipeTrials.size(); ++i) {
        const auto &trial = m_recipeTrials[i];
        const QString name = trial->name().isEmpty() ? tr("Recipe trial") : trial->name();
        auto *item = new QListWidgetItem(icon, QStringLiteral("%1. %2").arg(i + 1).arg(name), m_trialList);
        item->setToolTip(trial->previousRecipeTrial() ? tr("Correction of %1").arg(trial->previousRecipeTrial()->name())
                                                      : tr("First formulation"));
    }
    m_updating = false;
    if (m_recipeTrials.empty()) {
        m_model->setRecipeTrial(nullptr);
        onTrialChosen();
    } else {
        m_trialList->setCurrentRow(int(m_recipeTrials.size()) - 1);
        onTrialChosen();
    }
}

void FormulaWidget::setFormula(const std::shared_ptr<Formula> &formula)
{
    if (!formula) {
        setRecipeTrials({});
        return;
    }
    auto trial = std::make_shared<RecipeTrial>();
    trial->setName(formula->name());
    trial->setFormulas({formula});
    setRecipeTrials({trial});
}

void FormulaWidget::setCurrentRecipeTrial(int index)
{
    if (index >= 0 && index < int(m_recipeTrials.size()))
        m_trialList->setCurrentRow(index);
}

int FormulaWidget::currentRecipeTrial() const
{
    return m_trialList->currentRow();
}

void FormulaWidget::onTrialChosen()
{
    if (m_updating)
        return;
    const int index = m_trialList->currentRow();
    const auto trial = index >= 0 && index < int(m_recipeTrials.size()) ? m_recipeTrials[size_t(index)] : nullptr;
    if (trial != m_model->recipeTrial() || !trial)
        m_model->setRecipeTrial(trial);
    const auto formula = m_model->formula();
    if (!trial)
        m_titleLabel->setText(tr("No formula"));
    else if (formula && formula->name() != trial->name())
        m_titleLabel->setText(QStringLiteral("%1 — %2").arg(trial->name(), formula->name()));
    else
        m_titleLabel->setText(trial->name());
    // The partners a ratio can name: the formula's colorants.
    m_partnerBox->clear();
    m_partnerBox->addItem(tr("(no partner)"), QString());
    if (formula) {
        for (const auto &ingredient : formula->ingredients()) {
            const auto colorant = ingredient ? ingredient->colorant() : nullptr;
            if (colorant)
                m_partnerBox->addItem(UIHelper::createRGBIcon(colorant->displayRGB(), swatchSize()),
                                      FormulaTableModel::colorantName(colorant), colorant->id());
        }
    }
    updateCanSizeBox();
    if (m_sortModel->rowCount() > 0)
        m_table->selectRow(0);
    onCurrentRowChanged();
}

void FormulaWidget::setViewMode(ViewMode mode)
{
    m_viewMode = mode;
    m_model->setColumnKinds(columnsOf(mode));
    const QSignalBlocker blocker(m_viewModeBox);
    m_viewModeBox->setCurrentIndex(m_viewModeBox->findData(int(mode)));
    // The swatch column stays narrow; the restrictions take what is left.
    m_table->horizontalHeader()->setSectionResizeMode(0, QHeaderView::Fixed);
    m_table->horizontalHeader()->resizeSection(0, 28);
}

void FormulaWidget::onViewModeChosen()
{
    setViewMode(ViewMode(m_viewModeBox->currentData().toInt()));
}

void FormulaWidget::setUnitSystem(System system)
{
    if (system == m_system && m_unitBox->count() > 0)
        return;
    const FormulaUnits previous = unit();
    m_system = system;
    {
        const QSignalBlocker blocker(m_systemBox);
        m_systemBox->setCurrentIndex(m_systemBox->findData(int(system)));
    }
    fillUnitBox();
    // Keep the unit when the new system has it (the percent units), else the same kind.
    const FormulaOutput &output = FormulaOutput::instance();
    FormulaUnits wanted = previous;
    if (!output.isUnitOfSystem(previous, system)) {
        const bool weight = output.isWeightUnit(previous);
        if (system == System::SI)
            wanted = weight ? FormulaUnits::Gram : FormulaUnits::Milliliter;
        else
            wanted = weight ? FormulaUnits::Ounce : FormulaUnits::FluidOunce;
    }
    setUnit(wanted);
}

void FormulaWidget::onSystemChosen()
{
    setUnitSystem(System(m_systemBox->currentData().toInt()));
}

void FormulaWidget::fillUnitBox()
{
    const QSignalBlocker blocker(m_unitBox);
    auto *model = static_cast<QStandardItemModel *>(m_unitBox->model());
    model->clear();
    const FormulaOutput &output = FormulaOutput::instance();
    for (const auto &group : output.unitDisplayStrings(m_system)) {
        auto *heading = new QStandardItem(group.first);
        heading->setFlags(Qt::NoItemFlags);
        QFont font = m_unitBox->font();
        font.setBold(true);
        heading->setFont(font);
        model->appendRow(heading);
        for (const QString &text : group.second) {
            auto *item = new QStandardItem(QStringLiteral("   ") + text);
            item->setData(int(output.unitFromDisplayString(text)), UnitRole);
            model->appendRow(item);
        }
    }
}

void FormulaWidget::setUnit(FormulaUnits unit)
{
    const FormulaOutput &output = FormulaOutput::instance();
    if (m_unitBox->count() == 0 || !output.isUnitOfSystem(unit, m_system)) {
        m_system = output.isSIUnit(unit) ? System::SI : System::US;
        const QSignalBlocker blocker(m_systemBox);
        m_systemBox->setCurrentIndex(m_systemBox->findData(int(m_system)));
        fillUnitBox();
    }
    {
        const QSignalBlocker blocker(m_unitBox);
        m_unitBox->setCurrentIndex(m_unitBox->findData(int(unit), UnitRole));
    }
    onUnitChosen();
}

FormulaUnits FormulaWidget::unit() const
{
    const QVariant data = m_unitBox->currentData(UnitRole);
    return data.isValid() ? FormulaUnits(data.toInt()) : m_model->unit();
}

void FormulaWidget::onUnitChosen()
{
    const QVariant data = m_unitBox->currentData(UnitRole);
    if (!data.isValid())
        return;
    const FormulaUnits chosen = FormulaUnits(data.toInt());
    // The same can in the new unit, through the formula's own weight-to-volume ratio.
    double canSize = m_model->canSize();
    if (chosen != m_model->unit() && canSize > 0.0) {
        const double before = m_model->naturalTotal(m_model->unit());
        const double after = m_model->naturalTotal(chosen);
        canSize = std::isfinite(before) && std::isfinite(after) && before > 0.0 ? canSize * after / before : 0.0;
    }
    m_model->setUnit(chosen, canSize);
    m_settings->setFormulaUnit(chosen);
    updateCanSizeBox();
}

void FormulaWidget::setCanSize(double canSize)
{
    m_model->setCanSize(canSize);
    updateCanSizeBox();
}

double FormulaWidget::canSize() const
{
    return m_model->canSize();
}

void FormulaWidget::onCanSizeEdited(double value)
{
    if (!m_updating)
        m_model->setCanSize(value);
}

void FormulaWidget::updateCanSizeBox()
{
    const FormulaOutput &output = FormulaOutput::instance();
    m_updating = true;
    const bool percent = output.isPercentUnit(m_model->unit());
    m_canSizeBox->setEnabled(!percent && m_model->formula());
    m_canSizeBox->setDecimals(m_settings->colorantAmountDecimalPoints());
    m_canSizeBox->setSuffix(percent ? QString() : QLatin1Char(' ') + output.unitToDisplayString(m_model->unit()));
    m_canSizeBox->setValue(percent ? 0.0 : m_model->canSize());
    m_updating = false;
}

void FormulaWidget::onTotalChanged(double total)
{
    const FormulaOutput &output = FormulaOutput::instance();
    if (!m_model->formula())
        m_totalLabel->clear();
    else if (!std::isfinite(total))
        m_totalLabel->setText(tr("Total: cannot be computed"));
    else
        m_totalLabel->setText(tr("Total: %1 %2")
                                  .arg(QLocale().toString(total, 'f', m_settings->colorantAmountDecimalPoints()),
                                       output.unitToDisplayString(m_model->unit())));
}

void FormulaWidget::updateProblems()
{
    const QStringList problems = m_model->problems();
    m_problemLabel->setText(problems.join(QLatin1Char('\n')));
    m_problemLabel->setVisible(!problems.isEmpty());
    onTotalChanged(m_model->totalAmount());
}

int FormulaWidget::currentSourceRow() const
{
    const QModelIndex current = m_table->selectionModel()->currentIndex();
    return current.isValid() ? m_sortModel->mapToSource(current).row() : -1;
}

void FormulaWidget::onCurrentRowChanged()
{
    const int row = currentSourceRow();
    const auto colorant = m_model->colorantAt(row);
    m_updating = true;
    m_restrictionBox->setEnabled(colorant != nullptr);
    m_restrictionBox->setTitle(colorant ? tr("Restrictions of %1").arg(FormulaTableModel::colorantName(colorant))
                                        : tr("Restrictions"));
    m_loadingBox->setValue(colorant ? m_model->loading(row) : 0.0);
    m_constantBox->setValue(colorant ? m_model->constantAmount(row) : 0.0);
    m_ratioBox->setValue(colorant ? m_model->ratio(row) : 0.0);
    const auto partner = colorant ? m_model->ratioPartner(row) : nullptr;
    m_partnerBox->setCurrentIndex(std::max(0, m_partnerBox->findData(partner ? partner->id() : QString())));
    m_partnerBox->setEnabled(colorant && m_model->ratio(row) > 0.0);
    m_updating = false;
}

void FormulaWidget::onRestrictionEdited()
{
    if (m_updating)
        return;
    const int row = currentSourceRow();
    if (!m_model->colorantAt(row))
        return;
    m_model->setLoading(row, m_loadingBox->value());
    m_model->setConstantAmount(row, m_constantBox->value());
    const auto formula = m_model->formula();
    const QString partnerId = m_partnerBox->currentData().toString();
    const auto partner = formula && !partnerId.isEmpty() ? formula->colorantWithID(partnerId) : nullptr;
    m_model->setRatio(row, m_ratioBox->value(), partner);
    m_partnerBox->setEnabled(m_model->ratio(row) > 0.0);
}

} // namespace vexa
