#include "texturecomparesettings.h"

#include <settings/boolsetting.h>
#include <settings/stringlistsetting.h>

namespace vexa {

namespace {

struct TextureMetric
{
    const char *name;
    const char *displayName;
};

const TextureMetric kTextureMetrics[] = {
    {"Coarseness", QT_TRANSLATE_NOOP("vexa::TextureCompareSettings", "Coarseness")},
    {"SparkleGrade", QT_TRANSLATE_NOOP("vexa::TextureCompareSettings", "Sparkle Grade")},
    {"SparkleColorVariation", QT_TRANSLATE_NOOP("vexa::TextureCompareSettings", "Sparkle Color Variation")},
};

constexpr int kTextureMetricCount = static_cast<int>(sizeof(kTextureMetrics) / sizeof(kTextureMetrics[0]));

QStringList selectedMetrics(const std::shared_ptr<StringListSetting> &setting)
{
    if (!setting)
        return {};
    QStringList values = setting->selectedValues();
    values.removeAll(TextureCompareSettings::tolerancesValue());
    return values;
}

QStringList displayNames(const QStringList &metrics)
{
    QStringList names;
    for (const QString &metric : metrics)
        names.append(TextureCompareSettings::textureMetricDisplayName(metric));
    return names;
}

} // namespace

QString TextureCompareSettings::showStandardValuesKey()
{
    return QStringLiteral("ShowStandardValues");
}

QString TextureCompareSettings::textureImagesKey()
{
    return QStringLiteral("TextureImages");
}

QString TextureCompareSettings::tableTextureMetricsKey()
{
    return QStringLiteral("TableTextureMetrics");
}

QString TextureCompareSettings::trendPlotTextureMetricsKey()
{
    return QStringLiteral("TrendPlotTextureMetrics");
}

QString TextureCompareSettings::tolerancesValue()
{
    return QStringLiteral("Tolerances");
}

QStringList TextureCompareSettings::availableTextureMetrics()
{
    static const QStringList metrics = [] {
        QStringList names;
        for (const TextureMetric &metric : kTextureMetrics)
            names.append(QString::fromLatin1(metric.name));
        return names;
    }();
    return metrics;
}

QString TextureCompareSettings::textureMetricDisplayName(int index)
{
    if (index < 0 || index >= kTextureMetricCount)
        return QString();
    return tr(kTextureMetrics[index].displayName);
}

QString TextureCompareSettings::textureMetricDisplayName(const QString &metric)
{
    return textureMetricDisplayName(availableTextureMetrics().indexOf(metric));
}

TextureCompareSettings::TextureCompareSettings(const QString &name, const QString &displayName)
    : CommonSettings(name, displayName)
{
}

TextureCompareSettings::~TextureCompareSettings() = default;

void TextureCompareSettings::createSettings()
{
    createShowStandardValuesSetting();
    createTextureImagesSetting();
    createTableTextureMetricsSetting();
    createTrendPlotTextureMetricsSetting();
}

std::shared_ptr<BoolSetting> TextureCompareSettings::createShowStandardValuesSetting()
{
    if (!m_showStandardValues) {
        m_showStandardValues = std::make_shared<BoolSetting>(showStandardValuesKey(), true, tr("Show standard values"),
                                                             tr("Select if you want to display the standard values"));
        addSetting(m_showStandardValues);
    }
    return m_showStandardValues;
}

std::shared_ptr<BoolSetting> TextureCompareSettings::createTextureImagesSetting()
{
    if (!m_textureImages) {
        m_textureImages = std::make_shared<BoolSetting>(
            textureImagesKey(), true, tr("Texture Images"),
            tr("Select if you want to load texture images from database with recalled trials"));
        addSetting(m_textureImages);
    }
    return m_textureImages;
}

std::shared_ptr<StringListSetting> TextureCompareSettings::createMetricsSetting(const QString &key,
                                                                                const QString &label,
                                                                                const QString &description)
{
    auto setting = std::make_shared<StringListSetting>(key, label, description);
    setting->setUseComboBox(true);
    setting->addPossibleValue(StringPair(tolerancesValue(), tr("Tolerances")), true);
    const QStringList metrics = availableTextureMetrics();
    for (int i = 0; i < metrics.size(); ++i)
        setting->addPossibleValue(StringPair(metrics.at(i), textureMetricDisplayName(i)));
    addSetting(setting);
    return setting;
}

std::shared_ptr<StringListSetting> TextureCompareSettings::createTableTextureMetricsSetting()
{
    if (!m_tableMetrics)
        m_tableMetrics = createMetricsSetting(tableTextureMetricsKey(), tr("Displayed texture metrics"),
                                              tr("Displayed Texture Metrics"));
    return m_tableMetrics;
}

std::shared_ptr<StringListSetting> TextureCompareSettings::createTrendPlotTextureMetricsSetting()
{
    if (!m_trendMetrics)
        m_trendMetrics = createMetricsSetting(trendPlotTextureMetricsKey(), tr("Select trend plot texture metrics"),
                                              tr("Trend Plot Texture Metrics"));
    return m_trendMetrics;
}

bool TextureCompareSettings::showStandardValues() const
{
    return m_showStandardValues && m_showStandardValues->value();
}

bool TextureCompareSettings::showTextureImages() const
{
    return m_textureImages && m_textureImages->value();
}

QStringList TextureCompareSettings::enabledTableTextureMetrics() const
{
    return selectedMetrics(m_tableMetrics);
}

QStringList TextureCompareSettings::enabledTrendPlotTextureMetrics() const
{
    return selectedMetrics(m_trendMetrics);
}

QStringList TextureCompareSettings::enabledTableTextureMetricsDisplayNames() const
{
    return displayNames(enabledTableTextureMetrics());
}

QStringList TextureCompareSettings::enabledTrendPlotTextureMetricsDisplayNames() const
{
    return displayNames(enabledTrendPlotTextureMetrics());
}

bool TextureCompareSettings::tableTolerancesEnabled() const
{
    return m_tableMetrics && m_tableMetrics->isSelected(tolerancesValue());
}

bool TextureCompareSettings::trendTolerancesEnabled() const
{
    return m_trendMetrics && m_trendMetrics->isSelected(tolerancesValue());
}

} // namespace vexa
