#pragma once

#include <settings/basesetting.h>

#include <QJsonObject>
#include <QObject>

#include <memory>
#include <vector>

// A named set of settings, shown as one box in the settings editor. Groups
// (CommonSettings) are made of sections; a SettingsListSetting holds a list
// of sections made from a template. Subclasses create their settings in the
// constructor; they override clone() when their copies must keep their type.
class VEXA_SETTINGS_EXPORT SettingsSection : public QObject
{
    Q_OBJECT
public:
    explicit SettingsSection(const QString &sectionName, const QString &displayName = QString(),
                             const QString &groupName = QString());
    ~SettingsSection() override;

    QString sectionName() const { return m_sectionName; }
    void setSectionName(const QString &name) { m_sectionName = name; }
    // The title shown; the section name when none was given.
    QString displayName() const;
    void setDisplayName(const QString &name) { m_displayName = name; }
    // Sections of one group name share a page in the settings editor.
    QString groupName() const { return m_groupName; }
    void setGroupName(const QString &name) { m_groupName = name; }

    // Adds a setting at the end. False (and nothing added) for a null setting
    // or a key the section already has.
    bool addSetting(const std::shared_ptr<BaseSetting> &setting);
    bool removeSetting(const QString &key);
    std::vector<std::shared_ptr<BaseSetting>> settings() const { return m_settings; }
    std::shared_ptr<BaseSetting> setting(const QString &key) const;
    template<class T>
    std::shared_ptr<T> setting(const QString &key) const
    {
        return std::dynamic_pointer_cast<T>(setting(key));
    }

    // A deep copy under another name (same settings, values and flags).
    // Subclasses override this to return their own type.
    virtual std::shared_ptr<SettingsSection> clone(const QString &sectionName,
                                                   const QString &displayName = QString()) const;
    // Copies the values of the settings with the same keys.
    void copyValuesFrom(const SettingsSection &other);
    void resetToDefaults();

    // Values by key. Unknown keys are ignored, missing keys keep their
    // values; faults are appended to errors (prefixed by the section name).
    QJsonObject toJson() const;
    bool fromJson(const QJsonObject &json, QStringList *errors = nullptr);

Q_SIGNALS:
    // A value of one of the section's settings changed.
    void sgSettingsChanged();

private:
    QString m_sectionName;
    QString m_displayName;
    QString m_groupName;
    std::vector<std::shared_ptr<BaseSetting>> m_settings;
};

using SettingsSectionPtr = std::shared_ptr<SettingsSection>;
