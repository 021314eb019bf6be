#include <vexa/graph/spectralplotwidget.h>

#include <vexa/graph/defaultgraphdata.h>
#include <vexa/graph/graphdatagroup.h>
#include <vexa/graph/spectralgraphdata.h>
#include <vexa/graph/spectralview.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <domain/reflectancespectrum.h>
#include <domain/standard.h>
#include <domain/trial.h>

#include <QEvent>
#include <QLabel>
#include <QVBoxLayout>

#include <optional>

namespace vexa {

namespace {

const QColor OtherTrialColor(90, 100, 130, 90);
// The compared curves stand out; the many others keep the fast one-pixel pen.
constexpr double EmphasisWidth = 2.0;
constexpr int StandardIndex = 0;
constexpr int SelectedTrialIndex = 1;

QString joined(const QStringList &names)
{
    return names.join(QStringLiteral(", "));
}

// A pale or coloured curve of one entry, named for the copied text ("T3 45as45").
std::shared_ptr<GraphData> entryCurve(const SpectralEntry &entry, const QColor &color)
{
    return std::make_shared<DefaultGraphData>(SpectralGraphData::spectrumPoints(*entry.spectrum),
                                              QStringLiteral("%1 %2").arg(entry.name, entry.geometry.toString()).toStdString(),
                                              color);
}

} // namespace

SpectralPlotWidget::SpectralPlotWidget(QWidget *parent)
    : QWidget(parent)
    , m_title(new QLabel(this))
    , m_view(new SpectralView(this))
{
    m_title->setObjectName(QStringLiteral("spectralTitle"));
    QFont font = m_title->font();
    font.setBold(true);
    m_title->setFont(font);
    m_title->setWordWrap(true);
    m_view->setObjectName(QStringLiteral("spectralView"));
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(4);
    layout->addWidget(m_title);
    layout->addWidget(m_view, 1);
    refreshAll();
}

SpectralPlotWidget::~SpectralPlotWidget() = default;

QColor SpectralPlotWidget::geometryColor(int n)
{
    static const QColor palette[] = {QColor(31, 119, 180), QColor(255, 127, 14), QColor(44, 160, 44),
                                     QColor(214, 39, 40),  QColor(148, 103, 189), QColor(140, 86, 75),
                                     QColor(227, 119, 194), QColor(127, 127, 127), QColor(188, 189, 34),
                                     QColor(23, 190, 207)};
    constexpr int size = int(sizeof palette / sizeof palette[0]);
    return palette[((n % size) + size) % size];
}

void SpectralPlotWidget::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                   const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    AppearanceViewBase::setModels(dataModel, selectionModel);
    refreshAll();
}

void SpectralPlotWidget::settingsChanged()
{
    refreshAll();
}

void SpectralPlotWidget::setScope(SpectralScope scope)
{
    if (scope == m_scope)
        return;
    m_scope = scope;
    refreshAll();
}

void SpectralPlotWidget::changeEvent(QEvent *event)
{
    if (event->type() == QEvent::LanguageChange)
        refreshAll();
    QWidget::changeEvent(event);
}

void SpectralPlotWidget::refreshAll()
{
    m_layerValid = false;
    refresh();
}

void SpectralPlotWidget::refresh()
{
    m_view->clear();
    if (m_scope == SpectralScope::SelectedGeometry)
        fillSelectedGeometry();
    else
        fillAllGeometries(SpectralSelection::entries(appearanceViewDataModel(), trialSelectionModel(), m_scope));
}

