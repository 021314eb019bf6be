#include "jobdetailviewsettings.h"

#include <vexa/models/colorcomparesettings.h>
#include <vexa/models/texturecomparesettings.h>

#include <settings/boolsetting.h>
#include <settings/settingslistsetting.h>
#include <settings/stringlistsetting.h>

namespace vexa {

JobDetailViewSettings::JobDetailViewSettings()
    : CommonSettings(QString::fromLatin1(OwnerName), tr("Job Detail View"))
    , m_colorCompareSettings(std::make_shared<ColorCompareSettings>(QStringLiteral("Color"), tr("Color Data")))
    , m_textureCompareSettings(std::make_shared<TextureCompareSettings>(QStringLiteral("Texture"), tr("Texture Data")))
{
    createSettings();
}

JobDetailViewSettings::~JobDetailViewSettings() = default;

void JobDetailViewSettings::createSettings()
{
    if (!sections().empty())
        return;
    const QString color = QStringLiteral("Color");
    const QString standardColor = QStringLiteral("Standard Color");
    const QString labPlot = QStringLiteral("Lab-Plot");
    const QString texture = QStringLiteral("Texture");
    addSection(color, tr("Color Data"));
    addSection(standardColor, tr("Standard Color Data"));
    addSection(labPlot, tr("Lab-Plot"));
    addSection(texture, tr("Texture Data"));

    ColorCompareSettings &colorSettings = *m_colorCompareSettings;
    addSetting(colorSettings.createTableColorSpaceCoordinatesSetting(), color);
    addSetting(colorSettings.createTableDEMetricsSetting(), color);
    addSetting(colorSettings.createTrendPlotMetricsSetting(), color);
    addSetting(colorSettings.createBoxPlotMetricsSetting(), color);
    addSetting(colorSettings.createTableStandardColorSpaceCoordinatesSetting(), standardColor);
    addSetting(colorSettings.createColorPlotGeometrySettings(), labPlot);

    TextureCompareSettings &textureSettings = *m_textureCompareSettings;
    addSetting(textureSettings.createShowStandardValuesSetting(), texture);
    addSetting(textureSettings.createTableTextureMetricsSetting(), texture);
    addSetting(textureSettings.createTrendPlotTextureMetricsSetting(), texture);
}

void JobDetailViewSettings::setBoxPlotSettingsVisible(bool visible)
{
    if (const auto setting = m_colorCompareSettings->boxPlotMetricsSetting())
        setting->setIsVisible(visible);
}

bool JobDetailViewSettings::isBoxPlotSettingsVisible() const
{
    const auto setting = m_colorCompareSettings->boxPlotMetricsSetting();
    return setting && setting->isVisible();
}

} // namespace vexa
