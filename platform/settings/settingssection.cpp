#include "settingssection.h"

SettingsSection::SettingsSection(const QString &sectionName, const QString &displayName, const QString &groupName)
    : m_sectionName(sectionName)
    , m_displayName(displayName)
    , m_groupName(groupName)
{
}

SettingsSection::~SettingsSection() = default;

QString SettingsSection::displayName() const
{
    return m_displayName.isEmpty() ? m_sectionName : m_displayName;
}

bool SettingsSection::addSetting(const std::shared_ptr<BaseSetting> &setting)
{
    if (!setting || this->setting(setting->key()))
        return false;
    m_settings.push_back(setting);
    connect(setting.get(), &BaseSetting::sgValueChanged, this, &SettingsSection::sgSettingsChanged);
    return true;
}

bool SettingsSection::removeSetting(const QString &key)
{
    for (auto it = m_settings.begin(); it != m_settings.end(); ++it) {
        if ((*it)->key() == key) {
            disconnect(it->get(), nullptr, this, nullptr);
            m_settings.erase(it);
            return true;
        }
    }
    return false;
}

std::shared_ptr<BaseSetting> SettingsSection::setting(const QString &key) const
{
    for (const auto &setting : m_settings)
        if (setting->key() == key)
            return setting;
    return nullptr;
}

std::shared_ptr<SettingsSection> SettingsSection::clone(const QString &sectionName,
                                                        const QString &displayName) const
{
    auto copy = std::make_shared<SettingsSection>(sectionName, displayName, m_groupName);
    for (const auto &setting : m_settings)
        copy->addSetting(setting->clone());
    return copy;
}

void SettingsSection::copyValuesFrom(const SettingsSection &other)
{
    for (const auto &setting : m_settings)
        if (const auto source = other.setting(setting->key()))
            setting->assignValue(*source);
}

void SettingsSection::resetToDefaults()
{
    for (const auto &setting : m_settings)
        setting->resetToDefault();
}

QJsonObject SettingsSection::toJson() const
{
    QJsonObject json;
    for (const auto &setting : m_settings)
        json.insert(setting->key(), setting->toJson());
    return json;
}

bool SettingsSection::fromJson(const QJsonObject &json, QStringList *errors)
{
    bool ok = true;
    QStringList sectionErrors;
    for (const auto &setting : m_settings) {
        const auto it = json.constFind(setting->key());
        if (it == json.constEnd())
            continue;
        ok = setting->fromJson(it.value(), &sectionErrors) && ok;
    }
    if (errors)
        for (const QString &error : qAsConst(sectionErrors))
            errors->append(QStringLiteral("section \"%1\": %2").arg(m_sectionName, error));
    return ok;
}
