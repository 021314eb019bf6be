#include "settingslistsetting.h"

#include <QJsonArray>
#include <QJsonObject>

class SettingsListSetting::ChangeBatch
{
public:
    explicit ChangeBatch(SettingsListSetting &owner)
        : m_owner(owner)
    {
        ++m_owner.m_batchDepth;
    }
    ~ChangeBatch()
    {
        if (--m_owner.m_batchDepth == 0 && m_owner.m_changedInBatch) {
            m_owner.m_changedInBatch = false;
            Q_EMIT m_owner.sgValueChanged();
        }
    }
    void markChanged() { m_owner.m_changedInBatch = true; }

private:
    SettingsListSetting &m_owner;
};

SettingsListSetting::SettingsListSetting(const QString &key, const QString &labelText,
                                         const QString &descriptionText)
    : BaseSetting(key, QVariant(), labelText, descriptionText)
{
}

SettingsListSetting::~SettingsListSetting() = default;

void SettingsListSetting::setTemplateSectionSettings(const std::shared_ptr<SettingsSection> &templateSection)
{
    m_template = templateSection;
}

std::shared_ptr<SettingsSection> SettingsListSetting::addSection(const QString &sectionName,
                                                                 const QString &displayName)
{
    if (!m_template || section(sectionName))
        return nullptr;
    auto created = m_template->clone(sectionName, displayName);
    if (!created)
        return nullptr;
    created->setSectionName(sectionName);
    if (!displayName.isEmpty())
        created->setDisplayName(displayName);
    addSection(created);
    return created;
}

bool SettingsListSetting::addSection(const std::shared_ptr<SettingsSection> &newSection)
{
    if (!newSection || section(newSection->sectionName()))
        return false;
    ChangeBatch batch(*this);
    attach(newSection);
    m_sections.push_back(newSection);
    batch.markChanged();
    return true;
}

bool SettingsListSetting::removeSection(const QString &sectionName)
{
    for (size_t i = 0; i < m_sections.size(); ++i)
        if (m_sections[i]->sectionName() == sectionName)
            return removeSection(static_cast<int>(i));
    return false;
}

bool SettingsListSetting::removeSection(int index)
{
    if (index < 0 || index >= sectionCount())
        return false;
    ChangeBatch batch(*this);
    disconnect(m_sections[static_cast<size_t>(index)].get(), nullptr, this, nullptr);
    m_sections.erase(m_sections.begin() + index);
    batch.markChanged();
    return true;
}

void SettingsListSetting::clearSections()
{
    if (m_sections.empty())
        return;
    ChangeBatch batch(*this);
    for (const auto &existing : m_sections)
        disconnect(existing.get(), nullptr, this, nullptr);
    m_sections.clear();
    batch.markChanged();
}

std::shared_ptr<SettingsSection> SettingsListSetting::section(const QString &sectionName) const
{
    for (const auto &existing : m_sections)
        if (existing->sectionName() == sectionName)
            return existing;
    return nullptr;
}

std::shared_ptr<SettingsSection> SettingsListSetting::section(int index) const
{
    if (index < 0 || index >= sectionCount())
        return nullptr;
    return m_sections[static_cast<size_t>(index)];
}

bool SettingsListSetting::updateSectionSetting(const QString &sectionName, const QString &key, const QVariant &value)
{
    const auto target = section(sectionName);
    if (!target)
        return false;
    const auto setting = target->setting(key);
    return setting && setting->setVariantValue(value);
}

QVariant SettingsListSetting::variantValue() const
{
    return toJson().toVariant();
}

QVariant SettingsListSetting::defaultVariantValue() const
{
    QJsonArray array;
    for (const auto &existing : m_sections) {
        const auto copy = existing->clone(existing->sectionName(), existing->displayName());
        copy->resetToDefaults();
        array.append(QJsonObject{{QStringLiteral("name"), copy->sectionName()},
                                 {QStringLiteral("displayName"), copy->displayName()},
                                 {QStringLiteral("values"), copy->toJson()}});
    }
    return array.toVariantList();
}

bool SettingsListSetting::setVariantValue(const QVariant &value)
{
    return fromJson(QJsonValue::fromVariant(value));
}

