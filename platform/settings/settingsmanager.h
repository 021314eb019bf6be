#pragma once

#include <settings/commonsettings.h>

#include <QJsonObject>
#include <QObject>
#include <QString>

#include <map>
#include <memory>

class GeneralSettings;
class LocalSettings;

// Keeps the registered settings groups and persists them in one JSON file per
// user: "<storage location>/settings.json". The storage location is, in this
// order, the one given to setStorageLocation(), the VEXA_SETTINGS_DIR
// environment variable, or "<generic config location>/vexa".
//
// The file is read once, on first use; values of groups that are not
// registered (yet) are kept and written back unchanged. Saving is explicit
// and atomic. A file that cannot be read or holds faults is logged (naming
// the file and the reason), copied aside as "settings.json.corrupt" and
// left alone until the next explicit save; the affected settings keep their
// defaults.
//
// Used from the GUI thread.
class VEXA_SETTINGS_EXPORT SettingsManager : public QObject
{
    Q_OBJECT
public:
    static SettingsManager &instance();

    // A manager of its own (tests, tools); an empty location means the default one.
    explicit SettingsManager(const QString &storageLocation = QString());
    ~SettingsManager() override;

    QString storageLocation() const;
    // Points the manager at another folder; its file is read on next use.
    void setStorageLocation(const QString &directory);
    QString settingsFilePath() const;

    std::shared_ptr<GeneralSettings> getGeneralSettings();
    std::shared_ptr<LocalSettings> getLocalSettings();

    // Registers a group and applies its persisted values, if any. False for
    // null or when another group of the same owner name is registered.
    bool registerClientSettings(const std::shared_ptr<CommonSettings> &settings);
    bool unregisterClientSettings(const QString &ownerName);
    std::shared_ptr<CommonSettings> clientSettings(const QString &ownerName) const;
    // All registered groups, the general and local settings included.
    SettingsList registeredSettings() const;

    // Writes the given groups with that layout version (other groups in the
    // file stay as they are).
    bool saveClientSettings(const SettingsList &settingsList, int version);
    // Writes all registered groups, each with its own version.
    bool saveClientSettings();
    // Reads the file again and applies it to all registered groups. Emits
    // sgLoadClientSettingsSuccess when the file was read without fault (or
    // does not exist yet), sgLoadClientSettingsFailed otherwise.
    bool loadClientSettings();

    // The last read or write fault, empty when there was none.
    QString lastError() const { return m_lastError; }
    // The copy kept of the last faulty file, empty when there is none.
    QString lastBackupFilePath() const { return m_lastBackup; }

Q_SIGNALS:
    void sgLoadClientSettingsSuccess();
    void sgLoadClientSettingsFailed(const QString &message);

private:
    void ensureLoaded();
    // Reads the file into m_stored; false on any fault.
    bool readFile();
    bool applyStored(CommonSettings &settings, QStringList *errors) const;
    void reportLoadFaults(const QStringList &faults);
    bool writeFile();

    QString m_storageLocation;
    bool m_loaded = false;
    bool m_backupMade = false;
    QJsonObject m_stored; // owner name → {"version", "settings"}
    QString m_lastError;
    QString m_lastBackup;
    std::shared_ptr<GeneralSettings> m_general;
    std::shared_ptr<LocalSettings> m_local;
    std::map<QString, std::shared_ptr<CommonSettings>> m_clients;
};
