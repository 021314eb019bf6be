#include "settingsmanager.h"

#include "generalsettings.h"
#include "localsettings.h"

#include <utilities/logger.h>

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonParseError>
#include <QSaveFile>
#include <QStandardPaths>

namespace {
const QString FileName = QStringLiteral("settings.json");
const QString FormatKey = QStringLiteral("format");
const QString GroupsKey = QStringLiteral("groups");
const QString VersionKey = QStringLiteral("version");
const QString SettingsKey = QStringLiteral("settings");
constexpr int FileFormat = 1;
} // namespace

SettingsManager &SettingsManager::instance()
{
    static SettingsManager manager;
    return manager;
}

SettingsManager::SettingsManager(const QString &storageLocation)
    : m_storageLocation(storageLocation)
    , m_general(std::make_shared<GeneralSettings>())
    , m_local(std::make_shared<LocalSettings>())
{
    m_clients.emplace(m_general->ownerName(), m_general);
    m_clients.emplace(m_local->ownerName(), m_local);
}

SettingsManager::~SettingsManager() = default;

QString SettingsManager::storageLocation() const
{
    if (!m_storageLocation.isEmpty())
        return m_storageLocation;
    const QString fromEnvironment = qEnvironmentVariable("VEXA_SETTINGS_DIR");
    if (!fromEnvironment.isEmpty())
        return fromEnvironment;
    return QStandardPaths::writableLocation(QStandardPaths::GenericConfigLocation) + QStringLiteral("/vexa");
}

void SettingsManager::setStorageLocation(const QString &directory)
{
    m_storageLocation = directory;
    m_loaded = false;
    m_stored = QJsonObject();
}

QString SettingsManager::settingsFilePath() const
{
    return QDir(storageLocation()).filePath(FileName);
}

std::shared_ptr<GeneralSettings> SettingsManager::getGeneralSettings()
{
    ensureLoaded();
    return m_general;
}

std::shared_ptr<LocalSettings> SettingsManager::getLocalSettings()
{
    ensureLoaded();
    return m_local;
}

bool SettingsManager::registerClientSettings(const std::shared_ptr<CommonSettings> &settings)
{
    if (!settings)
        return false;
    const auto existing = m_clients.find(settings->ownerName());
    if (existing != m_clients.end())
        return existing->second == settings;
    if (settings->sections().empty())
        settings->createSettings();
    ensureLoaded();
    m_clients.emplace(settings->ownerName(), settings);
    QStringList faults;
    if (!applyStored(*settings, &faults))
        reportLoadFaults(faults);
    return true;
}

bool SettingsManager::unregisterClientSettings(const QString &ownerName)
{
    return m_clients.erase(ownerName) > 0;
}

std::shared_ptr<CommonSettings> SettingsManager::clientSettings(const QString &ownerName) const
{
    const auto it = m_clients.find(ownerName);
    return it == m_clients.end() ? nullptr : it->second;
}

SettingsList SettingsManager::registeredSettings() const
{
    SettingsList list;
    for (const auto &entry : m_clients)
        list.push_back(entry.second);
    return list;
}

bool SettingsManager::saveClientSettings(const SettingsList &settingsList, int version)
{
    ensureLoaded();
    QJsonObject groups = m_stored.value(GroupsKey).toObject();
    for (const auto &settings : settingsList) {
        if (!settings)
            continue;
        groups.insert(settings->ownerName(),
                      QJsonObject{{VersionKey, version}, {SettingsKey, settings->toJson()}});
    }
    m_stored.insert(GroupsKey, groups);
    return writeFile();
}

bool SettingsManager::saveClientSettings()
{
    ensureLoaded();
    QJsonObject groups = m_stored.value(GroupsKey).toObject();
    for (const auto &entry : m_clients)
        groups.insert(entry.first,
                      QJsonObject{{VersionKey, entry.second->version()}, {SettingsKey, entry.second->toJson()}});
    m_stored.insert(GroupsKey, groups);
    return writeFile();
}

bool SettingsManager::loadClientSettings()
{
    m_loaded = true;
    m_backupMade = false;
    m_lastError.clear();
    bool ok = readFile();
    QStringList faults;
    for (const auto &entry : m_clients)
        ok = applyStored(*entry.second, &faults) && ok;
    if (!faults.isEmpty())
        reportLoadFaults(faults);
    if (ok)
        Q_EMIT sgLoadClientSettingsSuccess();
    else
        Q_EMIT sgLoadClientSettingsFailed(m_lastError);
    return ok;
}

