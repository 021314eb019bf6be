#include "jobviewsettings.h"

#include <settings/stringsetting.h>

namespace vexa {

JobViewSettings::JobViewSettings()
    : CommonSettings(QString::fromLatin1(OwnerName), tr("Job View"))
{
    createSettings();
}

JobViewSettings::~JobViewSettings() = default;

void JobViewSettings::createSettings()
{
    if (m_displayNameFormat)
        return;
    const QString section = QStringLiteral("AutoName");
    m_displayNameFormat = std::make_shared<StringSetting>(
        QStringLiteral("DisplayTrialNameFormat"), QStringLiteral("<Name>"), tr("Name Format"),
        tr("Construct trial names to display in list views (example: [<Name>/<Year><Month><Day]> or "
           "[<Name>-<property name>])"),
        StringSetting::DisplayType::Plain, QStringLiteral("MinimumWidth=250;"));
    m_autoNameFormat = std::make_shared<StringSetting>(
        QStringLiteral("TrialAutoNameFormat"), QStringLiteral("Trial"), tr("AutoName Format"),
        tr("Use this prefix for trial names measured without a template."));
    addSection(section, tr("AutoName"));
    addSetting(m_displayNameFormat, section);
    addSetting(m_autoNameFormat, section);
}

QString JobViewSettings::trialDisplayNameFormat() const
{
    return m_displayNameFormat->value();
}

QString JobViewSettings::trialAutoNameFormat() const
{
    return m_autoNameFormat->value();
}

} // namespace vexa
