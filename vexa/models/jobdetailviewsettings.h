#pragma once

#include <vexa/vexa_export.h>

#include <settings/commonsettings.h>

#include <memory>

namespace vexa {

class ColorCompareSettings;
class TextureCompareSettings;

// The settings of the job detail page: the colour table and plots ("Color",
// "Standard Color", "Lab-Plot") and the texture table ("Texture"). The settings are
// those of the embedded colour and texture groups, which the page's views read.
class VEXA_EXPORT JobDetailViewSettings : public CommonSettings
{
    Q_OBJECT
public:
    static constexpr const char *OwnerName = "JobDetailView";

    JobDetailViewSettings();
    ~JobDetailViewSettings() override;

    // Builds the sections; does nothing when they exist already.
    void createSettings() override;

    std::shared_ptr<ColorCompareSettings> colorCompareSettings() const { return m_colorCompareSettings; }
    std::shared_ptr<TextureCompareSettings> textureCompareSettings() const { return m_textureCompareSettings; }

    // Shows or hides the box plot metrics in the settings editor.
    void setBoxPlotSettingsVisible(bool visible);
    bool isBoxPlotSettingsVisible() const;

private:
    std::shared_ptr<ColorCompareSettings> m_colorCompareSettings;
    std::shared_ptr<TextureCompareSettings> m_textureCompareSettings;
};

} // namespace vexa
