#pragma once

#include <vexa/vexa_export.h>

#include <settings/settingssection.h>

#include <QString>

#include <memory>
#include <string>

class BoolSetting;
class StringListSetting;

namespace vexa {

// The persisted settings of one colour plot: whether it is shown, the geometry it
// draws ("Dynamic" follows the geometry selected on the page), and two drawing options.
// One section per plot; a list of plots clones a template section, so clone() keeps
// the type.
class VEXA_EXPORT ColorPlotSettings : public SettingsSection
{
    Q_OBJECT
public:
    // The value of "Geometry" that makes the plot follow the selected geometry.
    static QString dynamicGeometry();

    // enabled: default of "Enabled". defaultGeometry: default of "Geometry", a geometry
    // text such as "45as15" or "Dynamic"; empty or unknown text gives "Dynamic".
    ColorPlotSettings(bool enabled, const QString &sectionName, const QString &sectionTitle,
                      const std::string &defaultGeometry = std::string());
    ~ColorPlotSettings() override;

    bool isLabPlotEnabled() const;
    void setLabPlotEnabled(bool enabled);
    // The plot cannot be switched off in the settings editor ("Enabled" becomes read-only
    // and is set).
    void setLabPlotAlwaysEnabled(bool alwaysEnabled);
    bool isLabPlotAlwaysEnabled() const;

    // The "Geometry" value: a geometry text or "Dynamic".
    QString geometry() const;
    bool isDynamicGeometry() const;
    // False (and no change) for a text that is neither "Dynamic" nor an offered geometry.
    bool setGeometry(const QString &geometry);
    QString defaultGeometry() const;

    bool showHueCircle() const;
    void setShowHueCircle(bool show);
    bool showTintedBackground() const;
    void setShowTintedBackground(bool show);

    std::shared_ptr<BoolSetting> enabledSetting() const { return m_enabled; }
    std::shared_ptr<StringListSetting> geometrySetting() const { return m_geometry; }
    std::shared_ptr<BoolSetting> showHueCircleSetting() const { return m_showHueCircle; }
    std::shared_ptr<BoolSetting> showTintedBackgroundSetting() const { return m_showTintedBackground; }

    std::shared_ptr<SettingsSection> clone(const QString &sectionName,
                                           const QString &displayName = QString()) const override;

private:
    bool m_enabledByDefault;
    std::shared_ptr<BoolSetting> m_enabled;
    std::shared_ptr<StringListSetting> m_geometry;
    std::shared_ptr<BoolSetting> m_showHueCircle;
    std::shared_ptr<BoolSetting> m_showTintedBackground;
};

} // namespace vexa
