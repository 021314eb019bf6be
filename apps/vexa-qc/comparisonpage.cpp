#include "comparisonpage.h"

#include "jobjudge.h"
#include "spectralpage.h"
#include "storesession.h"

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/colorcomparesettings.h>
#include <vexa/models/jobdetailviewsettings.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/plots/absolutecolorplotab.h>
#include <vexa/plots/absolutecolorplotl.h>
#include <vexa/plots/colorplotsettings.h>
#include <vexa/plots/colorplotwidget.h>
#include <vexa/tables/floptablewidget.h>
#include <vexa/tables/multicolorvaluetablemodel.h>
#include <vexa/tables/multicolorvaluewidget.h>
#include <vexa/tolerance/toleranceselector.h>
#include <vexa/widgets/verdictcolors.h>

#include <colorimetry/colordifferencecalculator.h>
#include <domain/appearancevalues.h>
#include <domain/colorvalues.h>
#include <domain/qcjob.h>
#include <domain/qcjobtemplate.h>
#include <domain/standard.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>
#include <settings/generalsettings.h>
#include <settings/stringlistsetting.h>
#include <tolerances/tolerancefactory.h>

#include <QComboBox>
#include <QFormLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QPainter>
#include <QSplitter>
#include <QTabWidget>
#include <QVBoxLayout>

#include <set>

namespace vexa {

namespace {

// The table metric that shows the chosen ΔE formula.
QString metricForFormula(const QString &formula)
{
    static const QHash<QString, QString> map{{"CIELab", "dECIELab"}, {"CIE94", "dE94"},  {"CMC", "dECMC"},
                                             {"CIE2000", "dE2000"},  {"DIN99", "dE99"},  {"DIN99o", "dE99o"}};
    return map.value(formula);
}

QIcon verdictIcon(int status)
{
    const QColor verdict = VerdictColors::colorOfStatus(status);
    QPixmap pixmap(12, 12);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(QColor(60, 60, 60), 1));
    painter.setBrush(verdict.isValid() ? verdict : QColor(0xc8, 0xc8, 0xc8));
    painter.drawEllipse(QRectF(1.5, 1.5, 9, 9));
    return QIcon(pixmap);
}

constexpr int TrialIndexRole = Qt::UserRole + 1;

} // namespace

