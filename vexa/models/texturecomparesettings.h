#pragma once

#include <vexa/vexa_export.h>

#include <settings/commonsettings.h>

#include <QString>
#include <QStringList>

#include <memory>

class BoolSetting;
class StringListSetting;

namespace vexa {

// The texture part of a comparison page's settings: whether the standard's values and
// texture images are shown, and which texture metrics the table and the trend plot show.
// Works like ColorCompareSettings: each create…Setting() makes its setting once and adds
// it to this group's own section; a setting never created reads as its negative answer
// (false, nothing selected).
class VEXA_EXPORT TextureCompareSettings : public CommonSettings
{
    Q_OBJECT
public:
    static QString showStandardValuesKey();
    static QString textureImagesKey();
    static QString tableTextureMetricsKey();
    static QString trendPlotTextureMetricsKey();
    static QString tolerancesValue();

    // The texture metric names: "Coarseness", "SparkleGrade", "SparkleColorVariation".
    static QStringList availableTextureMetrics();
    // The shown text of the metric at that index of availableTextureMetrics(); empty past the end.
    static QString textureMetricDisplayName(int index);
    // The shown text of a metric name; empty for an unknown name.
    static QString textureMetricDisplayName(const QString &metric);

    TextureCompareSettings(const QString &name, const QString &displayName);
    ~TextureCompareSettings() override;

    void createSettings() override;

    std::shared_ptr<BoolSetting> createShowStandardValuesSetting();
    std::shared_ptr<BoolSetting> createTextureImagesSetting();
    std::shared_ptr<StringListSetting> createTableTextureMetricsSetting();
    std::shared_ptr<StringListSetting> createTrendPlotTextureMetricsSetting();

    bool showStandardValues() const;
    bool showTextureImages() const;
    // The selected metric names, "Tolerances" excluded, and their shown texts.
    QStringList enabledTableTextureMetrics() const;
    QStringList enabledTrendPlotTextureMetrics() const;
    QStringList enabledTableTextureMetricsDisplayNames() const;
    QStringList enabledTrendPlotTextureMetricsDisplayNames() const;
    bool tableTolerancesEnabled() const;
    bool trendTolerancesEnabled() const;

    std::shared_ptr<BoolSetting> showStandardValuesSetting() const { return m_showStandardValues; }
    std::shared_ptr<BoolSetting> textureImagesSetting() const { return m_textureImages; }
    std::shared_ptr<StringListSetting> tableTextureMetricsSetting() const { return m_tableMetrics; }
    std::shared_ptr<StringListSetting> trendPlotTextureMetricsSetting() const { return m_trendMetrics; }

private:
    std::shared_ptr<StringListSetting> createMetricsSetting(const QString &key, const QString &label,
                                                            const QString &description);

    std::shared_ptr<BoolSetting> m_showStandardValues;
    std::shared_ptr<BoolSetting> m_textureImages;
    std::shared_ptr<StringListSetting> m_tableMetrics;
    std::shared_ptr<StringListSetting> m_trendMetrics;
};

} // namespace vexa
