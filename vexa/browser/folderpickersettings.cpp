#include "folderpickersettings.h"

#include "direntrysettings.h"

#include <domain/globaldirentry.h>
#include <settings/intsetting.h>
#include <settings/settingslistsetting.h>

#include <QSignalBlocker>

#include <algorithm>

namespace vexa {

namespace {

const QString Group = QStringLiteral("Main");
const QString Section = QStringLiteral("Folder Picker");

bool sameFolder(const GlobalDirEntry &a, const GlobalDirEntry &b)
{
    return a.entryObjectId() == b.entryObjectId() && a.dispatcherID() == b.dispatcherID();
}

} // namespace

FolderPickerSettings::FolderPickerSettings(const QString &ownerName)
    : CommonSettings(ownerName, tr("Folder picker"))
{
    initializeSettings();
}

FolderPickerSettings::~FolderPickerSettings() = default;

void FolderPickerSettings::createSettings()
{
    initializeSettings();
}

void FolderPickerSettings::initializeSettings()
{
    if (m_dirEntriesSetting)
        return;
    m_lastSelectedIndex = std::make_shared<IntSetting>(QStringLiteral("lastSelectedIndex"), -1,
                                                       tr("Last selected folder"),
                                                       tr("The position of the folder chosen last."));
    m_lastSelectedIndex->setIsVisible(false);
    m_dirEntriesSetting = std::make_shared<SettingsListSetting>(QStringLiteral("Dir Entries"), tr("Remembered folders"),
                                                                tr("The folders chosen in the folder picker."));
    m_dirEntriesSetting->setTemplateSectionSettings(std::make_shared<DirEntrySettings>(QStringLiteral("TemplateDirEntry")));
    addSetting(m_lastSelectedIndex, Group, Section);
    addSetting(m_dirEntriesSetting, Group, Section);
    // Values loaded by the settings library land in the setting; the working list follows.
    connect(m_dirEntriesSetting.get(), &BaseSetting::sgValueChanged, this, [this] { updateDirEntries(); });
    connect(m_lastSelectedIndex.get(), &BaseSetting::sgValueChanged, this, [this] { updateDirEntries(); });
}

void FolderPickerSettings::updateDirEntries()
{
    m_entries.clear();
    for (const auto &section : m_dirEntriesSetting->settingsList()) {
        auto entry = std::dynamic_pointer_cast<DirEntrySettings>(section);
        if (!entry) {
            entry = std::make_shared<DirEntrySettings>(section->sectionName());
            entry->copyValuesFrom(*section);
        }
        if (entry->globalDirEntry())
            m_entries.push_back(entry);
    }
    const int last = m_lastSelectedIndex->value();
    m_lastSelected = last >= 0 && last < int(m_entries.size()) ? last : (m_entries.empty() ? -1 : 0);
    Q_EMIT sgDirEntriesChanged();
}

void FolderPickerSettings::updateMapAndSettings()
{
    const QSignalBlocker listBlocker(m_dirEntriesSetting.get());
    const QSignalBlocker indexBlocker(m_lastSelectedIndex.get());
    m_dirEntriesSetting->clearSections();
    for (size_t i = 0; i < m_entries.size(); ++i) {
        auto section = std::static_pointer_cast<DirEntrySettings>(
            m_entries[i]->clone(QStringLiteral("DirEntry_%1").arg(i), m_entries[i]->displayText()));
        section->setCurrentIndex(int(i));
        m_entries[i] = section;
        m_dirEntriesSetting->addSection(section);
    }
    m_lastSelectedIndex->setValue(m_lastSelected);
    Q_EMIT sgDirEntriesChanged();
}

std::vector<std::shared_ptr<GlobalDirEntry>> FolderPickerSettings::dirEntries() const
{
    std::vector<std::shared_ptr<GlobalDirEntry>> entries;
    for (const auto &entry : m_entries)
        entries.push_back(entry->globalDirEntry());
    return entries;
}

std::vector<std::shared_ptr<DirEntrySettings>> FolderPickerSettings::dirEntrySettings() const
{
    return m_entries;
}

int FolderPickerSettings::lastSelectedIndex() const
{
    return m_lastSelected;
}

std::shared_ptr<GlobalDirEntry> FolderPickerSettings::lastSelectedDirEntry() const
{
    return m_lastSelected >= 0 && m_lastSelected < int(m_entries.size()) ? m_entries[size_t(m_lastSelected)]->globalDirEntry()
                                                                         : nullptr;
}

void FolderPickerSettings::setCurrentDirEntry(const GlobalDirEntry &entry)
{
    for (size_t i = 0; i < m_entries.size(); ++i) {
        const auto known = m_entries[i]->globalDirEntry();
        if (known && sameFolder(*known, entry)) {
            m_entries.erase(m_entries.begin() + long(i));
            break;
        }
    }
    auto section = std::make_shared<DirEntrySettings>(QStringLiteral("DirEntry_0"));
    section->setGlobalDirEntry(entry);
    m_entries.insert(m_entries.begin(), section);
    if (int(m_entries.size()) > MaximumEntries)
        m_entries.resize(MaximumEntries);
    setLastSelectedDirEntry(section);
}

void FolderPickerSettings::setLastSelectedDirEntry(std::shared_ptr<DirEntrySettings> entry)
{
    const auto it = std::find(m_entries.begin(), m_entries.end(), entry);
    m_lastSelected = it == m_entries.end() ? -1 : int(it - m_entries.begin());
    updateMapAndSettings();
}

void FolderPickerSettings::removeDirEntry(std::shared_ptr<DirEntrySettings> entry, int index)
{
    if (index < 0 || index >= int(m_entries.size()) || (entry && m_entries[size_t(index)] != entry))
        return;
    m_entries.erase(m_entries.begin() + index);
    if (m_lastSelected == index)
        m_lastSelected = m_entries.empty() ? -1 : 0;
    else if (m_lastSelected > index)
        --m_lastSelected;
    updateMapAndSettings();
}

void FolderPickerSettings::chooseDirEntry(const GlobalDirEntry &entry)
{
    setCurrentDirEntry(entry);
}

bool FolderPickerSettings::chooseIndex(int index)
{
    if (index < 0 || index >= int(m_entries.size()))
        return false;
    setLastSelectedDirEntry(m_entries[size_t(index)]);
    return true;
}

bool FolderPickerSettings::forgetObject(const QString &objectId)
{
    bool removed = false;
    for (int i = int(m_entries.size()) - 1; i >= 0; --i) {
        const auto entry = m_entries[size_t(i)]->globalDirEntry();
        if (entry && entry->entryObjectId() == objectId) {
            removeDirEntry(m_entries[size_t(i)], i);
            removed = true;
        }
    }
    return removed;
}

bool FolderPickerSettings::removeIndex(int index)
{
    if (index < 0 || index >= int(m_entries.size()))
        return false;
    removeDirEntry(m_entries[size_t(index)], index);
    return true;
}

} // namespace vexa