ComparisonPage::ComparisonPage(std::shared_ptr<GeneralSettings> generalSettings,
                               std::shared_ptr<JobDetailViewSettings> viewSettings, QWidget *parent)
    : QWidget(parent)
    , m_generalSettings(std::move(generalSettings))
    , m_viewSettings(std::move(viewSettings))
{
    ColorimetricCondition condition = ColorimetricCondition::fromString(m_generalSettings->colorimetricCondition());
    m_dataModel = std::make_shared<AppearanceViewDataModel>(condition);
    m_selectionModel = std::make_shared<TrialSelectionModel>();

    auto *splitter = new QSplitter(Qt::Horizontal, this);
    splitter->addWidget(buildControls());

    m_tabs = new QTabWidget(splitter);
    m_tabs->setObjectName(QStringLiteral("viewTabs"));
    auto *views = new QSplitter(Qt::Vertical, m_tabs);
    m_tableModel = std::make_shared<MultiColorValueTableModel>(m_viewSettings->colorCompareSettings(), m_generalSettings);
    auto *tables = new QSplitter(Qt::Horizontal, views);
    m_table = new MultiColorValueWidget(tables);
    m_table->setObjectName(QStringLiteral("colorTable"));
    m_table->initialize(m_tableModel, m_generalSettings, tr("Color Data"));
    m_flop = new FlopTableWidget(m_generalSettings, tables);
    m_flop->setObjectName(QStringLiteral("flopTable"));
    m_flop->setMinimumWidth(290); // the trial names stay readable when the page is narrow
    tables->addWidget(m_table);
    tables->addWidget(m_flop);
    tables->setStretchFactor(0, 4);
    tables->setStretchFactor(1, 1);
    tables->setSizes({820, 300});

    m_plot = new ColorPlotWidget(views);
    m_plot->setObjectName(QStringLiteral("colorPlot"));
    auto *ab = new AbsoluteColorPlotAB;
    auto *l = new AbsoluteColorPlotL;
    const auto plotSettings = m_viewSettings->colorCompareSettings()->colorPlotSettings(5); // "Dynamic"
    ab->initialize(plotSettings);
    l->initialize(plotSettings);
    m_plot->initialize(ab, l);

    views->addWidget(tables);
    views->addWidget(m_plot);
    views->setStretchFactor(0, 1);
    views->setStretchFactor(1, 1);
    views->setSizes({400, 460});
    m_spectral = new SpectralPage(m_tabs);
    m_spectral->setObjectName(QStringLiteral("spectralPage"));
    m_tabs->addTab(views, tr("Colour"));
    m_tabs->addTab(m_spectral, tr("Spectra"));
    splitter->addWidget(m_tabs);
    splitter->setStretchFactor(0, 0);
    splitter->setStretchFactor(1, 1);
    splitter->setSizes({260, 1000});

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(6, 6, 6, 6);
    m_title = new QLabel(this);
    m_title->setObjectName(QStringLiteral("pageTitle"));
    QFont titleFont = m_title->font();
    titleFont.setPointSizeF(titleFont.pointSizeF() * 1.3);
    titleFont.setBold(true);
    m_title->setFont(titleFont);
    layout->addWidget(m_title);
    layout->addWidget(splitter, 1);

    m_table->setModels(m_dataModel, m_selectionModel);
    m_flop->setModels(m_dataModel, m_selectionModel);
    m_plot->setModels(m_dataModel, m_selectionModel);
    m_spectral->setModels(m_dataModel, m_selectionModel);
    m_toleranceSelector->setDataModel(m_dataModel);

    connect(m_selectionModel.get(), &TrialSelectionModel::sgTrialSelectionChanged, this,
            &ComparisonPage::followSelection);
    connect(m_selectionModel.get(), &TrialSelectionModel::sgActiveTrialsChanged, this,
            &ComparisonPage::followSelection);
    connect(m_dataModel.get(), &AppearanceViewDataModel::sgToleranceSetChanged, this,
            &ComparisonPage::updateVerdictIcons);
    connect(m_dataModel.get(), &AppearanceViewDataModel::sgColorimetricConditionChanged, this,
            &ComparisonPage::updateVerdictIcons);
}

ComparisonPage::~ComparisonPage() = default;

bool ComparisonPage::showViews(const QString &name)
{
    const QString key = name.trimmed().toLower();
    if (key == QLatin1String("colour") || key == QLatin1String("color"))
        m_tabs->setCurrentIndex(0);
    else if (key == QLatin1String("spectra") || key == QLatin1String("spectral"))
        m_tabs->setCurrentWidget(m_spectral);
    else
        return false;
    return true;
}

