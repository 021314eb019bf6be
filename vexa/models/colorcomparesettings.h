#pragma once

#include <vexa/vexa_export.h>
#include <vexa/models/colorspace.h>

#include <settings/commonsettings.h>
#include <settings/stringpair.h>

#include <QSet>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class SettingsListSetting;
class StringListSetting;

namespace vexa {

class ColorPlotSettings;

// The colour part of a comparison page's settings: which coordinates and
// colour-difference metrics the colour table shows, which metrics the trend and box
// plots draw, and which geometry each of the nine colour plots draws.
//
// Each create…Setting() makes its setting once (later calls return the same one) and
// adds it to this group's own section; page groups add the same settings to their own
// sections, so both see one value. The accessors read the current values; a setting
// that was never created reads as nothing selected.
class VEXA_EXPORT ColorCompareSettings : public CommonSettings
{
    Q_OBJECT
public:
    static constexpr int ColorPlotCount = 9;
    static constexpr int MaximumPlotMetrics = 4;

    // Setting keys.
    static QString tableColorSpaceCoordinatesKey();
    static QString tableStandardColorSpaceCoordinatesKey();
    static QString tableDEMetricsKey();
    static QString trendPlotMetricsKey();
    static QString boxPlotMetricsKey();
    static QString colorPlotGeometryKey();
    // The entry of the metric lists that stands for the tolerance verdict columns.
    static QString tolerancesValue();

    ColorCompareSettings(const QString &name, const QString &displayName);
    ~ColorCompareSettings() override;

    // Creates all settings of the group (used when the group is registered on its own).
    void createSettings() override;

    std::shared_ptr<StringListSetting> createTableColorSpaceCoordinatesSetting();
    std::shared_ptr<StringListSetting> createTableStandardColorSpaceCoordinatesSetting();
    std::shared_ptr<StringListSetting> createTableDEMetricsSetting();
    std::shared_ptr<StringListSetting> createTrendPlotMetricsSetting();
    std::shared_ptr<StringListSetting> createBoxPlotMetricsSetting();
    // The list of nine colour plot sections "Lab-Plot 1" … "Lab-Plot 9".
    std::shared_ptr<SettingsListSetting> createColorPlotGeometrySettings();

    // The selected coordinate system of the trial columns and its coordinates (empty for "None").
    EColorSpace enabledTableColorSpace() const;
    std::vector<EColorSpaceCoordinate> enabledTableColorSpaceCoordinates() const;
    // Likewise for the standard's columns; "None" shows the standard as top rows instead.
    EColorSpace enabledTableStandardColorSpace() const;
    std::vector<EColorSpaceCoordinate> enabledTableStandardColorSpaceCoordinates() const;

    // The selected metrics of the table (value and shown text), "Tolerances" excluded.
    std::vector<StringPair> enabledTableDEMetrics() const;
    std::vector<EColorSpaceDelta> enabledTableDEMetricDeltas() const;
    // The selected metric names of the plots, "Tolerances" excluded.
    QStringList enabledTrendPlotMetrics() const;
    QStringList enabledBoxPlotMetrics() const;
    bool tableTolerancesEnabled() const;
    bool trendTolerancesEnabled() const;

    // The colour plot settings of one "Lab-Plot" section (index from 0); null when the
    // index is out of range or the list was not created.
    std::shared_ptr<ColorPlotSettings> colorPlotSettings(int index) const;
    int colorPlotCount() const;

    std::shared_ptr<StringListSetting> tableColorSpaceCoordinatesSetting() const { return m_tableCoordinates; }
    std::shared_ptr<StringListSetting> tableStandardColorSpaceCoordinatesSetting() const { return m_standardCoordinates; }
    std::shared_ptr<StringListSetting> tableDEMetricsSetting() const { return m_tableMetrics; }
    std::shared_ptr<StringListSetting> trendPlotMetricsSetting() const { return m_trendMetrics; }
    std::shared_ptr<StringListSetting> boxPlotMetricsSetting() const { return m_boxPlotMetrics; }
    std::shared_ptr<SettingsListSetting> colorPlotGeometrySettings() const { return m_colorPlots; }

    // The tolerance groups (Tolerance::toleranceGroup(), e.g. "CIEL", "DIN 6175-2", "Audi")
    // whose tolerances the page offers. All three by default.
    void setAllowedToleranceGroup(const QSet<QString> &groups);
    QSet<QString> allowedToleranceGroups() const { return m_allowedToleranceGroups; }
    bool allowToleranceGroup(const QString &group) const;

private:
    std::shared_ptr<StringListSetting> createColorSpaceSetting(const QString &key, const QString &label,
                                                               const QString &description, const QString &noneText,
                                                               EColorSpace defaultColorSpace);
    std::shared_ptr<StringListSetting> createMetricsSetting(const QString &key, const QString &label,
                                                            const QString &description, bool withTolerances,
                                                            const QString &defaultValue, int maximum);

    std::shared_ptr<StringListSetting> m_tableCoordinates;
    std::shared_ptr<StringListSetting> m_standardCoordinates;
    std::shared_ptr<StringListSetting> m_tableMetrics;
    std::shared_ptr<StringListSetting> m_trendMetrics;
    std::shared_ptr<StringListSetting> m_boxPlotMetrics;
    std::shared_ptr<SettingsListSetting> m_colorPlots;
    QSet<QString> m_allowedToleranceGroups;
};

} // namespace vexa
