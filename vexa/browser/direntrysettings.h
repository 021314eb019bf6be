#pragma once

#include <vexa/vexa_export.h>

#include <settings/settingssection.h>

#include <QMetaType>

#include <memory>

class BoolSetting;
class IntSetting;
class StringSetting;

namespace vexa {

class GlobalDirEntry;

// One remembered folder entry of the folder picker as a settings section: the store,
// the folder path (ids and readable) and the directory entry with its header. Only the
// readable parts are shown in the settings editor.
class VEXA_EXPORT DirEntrySettings : public SettingsSection
{
    Q_OBJECT
public:
    explicit DirEntrySettings(const QString &sectionName);
    ~DirEntrySettings() override;

    int currentIndex() const;
    void setCurrentIndex(int index);

    // The entry the section holds; null when it holds none (no object id).
    std::shared_ptr<GlobalDirEntry> globalDirEntry() const;
    void setGlobalDirEntry(const GlobalDirEntry &entry);
    // The readable path of the entry's folder followed by the entry's name.
    QString displayText() const;

    std::shared_ptr<SettingsSection> clone(const QString &sectionName,
                                           const QString &displayName = QString()) const override;

private:
    QString text(const QString &key) const;
    void setText(const QString &key, const QString &value);
    int number(const QString &key) const;
    void setNumber(const QString &key, int value);
    bool flag(const QString &key) const;
    void setFlag(const QString &key, bool value);
};

} // namespace vexa

Q_DECLARE_METATYPE(std::shared_ptr<vexa::DirEntrySettings>)
