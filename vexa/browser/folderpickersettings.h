#pragma once

#include <vexa/vexa_export.h>

#include <settings/commonsettings.h>

#include <memory>
#include <vector>

class IntSetting;
class SettingsListSetting;

namespace vexa {

class DirEntrySettings;
class GlobalDirEntry;

// The folders the user worked in, most recent first, and which one was chosen last:
// the folder picker's combo box and the object browser's favourites. Persisted by the
// settings library: page "Main", section "Folder Picker", the hidden "lastSelectedIndex"
// and the list "Dir Entries" of "DirEntry_<n>" sections.
class VEXA_EXPORT FolderPickerSettings : public CommonSettings
{
    Q_OBJECT
public:
    static constexpr int MaximumEntries = 12;

    explicit FolderPickerSettings(const QString &ownerName = QStringLiteral("FolderPicker"));
    ~FolderPickerSettings() override;

    void createSettings() override;

    // The remembered folders in picker order.
    std::vector<std::shared_ptr<GlobalDirEntry>> dirEntries() const;
    std::vector<std::shared_ptr<DirEntrySettings>> dirEntrySettings() const;
    int lastSelectedIndex() const;
    std::shared_ptr<GlobalDirEntry> lastSelectedDirEntry() const;

    // Remembers a folder (moved to the front when known) and makes it the last chosen.
    void chooseDirEntry(const GlobalDirEntry &entry);
    // Makes a remembered folder the last chosen; false for a bad index.
    bool chooseIndex(int index);
    // Forgets the folders with that object id (a deleted folder); true when there was one.
    bool forgetObject(const QString &objectId);
    // Forgets one remembered folder.
    bool removeIndex(int index);

Q_SIGNALS:
    // The list or the chosen folder changed.
    void sgDirEntriesChanged();

private:
    void initializeSettings();
    void setCurrentDirEntry(const GlobalDirEntry &entry);
    void setLastSelectedDirEntry(std::shared_ptr<DirEntrySettings> entry);
    void removeDirEntry(std::shared_ptr<DirEntrySettings> entry, int index);
    // Reads the persisted list into the working list.
    void updateDirEntries();
    // Writes the working list back as "DirEntry_<n>" sections and stores "lastSelectedIndex".
    void updateMapAndSettings();

    std::shared_ptr<IntSetting> m_lastSelectedIndex;
    std::shared_ptr<SettingsListSetting> m_dirEntriesSetting;
    std::vector<std::shared_ptr<DirEntrySettings>> m_entries;
    int m_lastSelected = -1;
};

} // namespace vexa
