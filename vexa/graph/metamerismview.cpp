#include <vexa/graph/metamerismview.h>

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/widgets/uihelper.h>

#include <colorimetry/colorconverter.h>
#include <colorimetry/colordifferencecalculator.h>
#include <colorimetry/colorindicescalculator.h>
#include <domain/appearancevalues.h>
#include <domain/reflectancespectrum.h>
#include <domain/standard.h>
#include <domain/trial.h>
#include <utilities/logger.h>

#include <QEvent>
#include <QHeaderView>
#include <QLabel>
#include <QTableWidget>
#include <QVBoxLayout>

#include <cmath>
#include <limits>
#include <set>

namespace vexa {

namespace {

constexpr int ValueRole = Qt::UserRole;

QTableWidgetItem *numberItem(double value)
{
    auto *item = new QTableWidgetItem(std::isfinite(value) ? QString::number(value, 'f', 2) : QString());
    item->setData(ValueRole, value);
    item->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
    item->setFlags(Qt::ItemIsEnabled | Qt::ItemIsSelectable);
    return item;
}

} // namespace

MetamerismView::MetamerismView(QWidget *parent)
    : QWidget(parent)
    , m_title(new QLabel(this))
    , m_table(new QTableWidget(this))
{
    m_title->setObjectName(QStringLiteral("metamerismTitle"));
    m_title->setWordWrap(true);
    m_table->setObjectName(QStringLiteral("metamerismTable"));
    m_table->setEditTriggers(QAbstractItemView::NoEditTriggers);
    m_table->setSelectionMode(QAbstractItemView::NoSelection);
    m_table->horizontalHeader()->setSectionResizeMode(QHeaderView::ResizeToContents);
    m_table->verticalHeader()->setSectionResizeMode(QHeaderView::ResizeToContents);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(4);
    layout->addWidget(m_title);
    layout->addWidget(m_table, 1);
    refreshAll();
}

MetamerismView::~MetamerismView() = default;

void MetamerismView::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                               const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    AppearanceViewBase::setModels(dataModel, selectionModel);
    refreshAll();
}

void MetamerismView::settingsChanged()
{
    refreshAll();
}

bool MetamerismView::setDeltaEFormula(const QString &formula)
{
    if (!ColorDifferenceCalculator::isKnownFormula(formula)) {
        Logger::instance().error(LogCategory::General,
                                 QStringLiteral("MetamerismView::setDeltaEFormula: unknown formula \"%1\"").arg(formula));
        return false;
    }
    if (formula != m_formula) {
        m_formula = formula;
        refreshAll();
    }
    return true;
}

void MetamerismView::setTestIlluminants(const QStringList &illuminants)
{
    m_testIlluminants = illuminants;
    refreshAll();
}

QVector<ColorimetricCondition> MetamerismView::conditions() const
{
    const auto data = appearanceViewDataModel();
    const ColorimetricCondition page = data ? data->colorimetricCondition() : ColorimetricCondition();
    QVector<ColorimetricCondition> result{page};
    for (const QString &illuminant : m_testIlluminants) {
        const ColorimetricCondition test(illuminant, page.observer());
        if (test.isValid() && !result.contains(test))
            result << test;
    }
    return result;
}

double MetamerismView::valueAt(int row, int column) const
{
    const QTableWidgetItem *item = m_table->item(row, column);
    return item ? item->data(ValueRole).toDouble() : std::numeric_limits<double>::quiet_NaN();
}

void MetamerismView::changeEvent(QEvent *event)
{
    if (event->type() == QEvent::LanguageChange)
        refreshAll();
    QWidget::changeEvent(event);
}

void MetamerismView::refreshAll()
{
    const QVector<ColorimetricCondition> columns = conditions();
    const int tests = columns.size() - 1;
    m_table->clear();
    m_table->setRowCount(0);
    m_table->setColumnCount(columns.size() + tests);
    for (int c = 0; c < columns.size(); ++c) {
        // The illuminant alone: every column shares the page's observer, which the title names.
        auto *header = new QTableWidgetItem(tr("ΔE %1").arg(columns[c].illuminant()));
        header->setToolTip(tr("Colour difference (%1) under %2").arg(m_formula, columns[c].toString()));
        m_table->setHorizontalHeaderItem(c, header);
    }
    for (int t = 1; t < columns.size(); ++t) {
        auto *header = new QTableWidgetItem(tr("MI %1").arg(columns[t].illuminant()));
        header->setToolTip(tr("Metamerism index under %1: the difference left after correcting the pair's "
                              "mismatch under %2")
                               .arg(columns[t].toString(), columns[0].toString()));
        m_table->setHorizontalHeaderItem(columns.size() + t - 1, header);
    }

    const auto data = appearanceViewDataModel();
    const auto selection = trialSelectionModel();
    const std::shared_ptr<Standard> standard = data ? data->standard() : nullptr;
    const std::shared_ptr<Trial> trial = selection ? selection->selectedTrial() : nullptr;
    const auto standardValues = standard ? standard->appearanceValues() : nullptr;
    const auto trialValues = trial ? trial->appearanceValues() : nullptr;
    if (!standardValues || !trialValues) {
        m_title->setText(!standard ? tr("Metamerism: no standard") : tr("Metamerism: select a trial"));
        return;
    }
    const QString trialName = UIHelper::trialDisplayString(*trial, QString::fromStdString(data->nameFormat()));
    m_title->setText(tr("Metamerism of %1 against %2 (ΔE %3, %4° observer)")
                         .arg(trialName, standard->name(), m_formula, columns[0].observer()));

    std::set<Geometry> geometries = selection->colorGeometryFilter();
    const bool filtered = !geometries.empty();
    for (const auto &values : trialValues->colorValues()) {
        if (!filtered && std::dynamic_pointer_cast<ReflectanceSpectrum>(values) && values->geometry().isValid())
            geometries.insert(values->geometry());
    }
    for (const Geometry &geometry : geometries) {
        const auto standardSpectrum = standardValues->reflectanceAt(geometry);
        const auto trialSpectrum = trialValues->reflectanceAt(geometry);
        if (!standardSpectrum || !trialSpectrum)
            continue;
        const int row = m_table->rowCount();
        m_table->insertRow(row);
        auto *header = new QTableWidgetItem(geometry.toString());
        const bool current = geometry == selection->selectedColorGeometry();
        if (current) {
            QFont font = header->font();
            font.setBold(true);
            header->setFont(font);
        }
        m_table->setVerticalHeaderItem(row, header);
        for (int c = 0; c < columns.size(); ++c) {
            const double dE = ColorDifferenceCalculator::Default_DE(
                m_formula, ColorConverter::toLab(*standardSpectrum, columns[c]),
                ColorConverter::toLab(*trialSpectrum, columns[c]));
            m_table->setItem(row, c, numberItem(dE));
        }
        for (int t = 1; t < columns.size(); ++t) {
            const double mi = ColorIndicesCalculator::MetamerismIndex(*standardSpectrum, *trialSpectrum, columns[0],
                                                                      columns[t], m_formula);
            m_table->setItem(row, columns.size() + t - 1, numberItem(mi));
        }
        if (current) {
            for (int c = 0; c < m_table->columnCount(); ++c) {
                QFont font = m_table->item(row, c)->font();
                font.setBold(true);
                m_table->item(row, c)->setFont(font);
            }
        }
    }
    if (m_table->rowCount() == 0)
        m_title->setText(tr("Metamerism of %1 against %2: no geometry where both have a spectrum")
                             .arg(trialName, standard->name()));
}

} // namespace vexa
