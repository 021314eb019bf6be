#include "commonsettings.h"

CommonSettings::CommonSettings(const QString &ownerName, const QString &displayName)
    : m_ownerName(ownerName)
    , m_displayName(displayName)
{
}

CommonSettings::~CommonSettings() = default;

QString CommonSettings::displayName() const
{
    return m_displayName.isEmpty() ? m_ownerName : m_displayName;
}

void CommonSettings::createSettings()
{
}

std::shared_ptr<SettingsSection> CommonSettings::addSection(const QString &sectionName, const QString &displayName,
                                                            const QString &groupName)
{
    if (auto existing = section(sectionName)) {
        if (!displayName.isEmpty())
            existing->setDisplayName(displayName);
        if (!groupName.isEmpty())
            existing->setGroupName(groupName);
        return existing;
    }
    auto created = std::make_shared<SettingsSection>(sectionName, displayName, groupName);
    addSection(created);
    return created;
}

bool CommonSettings::addSection(const std::shared_ptr<SettingsSection> &newSection)
{
    if (!newSection || section(newSection->sectionName()))
        return false;
    m_sections.push_back(newSection);
    connect(newSection.get(), &SettingsSection::sgSettingsChanged, this, &CommonSettings::onSectionChanged);
    return true;
}

bool CommonSettings::removeSection(const QString &sectionName)
{
    for (auto it = m_sections.begin(); it != m_sections.end(); ++it) {
        if ((*it)->sectionName() == sectionName) {
            disconnect(it->get(), nullptr, this, nullptr);
            m_sections.erase(it);
            return true;
        }
    }
    return false;
}

std::shared_ptr<SettingsSection> CommonSettings::section(const QString &sectionName) const
{
    for (const auto &existing : m_sections)
        if (existing->sectionName() == sectionName)
            return existing;
    return nullptr;
}

bool CommonSettings::addSetting(const std::shared_ptr<BaseSetting> &setting)
{
    return addSetting(setting, QString(), m_ownerName);
}

bool CommonSettings::addSetting(const std::shared_ptr<BaseSetting> &setting, const QString &sectionName)
{
    return addSetting(setting, QString(), sectionName);
}

bool CommonSettings::addSetting(const std::shared_ptr<BaseSetting> &setting, const QString &groupName,
                                const QString &sectionName)
{
    if (!setting)
        return false;
    return addSection(sectionName, QString(), groupName)->addSetting(setting);
}

std::vector<std::shared_ptr<BaseSetting>> CommonSettings::settings() const
{
    std::vector<std::shared_ptr<BaseSetting>> all;
    for (const auto &existing : m_sections) {
        const auto sectionSettings = existing->settings();
        all.insert(all.end(), sectionSettings.begin(), sectionSettings.end());
    }
    return all;
}

std::shared_ptr<BaseSetting> CommonSettings::setting(const QString &key) const
{
    for (const auto &existing : m_sections)
        if (auto found = existing->setting(key))
            return found;
    return nullptr;
}

void CommonSettings::setSettings(const CommonSettings &source)
{
    if (&source == this)
        return;
    beginUpdate();
    for (const auto &existing : m_sections)
        if (const auto other = source.section(existing->sectionName()))
            existing->copyValuesFrom(*other);
    endUpdate();
}

void CommonSettings::resetToDefaults()
{
    beginUpdate();
    for (const auto &existing : m_sections)
        existing->resetToDefaults();
    endUpdate();
}

QJsonObject CommonSettings::toJson() const
{
    QJsonObject json;
    for (const auto &existing : m_sections)
        json.insert(existing->sectionName(), existing->toJson());
    return json;
}

bool CommonSettings::fromJson(const QJsonObject &json, QStringList *errors)
{
    bool ok = true;
    beginUpdate();
    for (const auto &existing : m_sections) {
        const auto it = json.constFind(existing->sectionName());
        if (it == json.constEnd())
            continue;
        if (!it.value().isObject()) {
            if (errors)
                errors->append(QStringLiteral("section \"%1\" is not an object").arg(existing->sectionName()));
            ok = false;
            continue;
        }
        ok = existing->fromJson(it.value().toObject(), errors) && ok;
    }
    endUpdate();
    return ok;
}

void CommonSettings::beginUpdate()
{
    ++m_updateDepth;
}

void CommonSettings::endUpdate()
{
    if (m_updateDepth == 0)
        return;
    if (--m_updateDepth == 0 && m_changedInUpdate) {
        m_changedInUpdate = false;
        Q_EMIT settingsChanged();
    }
}

void CommonSettings::onSectionChanged()
{
    if (m_updateDepth > 0)
        m_changedInUpdate = true;
    else
        Q_EMIT settingsChanged();
}