void SettingsManager::ensureLoaded()
{
    if (m_loaded)
        return;
    m_loaded = true;
    m_backupMade = false;
    readFile();
    QStringList faults;
    for (const auto &entry : m_clients)
        applyStored(*entry.second, &faults);
    if (!faults.isEmpty())
        reportLoadFaults(faults);
}

bool SettingsManager::readFile()
{
    m_stored = QJsonObject();
    const QString path = settingsFilePath();
    QFile file(path);
    if (!file.exists())
        return true;

    QString reason;
    if (!file.open(QIODevice::ReadOnly)) {
        reason = file.errorString();
    } else {
        const QByteArray bytes = file.readAll();
        if (bytes.trimmed().isEmpty()) {
            reason = QStringLiteral("the file is empty");
        } else {
            QJsonParseError parseError;
            const QJsonDocument document = QJsonDocument::fromJson(bytes, &parseError);
            if (parseError.error != QJsonParseError::NoError)
                reason = QStringLiteral("%1 at offset %2").arg(parseError.errorString()).arg(parseError.offset);
            else if (!document.isObject())
                reason = QStringLiteral("the top level is not an object");
            else if (document.object().contains(GroupsKey) && !document.object().value(GroupsKey).isObject())
                reason = QStringLiteral("\"groups\" is not an object");
            else
                m_stored = document.object();
        }
    }
    if (reason.isEmpty())
        return true;
    reportLoadFaults({reason});
    return false;
}

bool SettingsManager::applyStored(CommonSettings &settings, QStringList *errors) const
{
    const QJsonValue group = m_stored.value(GroupsKey).toObject().value(settings.ownerName());
    if (group.isUndefined())
        return true;
    const QJsonValue values = group.toObject().value(SettingsKey);
    if (!group.isObject() || !values.isObject()) {
        errors->append(QStringLiteral("group \"%1\" is malformed").arg(settings.ownerName()));
        return false;
    }
    QStringList groupErrors;
    const bool ok = settings.fromJson(values.toObject(), &groupErrors);
    for (const QString &error : qAsConst(groupErrors))
        errors->append(QStringLiteral("group \"%1\", %2").arg(settings.ownerName(), error));
    return ok;
}

void SettingsManager::reportLoadFaults(const QStringList &faults)
{
    const QString path = settingsFilePath();
    // Keep the faulty file before anything may overwrite it; once per read.
    if (!m_backupMade && QFileInfo::exists(path)) {
        m_backupMade = true;
        QString backup = path + QStringLiteral(".corrupt");
        if (QFileInfo::exists(backup))
            backup += QDateTime::currentDateTime().toString(QStringLiteral("-yyyyMMdd-hhmmsszzz"));
        if (QFile::copy(path, backup))
            m_lastBackup = backup;
        else
            m_lastBackup.clear();
    }
    m_lastError = QStringLiteral("Settings file \"%1\" could not be read completely: %2. Defaults are used for "
                                 "the affected settings%3.")
                      .arg(QDir::toNativeSeparators(path), faults.join(QStringLiteral("; ")),
                           m_lastBackup.isEmpty()
                               ? QString()
                               : QStringLiteral("; the file was kept as \"%1\"")
                                     .arg(QDir::toNativeSeparators(m_lastBackup)));
    Logger::instance().error(LogCategory::Settings, QStringLiteral("SettingsManager: ") + m_lastError);
}

bool SettingsManager::writeFile()
{
    const QString path = settingsFilePath();
    if (!QDir().mkpath(QFileInfo(path).absolutePath())) {
        m_lastError = QStringLiteral("Cannot create the settings folder \"%1\"")
                          .arg(QDir::toNativeSeparators(QFileInfo(path).absolutePath()));
        Logger::instance().error(LogCategory::Settings, QStringLiteral("SettingsManager: ") + m_lastError);
        return false;
    }
    m_stored.insert(FormatKey, FileFormat);
    QSaveFile file(path);
    if (!file.open(QIODevice::WriteOnly)
        || file.write(QJsonDocument(m_stored).toJson(QJsonDocument::Indented)) < 0 || !file.commit()) {
        m_lastError = QStringLiteral("Cannot write the settings file \"%1\": %2")
                          .arg(QDir::toNativeSeparators(path), file.errorString());
        Logger::instance().error(LogCategory::Settings, QStringLiteral("SettingsManager: ") + m_lastError);
        return false;
    }
    return true;
}
