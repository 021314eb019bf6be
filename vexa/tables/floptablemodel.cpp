#include <vexa/tables/floptablemodel.h>

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/widgets/verdictcolors.h>

#include <colorimetry/colorconverter.h>
#include <colorimetry/colorindicescalculator.h>
#include <domain/appearancevalues.h>
#include <domain/geometry.h>
#include <domain/labvalue.h>
#include <domain/observer.h>
#include <domain/standard.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>
#include <settings/generalsettings.h>
#include <tolerances/tolerancetypes.h>

#include <QChar>

#include <cmath>

namespace vexa {

FlopTableModel::FlopTableModel(std::shared_ptr<GeneralSettings> generalSettings, QObject *parent)
    : QAbstractTableModel(parent)
    , m_generalSettings(std::move(generalSettings))
    , m_headers{tr("Name"), QString(QChar(0x0394)) + QStringLiteral("Flop-index"), QStringLiteral("Flop-index")}
    , m_condition(conditionFromSettings())
{
    if (m_generalSettings)
        m_settingsConnection = connect(m_generalSettings.get(), &CommonSettings::settingsChanged, this,
                                       &FlopTableModel::onConditionChanged);
}

FlopTableModel::~FlopTableModel()
{
    disconnectModels();
    QObject::disconnect(m_settingsConnection);
}

void FlopTableModel::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                               const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    disconnectModels();
    m_dataModel = dataModel;
    m_selectionModel = selectionModel;
    connectModels();
    refresh();
}

void FlopTableModel::connectModels()
{
    if (m_dataModel) {
        auto *model = m_dataModel.get();
        const auto reset = &FlopTableModel::refresh;
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgQCJobChanged, this, reset));
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgStandardChanged, this, reset));
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgTrialsChanged, this, reset));
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgToleranceSetChanged, this,
                                        &FlopTableModel::onToleranceChanged));
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgJobTemplateChanged, this,
                                        &FlopTableModel::onToleranceChanged));
        m_connections.push_back(connect(model, &AppearanceViewDataModel::sgColorimetricConditionChanged, this,
                                        &FlopTableModel::onConditionChanged));
    }
    if (m_selectionModel)
        m_connections.push_back(connect(m_selectionModel.get(), &TrialSelectionModel::sgTrialSelectionChanged, this,
                                        &FlopTableModel::onSelectedTrialChanged));
}

void FlopTableModel::disconnectModels()
{
    for (const auto &connection : m_connections)
        QObject::disconnect(connection);
    m_connections.clear();
}

void FlopTableModel::setSelectedTrialOnly(bool selectedTrialOnly)
{
    if (selectedTrialOnly == m_selectedTrialOnly)
        return;
    beginResetModel();
    m_selectedTrialOnly = selectedTrialOnly;
    rebuildRows();
    endResetModel();
}

ColorimetricCondition FlopTableModel::conditionFromSettings() const
{
    ColorimetricCondition condition; // D65/10 without settings
    if (m_generalSettings) {
        bool ok = false;
        const ColorimetricCondition general = ColorimetricCondition::fromString(m_generalSettings->colorimetricCondition(), &ok);
        if (ok)
            condition.setIlluminant(general.illuminant());
    }
    condition.setObserver(QStringLiteral("10"));
    return condition;
}

std::shared_ptr<Tolerance> FlopTableModel::flopToleranceOf(const AppearanceViewDataModel &dataModel)
{
    const auto firstFlop = [](const std::shared_ptr<ToleranceSet> &set) -> std::shared_ptr<Tolerance> {
        if (!set)
            return nullptr;
        for (const auto &tolerance : set->tolerances()) {
            if (tolerance && tolerance->toleranceType() == ToleranceTypes::FlopIndex)
                return tolerance;
        }
        return nullptr;
    };
    const auto current = dataModel.currentToleranceSet();
    if (auto tolerance = firstFlop(current))
        return tolerance;
    for (const auto &set : dataModel.toleranceSets()) {
        if (set == current)
            continue;
        if (auto tolerance = firstFlop(set))
            return tolerance;
    }
    return nullptr;
}