bool SettingsListSetting::isDefault() const
{
    for (const auto &existing : m_sections)
        for (const auto &setting : existing->settings())
            if (!setting->isDefault())
                return false;
    return true;
}

void SettingsListSetting::resetToDefault()
{
    ChangeBatch batch(*this);
    for (const auto &existing : m_sections)
        existing->resetToDefaults();
}

std::shared_ptr<BaseSetting> SettingsListSetting::clone() const
{
    auto copy = std::make_shared<SettingsListSetting>(key(), labelText(), descriptionText());
    copy->copyAttributesFrom(*this);
    copy->m_useTabWidget = m_useTabWidget;
    copy->m_template = m_template ? m_template->clone(m_template->sectionName(), m_template->displayName()) : nullptr;
    for (const auto &existing : m_sections)
        copy->addSection(existing->clone(existing->sectionName(), existing->displayName()));
    return copy;
}

bool SettingsListSetting::assignValue(const BaseSetting &other)
{
    const auto *list = qobject_cast<const SettingsListSetting *>(&other);
    if (!list)
        return false;
    return fromJson(list->toJson());
}

QJsonValue SettingsListSetting::toJson() const
{
    QJsonArray array;
    for (const auto &existing : m_sections)
        array.append(QJsonObject{{QStringLiteral("name"), existing->sectionName()},
                                 {QStringLiteral("displayName"), existing->displayName()},
                                 {QStringLiteral("values"), existing->toJson()}});
    return array;
}

bool SettingsListSetting::fromJson(const QJsonValue &json, QStringList *errors)
{
    // Check the whole structure before touching anything.
    auto fail = [&](const QString &why) {
        if (errors)
            errors->append(QStringLiteral("setting \"%1\": %2").arg(key(), why));
        return false;
    };
    if (!json.isArray())
        return fail(QStringLiteral("expected a list of sections"));
    const QJsonArray array = json.toArray();
    QStringList names;
    for (const QJsonValue &entry : array) {
        if (!entry.isObject() || !entry.toObject().value(QStringLiteral("name")).isString())
            return fail(QStringLiteral("a section without a name"));
        const QString name = entry.toObject().value(QStringLiteral("name")).toString();
        if (names.contains(name))
            return fail(QStringLiteral("section \"%1\" appears twice").arg(name));
        if (!section(name) && !m_template)
            return fail(QStringLiteral("section \"%1\" is unknown and there is no template").arg(name));
        names.append(name);
    }

    ChangeBatch batch(*this);
    bool ok = true;
    std::vector<std::shared_ptr<SettingsSection>> ordered;
    for (const QJsonValue &entry : array) {
        const QJsonObject object = entry.toObject();
        const QString name = object.value(QStringLiteral("name")).toString();
        auto target = section(name);
        if (!target) {
            target = m_template->clone(name, object.value(QStringLiteral("displayName")).toString());
            target->setSectionName(name);
            attach(target);
            batch.markChanged();
        }
        const QString displayName = object.value(QStringLiteral("displayName")).toString();
        if (!displayName.isEmpty())
            target->setDisplayName(displayName);
        QStringList sectionErrors;
        ok = target->fromJson(object.value(QStringLiteral("values")).toObject(), &sectionErrors) && ok;
        if (errors)
            for (const QString &error : qAsConst(sectionErrors))
                errors->append(QStringLiteral("setting \"%1\": %2").arg(key(), error));
        ordered.push_back(target);
    }
    for (const auto &existing : m_sections) {
        if (!names.contains(existing->sectionName())) {
            disconnect(existing.get(), nullptr, this, nullptr);
            batch.markChanged();
        }
    }
    if (ordered != m_sections) {
        m_sections = ordered;
        batch.markChanged();
    }
    return ok;
}

bool SettingsListSetting::normalize(QVariant &) const
{
    return false; // the value is held by the sections
}

void SettingsListSetting::attach(const std::shared_ptr<SettingsSection> &newSection)
{
    connect(newSection.get(), &SettingsSection::sgSettingsChanged, this, &SettingsListSetting::onSectionChanged);
}

void SettingsListSetting::onSectionChanged()
{
    if (m_batchDepth > 0)
        m_changedInBatch = true;
    else
        Q_EMIT sgValueChanged();
}
