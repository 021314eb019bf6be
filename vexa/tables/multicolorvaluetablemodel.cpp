#include <vexa/tables/multicolorvaluetablemodel.h>

#include <vexa/widgets/verdictcolors.h>

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/colorcomparesettings.h>
#include <vexa/models/geometryprovider.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/tolerance/toleranceselector.h>
#include <vexa/widgets/qttablemodelhelper.h>
#include <vexa/widgets/uihelper.h>

#include <domain/appearancevalues.h>
#include <domain/labchvalue.h>
#include <domain/labvalue.h>
#include <domain/standard.h>
#include <domain/trial.h>
#include <settings/generalsettings.h>

#include <QApplication>
#include <QColor>
#include <QDateTime>
#include <QFontMetrics>
#include <QSize>

#include <algorithm>

namespace vexa {

namespace {

std::shared_ptr<LabChValue> toLabCh(const std::shared_ptr<LabValue> &lab)
{
    if (!lab || !lab->isValid())
        return nullptr;
    return std::make_shared<LabChValue>(*lab);
}

bool isFloatingPoint(const QVariant &value)
{
    const int type = value.userType();
    return type == QMetaType::Double || type == QMetaType::Float;
}

QString dateTimeText(const QDateTime &dateTime)
{
    return dateTime.toLocalTime().toString(QStringLiteral("yyyy-MM-dd HH:mm:ss"));
}

} // namespace

MultiColorValueTableModel::MultiColorValueTableModel(std::shared_ptr<ColorCompareSettings> settings,
                                                     std::shared_ptr<GeneralSettings> generalSettings,
                                                     QObject *parent)
    : QAbstractTableModel(parent)
    , m_settings(std::move(settings))
    , m_generalSettings(std::move(generalSettings))
    , m_generalColumns{GeneralColumn::Name, GeneralColumn::Geometry, GeneralColumn::DateTime}
    , m_toleranceSelector(new ToleranceSelector(this))
{
    if (m_settings)
        m_settingsConnection = connect(m_settings.get(), &CommonSettings::settingsChanged, this,
                                       &MultiColorValueTableModel::refresh);
    rebuild();
}

MultiColorValueTableModel::~MultiColorValueTableModel()
{
    disconnectModels();
    QObject::disconnect(m_settingsConnection);
}

void MultiColorValueTableModel::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                                          const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    disconnectModels();
    m_dataModel = dataModel;
    m_selectionModel = selectionModel;
    if (!m_customProvider)
        m_provider = m_selectionModel ? std::make_shared<SelectorGeometryProvider>(*m_selectionModel) : nullptr;
    m_toleranceSelector->setDataModel(m_dataModel);
    connectModels();
    refresh();
}

void MultiColorValueTableModel::connectModels()
{
    const auto refreshSlot = &MultiColorValueTableModel::refresh;
    if (m_dataModel) {
        auto *model = m_dataModel.get();
        m_modelConnections.push_back(connect(model, &AppearanceViewDataModel::sgQCJobChanged, this, refreshSlot));
        m_modelConnections.push_back(connect(model, &AppearanceViewDataModel::sgStandardChanged, this, refreshSlot));
        m_modelConnections.push_back(
            connect(model, &AppearanceViewDataModel::sgToleranceSetChanged, this, refreshSlot));
        m_modelConnections.push_back(connect(model, &AppearanceViewDataModel::sgTrialsChanged, this, refreshSlot));
        m_modelConnections.push_back(
            connect(model, &AppearanceViewDataModel::sgColorimetricConditionChanged, this, refreshSlot));
        m_modelConnections.push_back(
            connect(model, &AppearanceViewDataModel::sgJobTemplateChanged, this, refreshSlot));
    }
    if (m_selectionModel) {
        auto *model = m_selectionModel.get();
        m_modelConnections.push_back(
            connect(model, &TrialSelectionModel::sgActiveTrialsChanged, this, refreshSlot));
        m_modelConnections.push_back(
            connect(model, &TrialSelectionModel::sgColorGeometryFilterChanged, this, refreshSlot));
    }
}

void MultiColorValueTableModel::disconnectModels()
{
    for (const auto &connection : m_modelConnections)
        QObject::disconnect(connection);
    m_modelConnections.clear();
}

void MultiColorValueTableModel::setGeometryProvider(const std::shared_ptr<GeometryProvider> &provider)
{
    m_customProvider = provider != nullptr;
    if (provider)
        m_provider = provider;
    else
        m_provider = m_selectionModel ? std::make_shared<SelectorGeometryProvider>(*m_selectionModel) : nullptr;
    refresh();
}

