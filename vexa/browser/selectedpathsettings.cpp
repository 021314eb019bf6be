#include "selectedpathsettings.h"

#include "selectedpath.h"

#include <settings/stringsetting.h>

namespace vexa {

SelectedPathSettings::SelectedPathSettings(const QString &ownerName)
    : CommonSettings(ownerName, tr("Object browser"))
{
    initializeSettings();
}

SelectedPathSettings::~SelectedPathSettings() = default;

void SelectedPathSettings::createSettings()
{
    initializeSettings();
}

void SelectedPathSettings::initializeSettings()
{
    if (m_path)
        return;
    m_path = std::make_shared<StringSetting>(QStringLiteral("SelectedPath"), QString(), tr("Selected folder"),
                                             tr("The folder last selected in the object browser (folder ids)."));
    m_dispatcherId = std::make_shared<StringSetting>(QStringLiteral("DispatcherId"), QString(), tr("Store"),
                                                     tr("The object store of the selected folder."));
    addSetting(m_path, QStringLiteral("Main"), QStringLiteral("Object Browser"));
    addSetting(m_dispatcherId, QStringLiteral("Main"), QStringLiteral("Object Browser"));
}

std::shared_ptr<SelectedPath> SelectedPathSettings::selectedPath() const
{
    return std::make_shared<SelectedPath>(m_dispatcherId->value(), SelectedPath::fromIdString(m_path->value()));
}

void SelectedPathSettings::setSelectedPath(const SelectedPath &path)
{
    beginUpdate();
    m_path->setValue(path.idString());
    m_dispatcherId->setValue(path.dispatcherId());
    endUpdate();
}

} // namespace vexa
