#pragma once

#include <vexa/vexa_export.h>

#include <settings/commonsettings.h>

#include <memory>

namespace vexa {

class ColorCompareSettings;
class TextureCompareSettings;

// The settings of the single-trial page: its colour table ("Color", "Standard Color")
// and texture table ("Texture").
class VEXA_EXPORT SingleTrialViewSettings : public CommonSettings
{
    Q_OBJECT
public:
    static constexpr const char *OwnerName = "SingleTrialView";

    SingleTrialViewSettings();
    ~SingleTrialViewSettings() override;

    void createSettings() override;

    std::shared_ptr<ColorCompareSettings> colorCompareSettings() const { return m_colorCompareSettings; }
    std::shared_ptr<TextureCompareSettings> textureCompareSettings() const { return m_textureCompareSettings; }

private:
    std::shared_ptr<ColorCompareSettings> m_colorCompareSettings;
    std::shared_ptr<TextureCompareSettings> m_textureCompareSettings;
};

} // namespace vexa