void FlopTableModel::refresh()
{
    beginResetModel();
    m_flops.clear();
    m_verdicts.clear();
    m_condition = conditionFromSettings();
    m_flopTolerance = m_dataModel ? flopToleranceOf(*m_dataModel) : nullptr;
    rebuildRows();
    endResetModel();
}

void FlopTableModel::rebuildRows()
{
    m_rowOfTrial.clear();
    m_trials.clear();
    m_standard = m_dataModel ? m_dataModel->standard() : nullptr;
    if (!m_standard)
        return;
    if (m_selectedTrialOnly) {
        if (m_selectionModel && m_selectionModel->selectedTrial())
            m_trials.push_back(m_selectionModel->selectedTrial());
    } else {
        m_trials = m_dataModel->trials();
    }
}

void FlopTableModel::onSelectedTrialChanged()
{
    if (!m_selectedTrialOnly || !m_standard)
        return;
    const auto selected = m_selectionModel ? m_selectionModel->selectedTrial() : nullptr;
    const auto shown = m_trials.empty() ? nullptr : m_trials.front();
    if (selected == shown)
        return;
    if (shown && selected) {
        m_trials.front() = selected;
        Q_EMIT dataChanged(index(1, 0), index(1, columnCount() - 1));
    } else if (selected) {
        beginInsertRows(QModelIndex(), 1, 1);
        m_trials.push_back(selected);
        endInsertRows();
    } else {
        beginRemoveRows(QModelIndex(), 1, 1);
        m_trials.clear();
        endRemoveRows();
    }
}

void FlopTableModel::onToleranceChanged()
{
    const auto tolerance = m_dataModel ? flopToleranceOf(*m_dataModel) : nullptr;
    if (tolerance == m_flopTolerance)
        return;
    m_flopTolerance = tolerance;
    m_verdicts.clear();
    if (rowCount() > 0)
        Q_EMIT dataChanged(index(0, FlopDifferenceColumn), index(rowCount() - 1, FlopDifferenceColumn),
                           {Qt::BackgroundRole});
}

void FlopTableModel::onConditionChanged()
{
    const ColorimetricCondition condition = conditionFromSettings();
    if (condition == m_condition)
        return;
    m_condition = condition;
    m_flops.clear();
    m_verdicts.clear();
    if (rowCount() > 0)
        Q_EMIT dataChanged(index(0, FlopDifferenceColumn), index(rowCount() - 1, FlopColumn));
}

const FlopTableModel::Cached &FlopTableModel::flopOf(const std::shared_ptr<AppearanceValues> &values) const
{
    static const Cached none{nullptr, 0.0, false};
    if (!values)
        return none;
    const auto found = m_flops.find(values.get());
    if (found != m_flops.end())
        return found->second;
    Cached cached{values, 0.0, false};
    const LabValue lab15 = ColorConverter::toLabValue(*values, Geometry(Geometry::ANGLE_45as15), m_condition);
    const LabValue lab45 = ColorConverter::toLabValue(*values, Geometry(Geometry::ANGLE_45as45), m_condition);
    const LabValue lab110 = ColorConverter::toLabValue(*values, Geometry(Geometry::ANGLE_45as110), m_condition);
    if (lab15.isValid() && lab45.isValid() && lab110.isValid()) {
        cached.flop = ColorIndicesCalculator::FlopIndex(lab15, lab45, lab110);
        cached.valid = std::isfinite(cached.flop);
    }
    return m_flops.emplace(values.get(), std::move(cached)).first->second;
}

bool FlopTableModel::didGetFlop(const std::shared_ptr<AppearanceValues> &values, double &flop) const
{
    const Cached &cached = flopOf(values);
    if (!cached.valid)
        return false;
    flop = cached.flop;
    return true;
}

