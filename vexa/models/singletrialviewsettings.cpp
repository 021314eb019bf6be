#include "singletrialviewsettings.h"

#include <vexa/models/colorcomparesettings.h>
#include <vexa/models/texturecomparesettings.h>

#include <settings/boolsetting.h>
#include <settings/stringlistsetting.h>

namespace vexa {

SingleTrialViewSettings::SingleTrialViewSettings()
    : CommonSettings(QString::fromLatin1(OwnerName), tr("Single Trial View"))
    , m_colorCompareSettings(std::make_shared<ColorCompareSettings>(QStringLiteral("Color"), tr("Color Data")))
    , m_textureCompareSettings(std::make_shared<TextureCompareSettings>(QStringLiteral("Texture"), tr("Texture Data")))
{
    createSettings();
}

SingleTrialViewSettings::~SingleTrialViewSettings() = default;

void SingleTrialViewSettings::createSettings()
{
    if (!sections().empty())
        return;
    const QString color = QStringLiteral("Color");
    const QString standardColor = QStringLiteral("Standard Color");
    const QString texture = QStringLiteral("Texture");
    addSection(color, tr("Color Data"));
    addSection(standardColor, tr("Standard Color Data"));
    addSection(texture, tr("Texture Data"));

    addSetting(m_colorCompareSettings->createTableColorSpaceCoordinatesSetting(), color);
    addSetting(m_colorCompareSettings->createTableDEMetricsSetting(), color);
    addSetting(m_colorCompareSettings->createTableStandardColorSpaceCoordinatesSetting(), standardColor);

    addSetting(m_textureCompareSettings->createShowStandardValuesSetting(), texture);
    addSetting(m_textureCompareSettings->createTextureImagesSetting(), texture);
    addSetting(m_textureCompareSettings->createTableTextureMetricsSetting(), texture);
}

} // namespace vexa
