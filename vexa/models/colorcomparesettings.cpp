#include "colorcomparesettings.h"

#include <vexa/plots/colorplotsettings.h>

#include <domain/geometry.h>

#include <settings/settingslistsetting.h>
#include <settings/stringlistsetting.h>

namespace vexa {

namespace {

EColorSpace selectedColorSpace(const std::shared_ptr<StringListSetting> &setting)
{
    if (!setting)
        return EColorSpace::None;
    const QString value = setting->selectedValue();
    for (EColorSpace candidate : {EColorSpace::CIELab, EColorSpace::CIELCh, EColorSpace::CIELabCh})
        if (value == colorSpaceName(candidate))
            return candidate;
    return EColorSpace::None;
}

QStringList selectedMetrics(const std::shared_ptr<StringListSetting> &setting)
{
    if (!setting)
        return {};
    QStringList values = setting->selectedValues();
    values.removeAll(ColorCompareSettings::tolerancesValue());
    return values;
}

bool isTolerancesSelected(const std::shared_ptr<StringListSetting> &setting)
{
    return setting && setting->isSelected(ColorCompareSettings::tolerancesValue());
}

// The fixed geometries of the first plots; the remaining plots follow the selected geometry.
const char *const kFixedPlotGeometries[] = {Geometry::ANGLE_45as15, Geometry::ANGLE_45as25, Geometry::ANGLE_45as45,
                                            Geometry::ANGLE_45as75, Geometry::ANGLE_45as110};

} // namespace

QString ColorCompareSettings::tableColorSpaceCoordinatesKey()
{
    return QStringLiteral("TableColorSpaceCoordinates");
}

QString ColorCompareSettings::tableStandardColorSpaceCoordinatesKey()
{
    return QStringLiteral("TableStandardColorSpaceCoordinates");
}

QString ColorCompareSettings::tableDEMetricsKey()
{
    return QStringLiteral("TableDEMetrics");
}

QString ColorCompareSettings::trendPlotMetricsKey()
{
    return QStringLiteral("TrendPlotMetrics");
}

QString ColorCompareSettings::boxPlotMetricsKey()
{
    return QStringLiteral("BoxPlotMetrics");
}

QString ColorCompareSettings::colorPlotGeometryKey()
{
    return QStringLiteral("Lab-Plot");
}

QString ColorCompareSettings::tolerancesValue()
{
    return QStringLiteral("Tolerances");
}

ColorCompareSettings::ColorCompareSettings(const QString &name, const QString &displayName)
    : CommonSettings(name, displayName)
    , m_allowedToleranceGroups{QStringLiteral("CIEL"), QStringLiteral("DIN 6175-2"), QStringLiteral("Audi")}
{
}

ColorCompareSettings::~ColorCompareSettings() = default;

void ColorCompareSettings::createSettings()
{
    createTableColorSpaceCoordinatesSetting();
    createTableStandardColorSpaceCoordinatesSetting();
    createTableDEMetricsSetting();
    createTrendPlotMetricsSetting();
    createBoxPlotMetricsSetting();
    createColorPlotGeometrySettings();
}

std::shared_ptr<StringListSetting> ColorCompareSettings::createColorSpaceSetting(const QString &key,
                                                                                 const QString &label,
                                                                                 const QString &description,
                                                                                 const QString &noneText,
                                                                                 EColorSpace defaultColorSpace)
{
    auto setting = std::make_shared<StringListSetting>(key, label, description);
    setting->setSingleSelect(true);
    setting->setUseComboBox(true);
    for (EColorSpace colorSpace : {EColorSpace::CIELab, EColorSpace::CIELCh, EColorSpace::CIELabCh}) {
        const QString name = colorSpaceName(colorSpace);
        setting->addPossibleValue(StringPair(name, name), colorSpace == defaultColorSpace);
    }
    setting->addPossibleValue(StringPair(colorSpaceName(EColorSpace::None), noneText),
                              defaultColorSpace == EColorSpace::None);
    addSetting(setting);
    return setting;
}

std::shared_ptr<StringListSetting> ColorCompareSettings::createMetricsSetting(const QString &key,
                                                                              const QString &label,
                                                                              const QString &description,
                                                                              bool withTolerances,
                                                                              const QString &defaultValue,
                                                                              int maximum)
{
    auto setting = std::make_shared<StringListSetting>(key, label, description);
    setting->setUseComboBox(true);
    if (withTolerances)
        setting->addPossibleValue(StringPair(tolerancesValue(), tr("Tolerances")), defaultValue == tolerancesValue());
    for (EColorSpaceDelta delta : availableColorSpaceDeltas()) {
        const QString name = colorSpaceDeltaName(delta);
        setting->addPossibleValue(StringPair(name, colorSpaceDeltaDisplayName(delta)), name == defaultValue);
    }
    if (maximum > 0)
        setting->setMaximumSelectionCount(maximum, tr("At most %n metrics can be selected.", nullptr, maximum));
    addSetting(setting);
    return setting;
}

std::shared_ptr<StringListSetting> ColorCompareSettings::createTableColorSpaceCoordinatesSetting()
{
    if (!m_tableCoordinates) {
        const QString text = tr("Displayed Color Coordinates");
        m_tableCoordinates = createColorSpaceSetting(tableColorSpaceCoordinatesKey(), text, text,
                                                     colorSpaceName(EColorSpace::None), EColorSpace::CIELab);
    }
    return m_tableCoordinates;
}

std::shared_ptr<StringListSetting> ColorCompareSettings::createTableStandardColorSpaceCoordinatesSetting()
{
    if (!m_standardCoordinates)
        m_standardCoordinates = createColorSpaceSetting(
            tableStandardColorSpaceCoordinatesKey(), tr("Display Standard Coordinates as columns in table"),
            tr("Display as columns"), tr("None (Show as top rows)"), EColorSpace::None);
    return m_standardCoordinates;
}

std::shared_ptr<StringListSetting> ColorCompareSettings::createTableDEMetricsSetting()
{
    if (!m_tableMetrics)
        m_tableMetrics = createMetricsSetting(tableDEMetricsKey(), tr("Displayed DE metrics"),
                                              tr("Displayed DE Metrics"), true, tolerancesValue(), 0);
    return m_tableMetrics;
}

std::shared_ptr<StringListSetting> ColorCompareSettings::createTrendPlotMetricsSetting()
{
    if (!m_trendMetrics)
        m_trendMetrics = createMetricsSetting(trendPlotMetricsKey(), tr("Select max 4 of trend plot metrics"),
                                              tr("Trend Plot Metrics"), true, tolerancesValue(),
                                              MaximumPlotMetrics);
    return m_trendMetrics;
}

std::shared_ptr<StringListSetting> ColorCompareSettings::createBoxPlotMetricsSetting()
{
    if (!m_boxPlotMetrics)
        m_boxPlotMetrics = createMetricsSetting(boxPlotMetricsKey(), tr("Select max 4 of box plot metrics"),
                                                tr("Box Plot Metrics"), false,
                                                colorSpaceDeltaName(EColorSpaceDelta::dE2000), MaximumPlotMetrics);
    return m_boxPlotMetrics;
}

std::shared_ptr<SettingsListSetting> ColorCompareSettings::createColorPlotGeometrySettings()
{
    if (m_colorPlots)
        return m_colorPlots;
    const QString text = tr("Lab-Plot");
    m_colorPlots = std::make_shared<SettingsListSetting>(colorPlotGeometryKey(), text, text);
    m_colorPlots->setUseTabWidget(true);
    m_colorPlots->setTemplateSectionSettings(
        std::make_shared<ColorPlotSettings>(true, colorPlotGeometryKey(), text, ColorPlotSettings::dynamicGeometry().toStdString()));
    constexpr int fixedCount = static_cast<int>(sizeof(kFixedPlotGeometries) / sizeof(kFixedPlotGeometries[0]));
    for (int i = 0; i < ColorPlotCount; ++i) {
        const QString name = QStringLiteral("Lab-Plot %1").arg(i + 1);
        const std::string geometry =
            i < fixedCount ? std::string(kFixedPlotGeometries[i]) : ColorPlotSettings::dynamicGeometry().toStdString();
        m_colorPlots->addSection(std::make_shared<ColorPlotSettings>(true, name, tr("Lab-Plot %1").arg(i + 1), geometry));
    }
    addSetting(m_colorPlots);
    return m_colorPlots;
}

EColorSpace ColorCompareSettings::enabledTableColorSpace() const
{
    return selectedColorSpace(m_tableCoordinates);
}

std::vector<EColorSpaceCoordinate> ColorCompareSettings::enabledTableColorSpaceCoordinates() const
{
    return colorSpaceCoordinates(enabledTableColorSpace());
}

EColorSpace ColorCompareSettings::enabledTableStandardColorSpace() const
{
    return selectedColorSpace(m_standardCoordinates);
}

std::vector<EColorSpaceCoordinate> ColorCompareSettings::enabledTableStandardColorSpaceCoordinates() const
{
    return colorSpaceCoordinates(enabledTableStandardColorSpace());
}

std::vector<StringPair> ColorCompareSettings::enabledTableDEMetrics() const
{
    std::vector<StringPair> metrics;
    if (!m_tableMetrics)
        return metrics;
    for (const StringPair &entry : m_tableMetrics->selectedPossibleValues())
        if (entry.value != tolerancesValue())
            metrics.push_back(entry);
    return metrics;
}

std::vector<EColorSpaceDelta> ColorCompareSettings::enabledTableDEMetricDeltas() const
{
    std::vector<EColorSpaceDelta> deltas;
    for (const StringPair &entry : enabledTableDEMetrics()) {
        EColorSpaceDelta delta;
        if (didGetColorSpaceDeltaForName(entry.value, delta))
            deltas.push_back(delta);
    }
    return deltas;
}

QStringList ColorCompareSettings::enabledTrendPlotMetrics() const
{
    return selectedMetrics(m_trendMetrics);
}

QStringList ColorCompareSettings::enabledBoxPlotMetrics() const
{
    return selectedMetrics(m_boxPlotMetrics);
}

bool ColorCompareSettings::tableTolerancesEnabled() const
{
    return isTolerancesSelected(m_tableMetrics);
}

bool ColorCompareSettings::trendTolerancesEnabled() const
{
    return isTolerancesSelected(m_trendMetrics);
}

std::shared_ptr<ColorPlotSettings> ColorCompareSettings::colorPlotSettings(int index) const
{
    if (!m_colorPlots)
        return nullptr;
    return std::dynamic_pointer_cast<ColorPlotSettings>(m_colorPlots->section(index));
}

int ColorCompareSettings::colorPlotCount() const
{
    return m_colorPlots ? m_colorPlots->sectionCount() : 0;
}

void ColorCompareSettings::setAllowedToleranceGroup(const QSet<QString> &groups)
{
    m_allowedToleranceGroups = groups;
}

bool ColorCompareSettings::allowToleranceGroup(const QString &group) const
{
    return m_allowedToleranceGroups.contains(group);
}

} // namespace vexa