bool FlopTableModel::didGetdFlop(const std::shared_ptr<Trial> &trial, double &dFlop) const
{
    double trialFlop = 0.0;
    double standardFlop = 0.0;
    if (!trial || !m_standard || !didGetFlop(trial->appearanceValues(), trialFlop)
        || !didGetFlop(m_standard->appearanceValues(), standardFlop))
        return false;
    dFlop = trialFlop - standardFlop;
    return true;
}

std::shared_ptr<NamedObject> FlopTableModel::objectAt(int row) const
{
    if (row == 0)
        return m_standard;
    return trialAt(row);
}

std::shared_ptr<Trial> FlopTableModel::trialAt(int row) const
{
    if (!m_standard || row < 1 || row > int(m_trials.size()))
        return nullptr;
    return m_trials[size_t(row - 1)];
}

int FlopTableModel::rowOf(const std::shared_ptr<Trial> &trial) const
{
    if (!trial || !m_standard)
        return -1;
    if (m_rowOfTrial.empty() && !m_trials.empty()) {
        m_rowOfTrial.reserve(m_trials.size());
        for (size_t i = 0; i < m_trials.size(); ++i)
            m_rowOfTrial.emplace(m_trials[i].get(), int(i) + 1); // the first row of a trial listed twice
    }
    if (m_selectedTrialOnly)
        return !m_trials.empty() && m_trials.front() == trial ? 1 : -1;
    const auto found = m_rowOfTrial.find(trial.get());
    return found == m_rowOfTrial.end() ? -1 : found->second;
}

int FlopTableModel::rowCount(const QModelIndex &parent) const
{
    if (parent.isValid() || !m_standard)
        return 0;
    return 1 + int(m_trials.size());
}

int FlopTableModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : int(m_headers.size());
}

QVariant FlopTableModel::verdictColor(int row) const
{
    const auto trial = trialAt(row);
    const auto values = trial ? trial->appearanceValues() : nullptr;
    const auto standardValues = m_standard ? m_standard->appearanceValues() : nullptr;
    if (!m_flopTolerance || !values || !standardValues)
        return QVariant();
    auto found = m_verdicts.find(values.get());
    if (found == m_verdicts.end()) {
        const int status = m_flopTolerance->status(*values, *standardValues, m_condition);
        found = m_verdicts.emplace(values.get(), Verdict{values, status}).first;
    }
    const QColor color = VerdictColors::colorOfStatus(found->second.status);
    return color.isValid() ? QVariant(color) : QVariant();
}

QVariant FlopTableModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || index.model() != this || index.row() >= rowCount() || index.column() >= columnCount())
        return QVariant();
    const int row = index.row();
    switch (role) {
    case Qt::DisplayRole: {
        const auto object = objectAt(row);
        if (!object)
            return QVariant();
        double value = 0.0;
        switch (index.column()) {
        case NameColumn: return object->name();
        case FlopDifferenceColumn:
            return row > 0 && didGetdFlop(trialAt(row), value) ? QVariant(value) : QVariant();
        case FlopColumn: {
            const auto values = row == 0 ? m_standard->appearanceValues() : trialAt(row)->appearanceValues();
            return didGetFlop(values, value) ? QVariant(value) : QVariant();
        }
        default: return QVariant();
        }
    }
    case Qt::TextAlignmentRole:
        return index.column() == NameColumn ? int(Qt::AlignLeft | Qt::AlignVCenter) : int(Qt::AlignCenter);
    case Qt::BackgroundRole:
        if (index.column() != FlopDifferenceColumn || row == 0)
            return QVariant();
        return verdictColor(row);
    default: return QVariant();
    }
}

QVariant FlopTableModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation == Qt::Horizontal && role == Qt::DisplayRole && section >= 0 && section < m_headers.size())
        return m_headers.at(section);
    return QAbstractTableModel::headerData(section, orientation, role);
}

} // namespace vexa
