#include <vexa/graph/spectralvaluetablemodel.h>

#include <vexa/graph/spectralgraphdata.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/widgets/qttablemodelhelper.h>

#include <domain/reflectancespectrum.h>

#include <QBrush>
#include <QFont>

#include <algorithm>
#include <cmath>
#include <limits>
#include <map>
#include <set>

namespace vexa {

namespace {

constexpr double NaN = std::numeric_limits<double>::quiet_NaN();
const QColor HighlightColor(226, 234, 250);

// A spectrum's values by wavelength (the graph's whole-nanometre grid); the first value
// at a repeated wavelength counts.
std::map<double, double> valuesByWavelength(const std::shared_ptr<ReflectanceSpectrum> &spectrum)
{
    std::map<double, double> values;
    if (!spectrum)
        return values;
    for (const GraphPoint &p : SpectralGraphData::spectrumPoints(*spectrum))
        values.emplace(p.x(), p.y());
    return values;
}

std::vector<double> column(const std::map<double, double> &values, const std::vector<double> &wavelengths)
{
    std::vector<double> result;
    result.reserve(wavelengths.size());
    for (double nm : wavelengths) {
        const auto it = values.find(nm);
        result.push_back(it != values.end() && std::isfinite(it->second) ? it->second : NaN);
    }
    return result;
}

} // namespace

SpectralValueTableModel::SpectralValueTableModel(QObject *parent)
    : QAbstractTableModel(parent)
{
}

SpectralValueTableModel::~SpectralValueTableModel() = default;

void SpectralValueTableModel::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                        const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    AppearanceViewBase::setModels(dataModel, selectionModel);
    refreshAll();
}

void SpectralValueTableModel::settingsChanged()
{
    refreshAll();
}

void SpectralValueTableModel::setScope(SpectralScope scope)
{
    if (scope == m_scope)
        return;
    m_scope = scope;
    refreshAll();
}

void SpectralValueTableModel::setDecimals(int decimals)
{
    decimals = std::clamp(decimals, 0, 8);
    if (decimals == m_decimals)
        return;
    m_decimals = decimals;
    if (rowCount() > 0 && columnCount() > 0)
        Q_EMIT dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1));
}

void SpectralValueTableModel::refreshAll()
{
    beginResetModel();
    rebuild();
    endResetModel();
}

void SpectralValueTableModel::rebuild()
{
    m_entries = SpectralSelection::entries(appearanceViewDataModel(), trialSelectionModel(), m_scope);
    m_wavelengths.clear();
    m_columns.clear();
    if (m_entries.empty())
        return;

    std::vector<std::map<double, double>> values;
    std::vector<std::map<double, double>> references;
    std::set<double> wavelengths;
    for (const SpectralEntry &entry : m_entries) {
        values.push_back(valuesByWavelength(entry.spectrum));
        references.push_back(valuesByWavelength(entry.reference));
        for (const auto &v : values.back()) {
            if (std::isfinite(v.first))
                wavelengths.insert(v.first);
        }
    }
    m_wavelengths.assign(wavelengths.begin(), wavelengths.end());

    const bool withStandard = std::any_of(m_entries.begin(), m_entries.end(), [](const SpectralEntry &e) {
        return e.role == SpectralEntry::Role::Standard;
    });
    m_columns.push_back(Column{ColumnKind::Wavelength, -1, m_wavelengths});
    for (int e = 0; e < int(m_entries.size()); ++e) {
        m_columns.push_back(Column{ColumnKind::Reflectance, e, column(values[size_t(e)], m_wavelengths)});
        if (m_entries[size_t(e)].role == SpectralEntry::Role::Standard || !withStandard)
            continue;
        Column difference{ColumnKind::Difference, e, column(references[size_t(e)], m_wavelengths)};
        const std::vector<double> &trial = m_columns.back().values;
        for (size_t r = 0; r < difference.values.size(); ++r)
            difference.values[r] = trial[r] - difference.values[r]; // NaN stays NaN
        m_columns.push_back(std::move(difference));
    }
}

// A new selected trial among the shown ones moves the highlight only; anything else
// rebuilds the table.
void SpectralValueTableModel::onTrialSelected()
{
    const auto selection = trialSelectionModel();
    const std::shared_ptr<Trial> selected = selection ? selection->selectedTrial() : nullptr;
    // The columns stay when they are the active trials' before and after: neither the old
    // nor the new selected trial is an inactive one shown behind them.
    const bool inactiveShown = !m_entries.empty() && m_entries.back().trial && selection
        && !selection->isActive(m_entries.back().trial);
    if (m_scope != SpectralScope::SelectedGeometry || !selection || inactiveShown
        || (selected && !selection->isActive(selected))) {
        refreshAll();
        return;
    }
    for (SpectralEntry &entry : m_entries) {
        if (entry.trial)
            entry.role = entry.trial == selected ? SpectralEntry::Role::SelectedTrial : SpectralEntry::Role::ActiveTrial;
    }
    if (rowCount() > 0 && columnCount() > 1)
        Q_EMIT dataChanged(index(0, 1), index(rowCount() - 1, columnCount() - 1), {Qt::FontRole, Qt::BackgroundRole});
    if (columnCount() > 1)
        Q_EMIT headerDataChanged(Qt::Horizontal, 1, columnCount() - 1);
}

