#pragma once

#include <vexa/vexa_export.h>

#include <settings/commonsettings.h>

#include <memory>

class StringSetting;

namespace vexa {

// The settings of the job page: how trials are named in lists and what name a trial
// measured without a template gets.
class VEXA_EXPORT JobViewSettings : public CommonSettings
{
    Q_OBJECT
public:
    static constexpr const char *OwnerName = "JobView";

    JobViewSettings();
    ~JobViewSettings() override;

    void createSettings() override;

    // The name format of trials in list views (UIHelper::trialDisplayString); default "<Name>".
    QString trialDisplayNameFormat() const;
    // The name prefix of trials measured without a template; default "Trial".
    QString trialAutoNameFormat() const;

    std::shared_ptr<StringSetting> trialDisplayNameFormatSetting() const { return m_displayNameFormat; }
    std::shared_ptr<StringSetting> trialAutoNameFormatSetting() const { return m_autoNameFormat; }

private:
    std::shared_ptr<StringSetting> m_displayNameFormat;
    std::shared_ptr<StringSetting> m_autoNameFormat;
};

} // namespace vexa