void MultiColorValueTableModel::setShowStandard(bool show)
{
    if (show == m_showStandard)
        return;
    m_showStandard = show;
    refresh();
}

void MultiColorValueTableModel::setColumns(const std::vector<std::shared_ptr<ColumnDefinition>> &columns)
{
    m_explicitColumns.clear();
    std::copy_if(columns.begin(), columns.end(), std::back_inserter(m_explicitColumns),
                 [](const std::shared_ptr<ColumnDefinition> &column) { return column != nullptr; });
    refresh();
}

void MultiColorValueTableModel::setGeneralColumns(const std::vector<GeneralColumn> &columns)
{
    m_generalColumns = columns;
    refresh();
}

void MultiColorValueTableModel::setDecimals(int decimals)
{
    decimals = std::clamp(decimals, 0, 10);
    if (decimals == m_decimals)
        return;
    m_decimals = decimals;
    if (rowCount() > 0 && columnCount() > 0)
        Q_EMIT dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1));
}

ColorimetricCondition MultiColorValueTableModel::colorimetricCondition() const
{
    return m_dataModel ? m_dataModel->colorimetricCondition() : ColorimetricCondition();
}

std::shared_ptr<MultiColorValueTableModel> MultiColorValueTableModel::clone() const
{
    auto copy = std::make_shared<MultiColorValueTableModel>(m_settings, m_generalSettings);
    copy->m_showStandard = m_showStandard;
    copy->m_decimals = m_decimals;
    copy->m_generalColumns = m_generalColumns;
    copy->m_explicitColumns = m_explicitColumns;
    if (m_customProvider) {
        copy->m_customProvider = true;
        copy->m_provider = m_provider;
    }
    copy->setModels(m_dataModel, m_selectionModel);
    return copy;
}

std::shared_ptr<AppearanceViewTableModelRow> MultiColorValueTableModel::rowAt(int row) const
{
    if (row < 0 || row >= int(m_rows.size()))
        return nullptr;
    return m_rows[size_t(row)];
}

std::shared_ptr<ColumnDefinition> MultiColorValueTableModel::columnAt(int column) const
{
    const auto &columns = m_explicitColumns.empty() ? m_builtColumns : m_explicitColumns;
    if (column < 0 || column >= int(columns.size()))
        return nullptr;
    return columns[size_t(column)];
}

int MultiColorValueTableModel::rowOf(const std::shared_ptr<Trial> &trial, const Geometry &geometry) const
{
    if (!trial)
        return -1;
    for (size_t i = 0; i < m_rows.size(); ++i) {
        const auto &row = *m_rows[i];
        if (!row.isStandard() && row.namedObject() == trial && row.geometry() == geometry)
            return int(i);
    }
    return -1;
}

int MultiColorValueTableModel::standardRowOf(const Geometry &geometry) const
{
    for (size_t i = 0; i < m_rows.size(); ++i) {
        const auto &row = *m_rows[i];
        if (!row.isStandard())
            break; // The standard's rows come first.
        if (row.geometry() == geometry)
            return int(i);
    }
    return -1;
}

void MultiColorValueTableModel::refresh()
{
    beginResetModel();
    rebuild();
    endResetModel();
}

void MultiColorValueTableModel::rebuild()
{
    buildColumns();
    buildRows();
}

void MultiColorValueTableModel::buildColumns()
{
    m_builtColumns.clear();
    for (GeneralColumn column : m_generalColumns) {
        switch (column) {
        case GeneralColumn::Name: m_builtColumns.push_back(std::make_shared<ColumnDefinitionName>()); break;
        case GeneralColumn::Geometry: m_builtColumns.push_back(std::make_shared<ColumnDefinitionGeometry>()); break;
        case GeneralColumn::DateTime: m_builtColumns.push_back(std::make_shared<ColumnDefinitionDateTime>()); break;
        case GeneralColumn::InstrumentInfo:
            m_builtColumns.push_back(std::make_shared<ColumnDefinitionInstrumentInfo>());
            break;
        }
    }
    if (!m_settings)
        return;
    for (EColorSpaceCoordinate coordinate : m_settings->enabledTableColorSpaceCoordinates())
        m_builtColumns.push_back(
            std::make_shared<ColumnDefinitionLabCh>(ColumnDefinitionLabCh::Column(int(coordinate)), *this));
    for (EColorSpaceCoordinate coordinate : m_settings->enabledTableStandardColorSpaceCoordinates())
        m_builtColumns.push_back(std::make_shared<ColumnDefinitionStandardLabCh>(coordinate, *this));
    for (EColorSpaceDelta delta : m_settings->enabledTableDEMetricDeltas())
        m_builtColumns.push_back(std::make_shared<ColumnDefinitionColorDifference>(delta));
    if (m_settings->tableTolerancesEnabled() && m_dataModel) {
        for (const auto &set : m_dataModel->toleranceSets()) {
            if (set)
                m_builtColumns.push_back(std::make_shared<ColumnDefinitionToleranceSet>(set));
        }
    }
}

