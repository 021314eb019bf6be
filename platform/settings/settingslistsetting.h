#pragma once

#include <settings/basesetting.h>
#include <settings/settingssection.h>

#include <vector>

// A setting that holds a list of sections, each made from a template section
// (for example one section per colour plot, or one per remembered folder).
// Its persisted form is an array of {"name", "displayName", "values"}; on
// reading, sections that exist are updated in place (so pointers handed out
// stay valid), missing ones are made from the template and those not stored
// are removed.
class VEXA_SETTINGS_EXPORT SettingsListSetting : public BaseSetting
{
    Q_OBJECT
public:
    SettingsListSetting(const QString &key, const QString &labelText, const QString &descriptionText = QString());
    ~SettingsListSetting() override;

    std::shared_ptr<SettingsSection> templateSectionSettings() const { return m_template; }
    void setTemplateSectionSettings(const std::shared_ptr<SettingsSection> &templateSection);

    // A new section cloned from the template; null when there is no template
    // or the name is taken.
    std::shared_ptr<SettingsSection> addSection(const QString &sectionName, const QString &displayName = QString());
    // Adds a ready-made section; false for null or a name already taken.
    bool addSection(const std::shared_ptr<SettingsSection> &section);
    bool removeSection(const QString &sectionName);
    bool removeSection(int index);
    void clearSections();

    std::vector<std::shared_ptr<SettingsSection>> settingsList() const { return m_sections; }
    int sectionCount() const { return static_cast<int>(m_sections.size()); }
    std::shared_ptr<SettingsSection> section(const QString &sectionName) const;
    std::shared_ptr<SettingsSection> section(int index) const;

    // Sets the value of one setting of one section; false when either is
    // unknown or the value is refused.
    bool updateSectionSetting(const QString &sectionName, const QString &key, const QVariant &value);

    bool useTabWidget() const { return m_useTabWidget; }
    void setUseTabWidget(bool useTabWidget) { m_useTabWidget = useTabWidget; }

    // The JSON form as a variant.
    QVariant variantValue() const override;
    QVariant defaultVariantValue() const override;
    bool setVariantValue(const QVariant &value) override;
    void setDefaultVariantValue(const QVariant &) override {}
    bool isDefault() const override;
    // Resets every section's settings; the sections themselves stay.
    void resetToDefault() override;
    std::shared_ptr<BaseSetting> clone() const override;
    bool assignValue(const BaseSetting &other) override;
    QJsonValue toJson() const override;
    bool fromJson(const QJsonValue &json, QStringList *errors = nullptr) override;

protected:
    bool normalize(QVariant &value) const override;

private:
    void attach(const std::shared_ptr<SettingsSection> &section);
    void onSectionChanged();
    // Emits one change after a batch of section changes.
    class ChangeBatch;

    std::shared_ptr<SettingsSection> m_template;
    std::vector<std::shared_ptr<SettingsSection>> m_sections;
    bool m_useTabWidget = false;
    int m_batchDepth = 0;
    bool m_changedInBatch = false;
};