void SpectralPlotWidget::fillSelectedGeometry()
{
    const auto data = appearanceViewDataModel();
    const auto selection = trialSelectionModel();
    if (!data || !selection || (!data->standard() && !selection->selectedTrial() && selection->activeTrials().empty())) {
        m_layerValid = false;
        m_title->setText(tr("Spectra"));
        m_view->showInfo(tr("No standard and no trial to show").toStdString());
        return;
    }
    const Geometry geometry = selection->selectedColorGeometry();
    const std::vector<std::shared_ptr<Trial>> &activeTrials = selection->activeTrials();

    // The layer holds every active trial, the selected one too, so that selecting another
    // trial keeps it (and its drawing).
    if (!m_layerValid || m_layerTrials != activeTrials || m_layerGeometry != geometry) {
        m_activeLayer.reset();
        m_layerMissing.clear();
        auto group = std::make_shared<GraphDataGroup>(tr("Active trials (%1)").arg(activeTrials.size()).toStdString(),
                                                      OtherTrialColor);
        for (const std::shared_ptr<Trial> &trial : activeTrials) {
            if (!trial)
                continue;
            const SpectralEntry entry =
                SpectralSelection::trialEntry(*data, trial, geometry, SpectralEntry::Role::ActiveTrial);
            if (entry.spectrum)
                group->addSubData(entryCurve(entry, OtherTrialColor));
            else
                m_layerMissing << entry.name;
        }
        if (activeTrials.size() > 1)
            m_activeLayer = group;
        m_layerTrials = activeTrials;
        m_layerGeometry = geometry;
        m_layerValid = true;
    }
    if (m_activeLayer) {
        m_view->addData(m_activeLayer);
        m_view->setSeriesCached(0);
    }

    std::optional<SpectralEntry> standard;
    std::optional<SpectralEntry> selected;
    if (data->standard())
        standard = SpectralSelection::standardEntry(*data, geometry);
    const std::shared_ptr<Trial> &selectedTrial = selection->selectedTrial();
    const bool selectedActive = selectedTrial && selection->isActive(selectedTrial);
    if (selectedTrial)
        selected = SpectralSelection::trialEntry(*data, selectedTrial, geometry, SpectralEntry::Role::SelectedTrial);
    for (auto [entry, index] : {std::make_pair(&standard, StandardIndex), std::make_pair(&selected, SelectedTrialIndex)}) {
        if (!*entry)
            continue;
        auto group = std::make_shared<GraphDataGroup>((*entry)->name.toStdString(), SpectralGraphData::colorForIndex(index));
        if ((*entry)->spectrum)
            group->addSubData(std::make_shared<SpectralGraphData>((*entry)->spectrum, index));
        m_view->addData(group);
        m_view->setCurveWidth(int(m_view->data().size()) - 1, EmphasisWidth);
    }

    const QString geometryName = geometry.toString();
    QString title;
    if (standard && selected)
        title = tr("%1 against %2 at %3").arg(selected->name, standard->name, geometryName);
    else if (selected)
        title = tr("%1 at %2").arg(selected->name, geometryName);
    else if (standard)
        title = tr("%1 at %2").arg(standard->name, geometryName);
    else
        title = tr("Spectra at %1").arg(geometryName);
    const size_t others = activeTrials.size() - (selectedActive ? 1 : 0);
    if (others == 1)
        title += tr(", with one other active trial");
    else if (others > 1)
        title += tr(", with %1 other active trials").arg(others);
    m_title->setText(title);

    QStringList missing;
    if (standard && !standard->spectrum)
        missing << standard->name;
    missing << m_layerMissing;
    if (selected && !selected->spectrum && !selectedActive)
        missing << selected->name;
    if (!missing.isEmpty())
        m_view->showInfo(tr("No spectrum at %1: %2").arg(geometryName, joined(missing)).toStdString());
}

void SpectralPlotWidget::fillAllGeometries(const std::vector<SpectralEntry> &entries)
{
    m_layerValid = false;
    m_activeLayer.reset();
    // Entries come per geometry, the standard's first.
    std::vector<std::pair<Geometry, std::vector<const SpectralEntry *>>> byGeometry;
    QString standardName;
    QString trialName;
    QStringList missing;
    for (const SpectralEntry &entry : entries) {
        if (byGeometry.empty() || byGeometry.back().first != entry.geometry)
            byGeometry.emplace_back(entry.geometry, std::vector<const SpectralEntry *>());
        byGeometry.back().second.push_back(&entry);
        (entry.role == SpectralEntry::Role::Standard ? standardName : trialName) = entry.name;
        if (!entry.spectrum)
            missing << QStringLiteral("%1 %2").arg(entry.name, entry.geometry.toString());
    }
    for (int n = 0; n < int(byGeometry.size()); ++n) {
        const QColor color = geometryColor(n);
        QColor pale = color;
        pale.setAlpha(trialName.isEmpty() ? 255 : 110);
        auto group = std::make_shared<GraphDataGroup>(byGeometry[size_t(n)].first.toString().toStdString(), color);
        for (const SpectralEntry *entry : byGeometry[size_t(n)].second) {
            if (entry->spectrum)
                group->addSubData(entryCurve(*entry, entry->role == SpectralEntry::Role::Standard ? pale : color));
        }
        m_view->addData(group);
        m_view->setCurveWidth(n, EmphasisWidth);
    }

    if (trialName.isEmpty() && standardName.isEmpty()) {
        m_title->setText(tr("Spectra"));
        m_view->showInfo(tr("No standard and no trial to show").toStdString());
        return;
    }
    if (trialName.isEmpty())
        m_title->setText(tr("%1 at every geometry").arg(standardName));
    else if (standardName.isEmpty())
        m_title->setText(tr("%1 at every geometry").arg(trialName));
    else
        m_title->setText(tr("%1 (solid) against %2 (pale) at every geometry").arg(trialName, standardName));
    if (byGeometry.empty())
        m_view->showInfo(tr("No spectra").toStdString());
    else if (!missing.isEmpty())
        m_view->showInfo(tr("No spectrum: %1").arg(joined(missing)).toStdString());
}

} // namespace vexa