std::vector<std::shared_ptr<Trial>> MultiColorValueTableModel::shownTrials() const
{
    std::vector<std::shared_ptr<Trial>> trials;
    if (m_selectionModel && !m_selectionModel->activeTrials().empty())
        trials = m_selectionModel->activeTrials();
    else if (m_dataModel)
        trials = m_dataModel->trials();
    trials.erase(std::remove(trials.begin(), trials.end(), nullptr), trials.end());
    return trials;
}

std::set<Geometry> MultiColorValueTableModel::geometriesToShow(const std::vector<std::shared_ptr<Trial>> &trials,
                                                                const std::shared_ptr<Standard> &standard) const
{
    std::set<Geometry> geometries;
    if (m_provider)
        geometries = m_provider->geometries();
    geometries.erase(Geometry());
    if (!geometries.empty())
        return geometries;
    const auto collect = [&geometries](const std::shared_ptr<AppearanceValues> &values) {
        if (!values)
            return;
        for (const auto &colorValues : values->colorValues()) {
            if (colorValues && colorValues->geometry().isValid())
                geometries.insert(colorValues->geometry());
        }
    };
    if (standard)
        collect(standard->appearanceValues());
    for (const auto &trial : trials)
        collect(trial->appearanceValues());
    return geometries;
}

void MultiColorValueTableModel::buildRows()
{
    m_rows.clear();
    m_geometries.clear();
    if (!m_dataModel)
        return;
    const auto trials = shownTrials();
    const auto standard = m_dataModel->standard();
    const auto standardValues = standard ? standard->appearanceValues() : nullptr;
    const auto geometrySet = geometriesToShow(trials, m_showStandard ? standard : nullptr);
    m_geometries.assign(geometrySet.begin(), geometrySet.end());
    const ColorimetricCondition condition = m_dataModel->colorimetricCondition();
    const QString nameFormat = QString::fromStdString(m_dataModel->nameFormat());

    std::vector<std::shared_ptr<LabChValue>> standardLab;
    standardLab.reserve(m_geometries.size());
    for (const Geometry &geometry : m_geometries)
        standardLab.push_back(standardValues ? toLabCh(m_dataModel->appearanceValueToLab(standardValues, geometry))
                                             : nullptr);

    m_rows.reserve((trials.size() + (m_showStandard && standard ? 1 : 0)) * m_geometries.size());
    if (m_showStandard && standard) {
        const std::string name = UIHelper::trialDisplayString(*standard, QString()).toStdString();
        for (size_t g = 0; g < m_geometries.size(); ++g) {
            AppearanceViewTableModelRow::Data data;
            data.geometry = m_geometries[g];
            data.object = standard;
            data.appearanceValues = standardValues;
            data.labCh = standardLab[g];
            data.standardAppearanceValues = standardValues;
            data.standardLabCh = standardLab[g];
            data.colorimetricCondition = condition;
            data.displayName = name;
            data.isStandard = true;
            m_rows.push_back(std::make_shared<AppearanceViewTableModelRow>(std::move(data)));
        }
    }
    for (const auto &trial : trials) {
        const auto values = trial->appearanceValues();
        const std::string name = UIHelper::trialDisplayString(*trial, nameFormat).toStdString();
        for (size_t g = 0; g < m_geometries.size(); ++g) {
            AppearanceViewTableModelRow::Data data;
            data.geometry = m_geometries[g];
            data.object = trial;
            data.appearanceValues = values;
            data.labCh = values ? toLabCh(m_dataModel->appearanceValueToLab(values, m_geometries[g])) : nullptr;
            data.standardAppearanceValues = standardValues;
            data.standardLabCh = standardLab[g];
            data.colorimetricCondition = condition;
            data.displayName = name;
            m_rows.push_back(std::make_shared<AppearanceViewTableModelRow>(std::move(data)));
        }
    }
}

int MultiColorValueTableModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : int(m_rows.size());
}

int MultiColorValueTableModel::columnCount(const QModelIndex &parent) const
{
    if (parent.isValid())
        return 0;
    return int(m_explicitColumns.empty() ? m_builtColumns.size() : m_explicitColumns.size());
}

QVariant MultiColorValueTableModel::cellValue(const QModelIndex &index) const
{
    const auto row = rowAt(index.row());
    const auto column = columnAt(index.column());
    if (!row || !column)
        return QVariant();
    return column->value(*row);
}

QString MultiColorValueTableModel::displayText(const QModelIndex &index, const QVariant &value) const
{
    if (!value.isValid())
        return QString();
    if (isFloatingPoint(value))
        return QtTableModelHelper::displayDataFormater(this, index, m_decimals).toString();
    if (value.userType() == QMetaType::QDateTime)
        return dateTimeText(value.toDateTime());
    return value.toString();
}

QVariant MultiColorValueTableModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid() || index.model() != this)
        return QVariant();
    const auto row = rowAt(index.row());
    const auto column = columnAt(index.column());
    if (!row || !column)
        return QVariant();

    switch (role) {
    case Qt::DisplayRole: {
        const QVariant value = column->value(*row);
        if (!value.isValid())
            return QVariant();
        return displayText(index, value);
    }
    case ExportValueRole:
        return column->value(*row);
    case ExportNumberFormatRole: {
        const QVariant value = column->value(*row);
        return isFloatingPoint(value) ? QVariant(QtTableModelHelper::doubleDataFormater(m_decimals)) : QVariant();
    }
    case Qt::BackgroundRole:
        return column->color(*row);
    case Qt::ForegroundRole: {
        const QVariant background = column->color(*row);
        if (!background.isValid())
            return QVariant();
        // Black or white by the background's luminance: readable (4.5:1 or better) on every verdict colour.
        return VerdictColors::readableTextColor(VerdictColors::colorOfBackground(background));
    }
    case Qt::TextAlignmentRole:
        return column->alignment();
    case Qt::FontRole: {
        QFont font = cellFont();
        font.setBold(row->isStandard());
        return font;
    }
    case Qt::SizeHintRole: {
        const QFontMetrics metrics(cellFont());
        const QString text = displayText(index, column->value(*row));
        return QSize(metrics.horizontalAdvance(text) + 10, metrics.height() + 8);
    }
    case StandardRowRole:
        return row->isStandard();
    default:
        return QVariant();
    }
}

QFont MultiColorValueTableModel::headerFont()
{
    QFont font = QApplication::font();
    font.setWeight(75);
    font.setPixelSize(14);
    return font;
}

QFont MultiColorValueTableModel::cellFont()
{
    QFont font = QApplication::font();
    font.setPixelSize(14);
    return font;
}

int MultiColorValueTableModel::headerMargin() const
{
    const bool tolerances = m_dataModel && !m_dataModel->toleranceSets().empty();
    const bool coordinates = m_settings && !m_settings->enabledTableColorSpaceCoordinates().empty();
    const bool metrics = m_settings && !m_settings->enabledTableDEMetrics().empty();
    return (tolerances || coordinates || metrics) ? 24 : 8;
}

QVariant MultiColorValueTableModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal)
        return QAbstractTableModel::headerData(section, orientation, role);
    const auto column = columnAt(section);
    if (!column)
        return QAbstractTableModel::headerData(section, orientation, role);
    switch (role) {
    case Qt::DisplayRole:
        return column->headerText();
    case Qt::FontRole:
        return headerFont();
    case Qt::SizeHintRole: {
        const QString text = column->headerText();
        const QFontMetrics metrics(headerFont());
        int width = 0;
        for (const QString &line : text.split(QLatin1Char('\n')))
            width = std::max(width, metrics.horizontalAdvance(line));
        int height = headerMargin() + metrics.height();
        if (text.count(QLatin1Char('\n')) > 1)
            height += metrics.height();
        return QSize(width + 10, height);
    }
    default:
        return QAbstractTableModel::headerData(section, orientation, role);
    }
}

Qt::ItemFlags MultiColorValueTableModel::flags(const QModelIndex &index) const
{
    return QAbstractTableModel::flags(index);
}

} // namespace vexa