QWidget *ComparisonPage::buildControls()
{
    auto *panel = new QWidget(this);
    auto *layout = new QVBoxLayout(panel);
    layout->setContentsMargins(0, 0, 0, 0);

    auto *trialsBox = new QGroupBox(tr("Trials"), panel);
    auto *trialsLayout = new QVBoxLayout(trialsBox);
    m_trialList = new QListWidget(trialsBox);
    m_trialList->setObjectName(QStringLiteral("trialList"));
    m_trialList->setToolTip(tr("Ticked trials are shown; the current one is the selected trial."));
    trialsLayout->addWidget(m_trialList);
    layout->addWidget(trialsBox, 3);

    auto *geometryBox = new QGroupBox(tr("Geometries"), panel);
    auto *geometryLayout = new QVBoxLayout(geometryBox);
    m_geometryList = new QListWidget(geometryBox);
    m_geometryList->setObjectName(QStringLiteral("geometryList"));
    m_geometryList->setToolTip(tr("Ticked geometries are listed; none ticked lists all."));
    geometryLayout->addWidget(m_geometryList);
    layout->addWidget(geometryBox, 1);

    auto *conditionBox = new QGroupBox(tr("Evaluation"), panel);
    auto *form = new QFormLayout(conditionBox);
    m_conditionBox = new QComboBox(conditionBox);
    m_conditionBox->setObjectName(QStringLiteral("conditionBox"));
    for (const ColorimetricCondition &c : ColorimetricCondition::availableConditions())
        m_conditionBox->addItem(c.toString());
    m_conditionBox->setCurrentText(m_generalSettings->colorimetricCondition());
    form->addRow(tr("Illuminant/Observer"), m_conditionBox);
    m_formulaBox = new QComboBox(conditionBox);
    m_formulaBox->setObjectName(QStringLiteral("formulaBox"));
    m_formulaBox->addItems(ColorDifferenceCalculator::formulaNames());
    m_formulaBox->setCurrentText(m_generalSettings->deltaE_Formula());
    form->addRow(tr("ΔE formula"), m_formulaBox);
    m_toleranceSelector = new ToleranceSelector(this);
    QComboBox *tolerances = m_toleranceSelector->createComboBox(conditionBox);
    tolerances->setObjectName(QStringLiteral("toleranceBox"));
    form->addRow(tr("Tolerance set"), tolerances);
    // Labels above their fields: the panel is narrow, and a label beside a combo box would be cut.
    form->setRowWrapPolicy(QFormLayout::WrapAllRows);
    m_toleranceWarning = new QLabel(conditionBox);
    m_toleranceWarning->setObjectName(QStringLiteral("toleranceWarning"));
    m_toleranceWarning->setWordWrap(true);
    m_toleranceWarning->setStyleSheet(QStringLiteral("color: #b00000;"));
    m_toleranceWarning->setVisible(false);
    form->addRow(m_toleranceWarning);
    layout->addWidget(conditionBox, 0);

    connect(m_trialList, &QListWidget::itemChanged, this, &ComparisonPage::onTrialItemChanged);
    connect(m_trialList, &QListWidget::currentRowChanged, this, &ComparisonPage::onTrialCurrentChanged);
    connect(m_geometryList, &QListWidget::itemChanged, this, &ComparisonPage::onGeometryItemChanged);
    connect(m_conditionBox, &QComboBox::currentTextChanged, this, &ComparisonPage::onConditionChosen);
    connect(m_formulaBox, &QComboBox::currentTextChanged, this, &ComparisonPage::onFormulaChosen);
    panel->setMinimumWidth(230);
    return panel;
}

void ComparisonPage::showJob(const LoadedJob &loaded)
{
    const auto job = loaded.job;
    m_dataModel->setQcJob(job);
    if (!job)
        return;
    m_dataModel->setJobTemplate(job->qcJobTemplate());
    m_dataModel->setStandard(job->standard());
    // With several sets in force the user chooses; the page starts on the first.
    if (!m_dataModel->currentToleranceSet() && !m_dataModel->toleranceSets().empty())
        m_dataModel->setCurrentToleranceSet(m_dataModel->toleranceSets().front());
    m_trials = job->trials();
    m_dataModel->setTrials(m_trials);
    m_title->setText(QStringLiteral("%1 — %2").arg(job->name(),
                                                  job->standard() ? job->standard()->name() : tr("no standard")));
    fillTrialList();
    fillGeometryList();
    m_selectionModel->setColorGeometryFilter({});
    m_selectionModel->setActiveTrials(m_trials, true);
    onFormulaChosen();
    updateVerdictIcons();
}

void ComparisonPage::fillTrialList()
{
    m_updating = true;
    m_trialList->clear();
    for (int i = 0; i < int(m_trials.size()); ++i) {
        auto *item = new QListWidgetItem(m_trials[i]->name(), m_trialList);
        item->setFlags(Qt::ItemIsEnabled | Qt::ItemIsSelectable | Qt::ItemIsUserCheckable);
        item->setCheckState(Qt::Checked);
        item->setData(TrialIndexRole, i);
    }
    m_updating = false;
}

void ComparisonPage::fillGeometryList()
{
    m_updating = true;
    m_geometryList->clear();
    std::set<Geometry> geometries;
    auto collect = [&geometries](const std::shared_ptr<AppearanceValues> &values) {
        if (!values)
            return;
        for (const auto &cv : values->colorValues())
            if (cv && cv->geometry().isValid())
                geometries.insert(cv->geometry());
    };
    if (m_dataModel->standard())
        collect(m_dataModel->standard()->appearanceValues());
    for (const auto &t : m_trials)
        collect(t ? t->appearanceValues() : nullptr);
    for (const Geometry &g : geometries) {
        auto *item = new QListWidgetItem(g.toString(), m_geometryList);
        item->setFlags(Qt::ItemIsEnabled | Qt::ItemIsUserCheckable);
        item->setCheckState(Qt::Unchecked);
    }
    m_updating = false;
}

