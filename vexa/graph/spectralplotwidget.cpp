#include <vexa/graph/spectralplotwidget.h>

#include <vexa/graph/defaultgraphdata.h>
#include <vexa/graph/graphdatagroup.h>
#include <vexa/graph/spectralgraphdata.h>
#include <vexa/graph/spectralview.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <domain/reflectancespectrum.h>

#include <QEvent>
#include <QLabel>
#include <QVBoxLayout>

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
    m_view->clear();
    const auto entries = SpectralSelection::entries(appearanceViewDataModel(), trialSelectionModel(), m_scope);
    if (m_scope == SpectralScope::SelectedGeometry)
        fillSelectedGeometry(entries);
    else
        fillAllGeometries(entries);
}

void SpectralPlotWidget::fillSelectedGeometry(const std::vector<SpectralEntry> &entries)
{
    const auto selection = trialSelectionModel();
    const QString geometry = selection ? selection->selectedColorGeometry().toString() : QString();
    const SpectralEntry *standard = nullptr;
    const SpectralEntry *selected = nullptr;
    std::vector<const SpectralEntry *> active;
    QStringList missing;
    for (const SpectralEntry &entry : entries) {
        if (entry.role == SpectralEntry::Role::Standard)
            standard = &entry;
        else if (entry.role == SpectralEntry::Role::SelectedTrial)
            selected = &entry;
        if (entry.trial && selection->isActive(entry.trial))
            active.push_back(&entry);
        if (!entry.spectrum)
            missing << entry.name;
    }
    const size_t others = active.size() - (selected && selection->isActive(selected->trial) ? 1 : 0);

    // The selected trial is part of the layer too, so that selecting another one keeps it.
    std::vector<std::shared_ptr<ReflectanceSpectrum>> layerSpectra;
    for (const SpectralEntry *entry : active)
        layerSpectra.push_back(entry->spectrum);
    if (layerSpectra.empty()) {
        m_activeLayer.reset();
    } else if (!m_activeLayer || layerSpectra != m_activeLayerSpectra) {
        auto group = std::make_shared<GraphDataGroup>(tr("Active trials (%1)").arg(active.size()).toStdString(),
                                                      OtherTrialColor);
        for (const SpectralEntry *entry : active) {
            if (entry->spectrum)
                group->addSubData(entryCurve(*entry, OtherTrialColor));
        }
        m_activeLayer = group;
    }
    m_activeLayerSpectra = layerSpectra;
    if (m_activeLayer && active.size() > 1) {
        m_view->addData(m_activeLayer);
        m_view->setSeriesCached(0);
    }
    for (const auto &[entry, index] : {std::make_pair(standard, StandardIndex), std::make_pair(selected, SelectedTrialIndex)}) {
        if (!entry)
            continue;
        auto group = std::make_shared<GraphDataGroup>(entry->name.toStdString(), SpectralGraphData::colorForIndex(index));
        if (entry->spectrum)
            group->addSubData(std::make_shared<SpectralGraphData>(entry->spectrum, index));
        m_view->addData(group);
        m_view->setCurveWidth(int(m_view->data().size()) - 1, EmphasisWidth);
    }

    if (entries.empty()) {
        m_title->setText(tr("Spectra"));
        m_view->showInfo(tr("No standard and no trial to show").toStdString());
        return;
    }
    QString title;
    if (standard && selected)
        title = tr("%1 against %2 at %3").arg(selected->name, standard->name, geometry);
    else if (selected)
        title = tr("%1 at %2").arg(selected->name, geometry);
    else if (standard)
        title = tr("%1 at %2").arg(standard->name, geometry);
    else
        title = tr("Spectra at %1").arg(geometry);
    if (others == 1)
        title += tr(", with one other active trial");
    else if (others > 1)
        title += tr(", with %1 other active trials").arg(others);
    m_title->setText(title);
    if (!missing.isEmpty())
        m_view->showInfo(tr("No spectrum at %1: %2").arg(geometry, joined(missing)).toStdString());
}

void SpectralPlotWidget::fillAllGeometries(const std::vector<SpectralEntry> &entries)
{
    m_activeLayer.reset();
    m_activeLayerSpectra.clear();
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
