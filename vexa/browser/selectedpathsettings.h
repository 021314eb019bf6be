#pragma once

#include <vexa/vexa_export.h>

#include <settings/commonsettings.h>

#include <memory>

class StringSetting;

namespace vexa {

class SelectedPath;

// The folder last selected in the object browser and its store, persisted on the page
// "Main", section "Object Browser" ("SelectedPath": the folder ids joined by "/";
// "DispatcherId").
class VEXA_EXPORT SelectedPathSettings : public CommonSettings
{
    Q_OBJECT
public:
    explicit SelectedPathSettings(const QString &ownerName = QStringLiteral("ObjectBrowser"));
    ~SelectedPathSettings() override;

    void createSettings() override;
    void initializeSettings();

    std::shared_ptr<SelectedPath> selectedPath() const;
    void setSelectedPath(const SelectedPath &path);

private:
    std::shared_ptr<StringSetting> m_path;
    std::shared_ptr<StringSetting> m_dispatcherId;
};

} // namespace vexa