SpectralValueTableModel::ColumnKind SpectralValueTableModel::columnKind(int column) const
{
    if (column < 0 || column >= int(m_columns.size()))
        return ColumnKind::Wavelength;
    return m_columns[size_t(column)].kind;
}

const SpectralEntry *SpectralValueTableModel::entryAt(int column) const
{
    if (column < 0 || column >= int(m_columns.size()) || m_columns[size_t(column)].entry < 0)
        return nullptr;
    return &m_entries[size_t(m_columns[size_t(column)].entry)];
}

int SpectralValueTableModel::columnOf(const std::shared_ptr<Trial> &trial) const
{
    if (!trial)
        return -1;
    for (int c = 0; c < int(m_columns.size()); ++c) {
        const SpectralEntry *entry = entryAt(c);
        if (entry && entry->trial == trial)
            return c;
    }
    return -1;
}

double SpectralValueTableModel::wavelengthAt(int row) const
{
    return row >= 0 && row < int(m_wavelengths.size()) ? m_wavelengths[size_t(row)] : NaN;
}

int SpectralValueTableModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : int(m_wavelengths.size());
}

int SpectralValueTableModel::columnCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : int(m_columns.size());
}

bool SpectralValueTableModel::isHighlighted(int column) const
{
    const SpectralEntry *entry = entryAt(column);
    return entry && entry->role == SpectralEntry::Role::SelectedTrial && m_scope == SpectralScope::SelectedGeometry;
}

QVariant SpectralValueTableModel::value(const QModelIndex &index) const
{
    const double v = m_columns[size_t(index.column())].values[size_t(index.row())];
    return std::isfinite(v) ? QVariant(v) : QVariant();
}

QVariant SpectralValueTableModel::data(const QModelIndex &index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid | CheckIndexOption::ParentIsInvalid))
        return QVariant();
    const bool wavelength = columnKind(index.column()) == ColumnKind::Wavelength;
    const int decimals = wavelength ? 0 : m_decimals;
    switch (role) {
    case Qt::DisplayRole:
        return QtTableModelHelper::displayDataFormater(this, index, decimals);
    case ExportValueRole:
        return value(index);
    case ExportNumberFormatRole:
        return QtTableModelHelper::doubleDataFormater(decimals);
    case Qt::TextAlignmentRole:
        return int(Qt::AlignRight | Qt::AlignVCenter);
    case Qt::FontRole:
        if (isHighlighted(index.column()) || wavelength) {
            QFont font;
            font.setBold(true);
            return font;
        }
        return QVariant();
    case Qt::BackgroundRole:
        return isHighlighted(index.column()) ? QVariant(QBrush(HighlightColor)) : QVariant();
    default:
        return QVariant();
    }
}

QVariant SpectralValueTableModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation == Qt::Vertical)
        return role == Qt::DisplayRole ? QVariant(section + 1) : QVariant();
    if (section < 0 || section >= int(m_columns.size()))
        return QVariant();
    const Column &c = m_columns[size_t(section)];
    const SpectralEntry *entry = entryAt(section);
    const QString label = !entry ? QString()
        : m_scope == SpectralScope::AllGeometries
        ? QStringLiteral("%1 %2").arg(entry->name, entry->geometry.toString())
        : entry->name;
    switch (role) {
    case Qt::DisplayRole:
        if (c.kind == ColumnKind::Wavelength)
            return tr("nm");
        return c.kind == ColumnKind::Difference ? tr("ΔR %1").arg(label) : label;
    case Qt::ToolTipRole:
        if (c.kind == ColumnKind::Wavelength)
            return tr("Wavelength in nanometres");
        if (c.kind == ColumnKind::Difference)
            return tr("Reflectance factor of %1 minus the standard's at %2").arg(entry->name, entry->geometry.toString());
        return tr("Reflectance factor of %1 at %2").arg(entry->name, entry->geometry.toString());
    case Qt::FontRole:
        if (isHighlighted(section)) {
            QFont font;
            font.setBold(true);
            return font;
        }
        return QVariant();
    default:
        return QVariant();
    }
}

} // namespace vexa
