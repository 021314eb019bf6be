#pragma once

#include <settings/basesetting.h>
#include <settings/settingssection.h>

#include <QJsonObject>
#include <QObject>

#include <memory>
#include <vector>

// A named group of settings that is persisted as one unit (a page's
// settings, the general settings...). A group is made of sections; sections
// may carry a group name that gathers them on one page of the settings
// editor (for example "Main").
//
// Subclasses create their settings in their constructor or in
// createSettings() and read them through typed accessors. The settings
// manager calls createSettings() on registration when the group is still empty.
//
// settingsChanged() is emitted once per change, or once per batch between
// beginUpdate() and endUpdate() (loading, the settings editor's OK).
class VEXA_SETTINGS_EXPORT CommonSettings : public QObject
{
    Q_OBJECT
public:
    explicit CommonSettings(const QString &ownerName, const QString &displayName = QString());
    ~CommonSettings() override;

    QString ownerName() const { return m_ownerName; }
    QString displayName() const;
    void setDisplayName(const QString &name) { m_displayName = name; }
    // The version the group's layout is saved with.
    int version() const { return m_version; }
    void setVersion(int version) { m_version = version; }

    virtual void createSettings();

    // The section of that name; created (at the end) when it does not exist.
    std::shared_ptr<SettingsSection> addSection(const QString &sectionName, const QString &displayName = QString(),
                                                const QString &groupName = QString());
    // Adds a ready-made section; false for null or a name already taken.
    bool addSection(const std::shared_ptr<SettingsSection> &section);
    bool removeSection(const QString &sectionName);
    std::vector<std::shared_ptr<SettingsSection>> sections() const { return m_sections; }
    std::shared_ptr<SettingsSection> section(const QString &sectionName) const;

    // Adds a setting to the group's default section (named after the owner),
    // to a named section, or to a section of a named page group. The section
    // is created when missing. False for a null setting or a key the section
    // already has.
    bool addSetting(const std::shared_ptr<BaseSetting> &setting);
    bool addSetting(const std::shared_ptr<BaseSetting> &setting, const QString &sectionName);
    bool addSetting(const std::shared_ptr<BaseSetting> &setting, const QString &groupName, const QString &sectionName);

    // All settings of all sections, in order.
    std::vector<std::shared_ptr<BaseSetting>> settings() const;
    // The first setting with that key in any section.
    std::shared_ptr<BaseSetting> setting(const QString &key) const;
    template<class T>
    std::shared_ptr<T> setting(const QString &key) const
    {
        return std::dynamic_pointer_cast<T>(setting(key));
    }

    // Takes over the values of another group of the same layout (matching
    // sections and keys); other settings stay as they are.
    void setSettings(const CommonSettings &source);
    void resetToDefaults();

    bool isExpertMode() const { return m_expertMode; }
    void setExpertMode(bool expertMode) { m_expertMode = expertMode; }

    // Values by section and key. Unknown sections and keys are ignored and
    // missing ones keep their values; faults are appended to errors and
    // leave the affected settings unchanged.
    QJsonObject toJson() const;
    bool fromJson(const QJsonObject &json, QStringList *errors = nullptr);

    void beginUpdate();
    void endUpdate();

Q_SIGNALS:
    void settingsChanged();

private:
    void onSectionChanged();

    QString m_ownerName;
    QString m_displayName;
    int m_version = 1;
    bool m_expertMode = false;
    int m_updateDepth = 0;
    bool m_changedInUpdate = false;
    std::vector<std::shared_ptr<SettingsSection>> m_sections;
};

using SettingsList = std::vector<std::shared_ptr<CommonSettings>>;