void ComparisonPage::onTrialItemChanged(QListWidgetItem *item)
{
    if (m_updating || !item)
        return;
    const int index = item->data(TrialIndexRole).toInt();
    if (index < 0 || index >= int(m_trials.size()))
        return;
    const bool checked = item->checkState() == Qt::Checked;
    if (checked != m_selectionModel->isActive(m_trials[index]))
        m_selectionModel->toggleActiveTrial(m_trials[index]);
}

void ComparisonPage::onTrialCurrentChanged()
{
    if (m_updating)
        return;
    QListWidgetItem *item = m_trialList->currentItem();
    if (!item)
        return;
    const int index = item->data(TrialIndexRole).toInt();
    if (index >= 0 && index < int(m_trials.size()))
        m_selectionModel->setSelectedTrial(m_trials[index]);
}

void ComparisonPage::onGeometryItemChanged()
{
    if (m_updating)
        return;
    std::set<Geometry> filter;
    for (int i = 0; i < m_geometryList->count(); ++i) {
        if (m_geometryList->item(i)->checkState() == Qt::Checked)
            filter.insert(Geometry(m_geometryList->item(i)->text()));
    }
    m_selectionModel->setColorGeometryFilter(filter);
}

void ComparisonPage::onConditionChosen()
{
    bool ok = false;
    const ColorimetricCondition condition = ColorimetricCondition::fromString(m_conditionBox->currentText(), &ok);
    if (!ok)
        return;
    m_generalSettings->setColorimetricCondition(condition.toString());
    m_dataModel->setColorimetricCondition(condition);
}

void ComparisonPage::onFormulaChosen()
{
    const QString formula = m_formulaBox->currentText();
    m_generalSettings->setDeltaE_Formula(formula);
    // The table shows the verdict column and the chosen formula's ΔE.
    if (auto metrics = m_viewSettings->colorCompareSettings()->setting<StringListSetting>(QStringLiteral("TableDEMetrics"))) {
        QStringList selected{QStringLiteral("Tolerances")};
        const QString metric = metricForFormula(formula);
        if (!metric.isEmpty())
            selected << metric;
        metrics->setSelectedValues(selected);
    }
    m_spectral->setDeltaEFormula(formula);
    settingsChanged();
}

void ComparisonPage::settingsChanged()
{
    m_table->settingsChanged();
    m_flop->settingsChanged();
    m_plot->settingsChanged();
    m_spectral->settingsChanged();
}

// Keeps the trial list's ticks and current row in step with the selection model.
void ComparisonPage::followSelection()
{
    m_updating = true;
    for (int i = 0; i < m_trialList->count(); ++i) {
        QListWidgetItem *item = m_trialList->item(i);
        const int index = item->data(TrialIndexRole).toInt();
        const auto &trial = m_trials[index];
        item->setCheckState(m_selectionModel->isActive(trial) ? Qt::Checked : Qt::Unchecked);
        if (trial.get() == m_selectionModel->selectedTrial().get())
            m_trialList->setCurrentItem(item);
    }
    m_updating = false;
}

// A coloured dot per trial: its worst verdict over the geometries of the set in force.
void ComparisonPage::updateVerdictIcons()
{
    if (!m_dataModel->qcJob())
        return;
    JobJudge judge(m_dataModel->qcJob(), m_dataModel->colorimetricCondition());
    const auto set = m_dataModel->currentToleranceSet();
    // A set that cannot judge gives no verdicts; the page says why instead of showing grey dots.
    const QStringList problems = set ? ToleranceFactory::toleranceFactory()->validationErrors(*set) : QStringList();
    m_toleranceWarning->setText(problems.isEmpty() ? QString()
                                                   : tr("This tolerance set gives no verdicts:\n%1")
                                                         .arg(problems.join(QLatin1Char('\n'))));
    m_toleranceWarning->setVisible(!problems.isEmpty());
    const auto verdicts = judge.judge(set);
    for (int i = 0; i < m_trialList->count() && i < int(verdicts.size()); ++i) {
        QListWidgetItem *item = m_trialList->item(i);
        item->setIcon(verdictIcon(verdicts[size_t(item->data(TrialIndexRole).toInt())].worst));
    }
}

} // namespace vexa
