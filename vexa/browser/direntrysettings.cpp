#include "direntrysettings.h"

#include "selectedpath.h"

#include <domain/globaldirentry.h>
#include <settings/boolsetting.h>
#include <settings/intsetting.h>
#include <settings/stringsetting.h>

#include <QUuid>

namespace vexa {

namespace {

const char *const CurrentIndex = "currentIndex";
const char *const DispatcherId = "dispatcherID";
const char *const Path = "SelectedPath";
const char *const PathAsString = "SelectedPathAsString";
const char *const HeaderName = "header_name";
const char *const HeaderVersion = "header_version";
const char *const HeaderCreation = "header_creationTimestamp";
const char *const HeaderCreator = "header_creatorId";
const char *const HeaderUuid = "header_uuid";
const char *const HeaderVariant = "header_variant";
const char *const HeaderIsStored = "header_isStored";
const char *const EntryType = "dirEntry_objectType";
const char *const EntryId = "dirEntry_objectId";
const char *const EntryVersion = "dirEntry_version";
const char *const EntryUuid = "dirEntry_uuid";
const char *const EntryVariant = "dirEntry_variant";
const char *const EntryIsStored = "dirEntry_isStored";

template<class Setting>
std::shared_ptr<Setting> hidden(std::shared_ptr<Setting> setting)
{
    setting->setIsVisible(false);
    return setting;
}

// The folder ids of a path, kept in one text.
const QString PathSeparator = QStringLiteral("/");

} // namespace

DirEntrySettings::DirEntrySettings(const QString &sectionName)
    : SettingsSection(sectionName)
{
    addSetting(hidden(std::make_shared<IntSetting>(QString::fromLatin1(CurrentIndex), -1, tr("Position"),
                                                   tr("The position of the entry in the folder picker."))));
    addSetting(std::make_shared<StringSetting>(QString::fromLatin1(DispatcherId), QString(), tr("Store"),
                                               tr("The object store the folder belongs to.")));
    addSetting(std::make_shared<StringSetting>(QString::fromLatin1(Path), QString(), tr("Folder ids"),
                                               tr("The ids of the folders from the top of the store.")));
    addSetting(std::make_shared<StringSetting>(QString::fromLatin1(PathAsString), QString(), tr("Folder"),
                                               tr("The folder's path as it reads.")));
    addSetting(hidden(std::make_shared<StringSetting>(QString::fromLatin1(HeaderName), QString(), tr("Name"))));
    addSetting(hidden(std::make_shared<IntSetting>(QString::fromLatin1(HeaderVersion), 0, tr("Version"))));
    addSetting(hidden(std::make_shared<StringSetting>(QString::fromLatin1(HeaderCreation), QString(), tr("Created"))));
    addSetting(hidden(std::make_shared<StringSetting>(QString::fromLatin1(HeaderCreator), QString(), tr("Creator"))));
    addSetting(hidden(std::make_shared<StringSetting>(QString::fromLatin1(HeaderUuid), QString(), tr("Uuid"))));
    addSetting(hidden(std::make_shared<StringSetting>(QString::fromLatin1(HeaderVariant), QString(), tr("Variant"))));
    addSetting(hidden(std::make_shared<BoolSetting>(QString::fromLatin1(HeaderIsStored), false, tr("Stored"))));
    addSetting(hidden(std::make_shared<StringSetting>(QString::fromLatin1(EntryType), QString(), tr("Object type"))));
    addSetting(hidden(std::make_shared<StringSetting>(QString::fromLatin1(EntryId), QString(), tr("Object id"))));
    addSetting(hidden(std::make_shared<IntSetting>(QString::fromLatin1(EntryVersion), 0, tr("Entry version"))));
    addSetting(hidden(std::make_shared<StringSetting>(QString::fromLatin1(EntryUuid), QString(), tr("Entry uuid"))));
    addSetting(hidden(std::make_shared<StringSetting>(QString::fromLatin1(EntryVariant), QString(), tr("Entry variant"))));
    addSetting(hidden(std::make_shared<BoolSetting>(QString::fromLatin1(EntryIsStored), false, tr("Entry stored"))));
}

DirEntrySettings::~DirEntrySettings() = default;

QString DirEntrySettings::text(const QString &key) const
{
    const auto s = setting<StringSetting>(key);
    return s ? s->value() : QString();
}

void DirEntrySettings::setText(const QString &key, const QString &value)
{
    if (const auto s = setting<StringSetting>(key))
        s->setValue(value);
}

int DirEntrySettings::number(const QString &key) const
{
    const auto s = setting<IntSetting>(key);
    return s ? s->value() : 0;
}

void DirEntrySettings::setNumber(const QString &key, int value)
{
    if (const auto s = setting<IntSetting>(key))
        s->setValue(value);
}

bool DirEntrySettings::flag(const QString &key) const
{
    const auto s = setting<BoolSetting>(key);
    return s && s->value();
}

void DirEntrySettings::setFlag(const QString &key, bool value)
{
    if (const auto s = setting<BoolSetting>(key))
        s->setValue(value);
}

int DirEntrySettings::currentIndex() const
{
    return number(QString::fromLatin1(CurrentIndex));
}

void DirEntrySettings::setCurrentIndex(int index)
{
    setNumber(QString::fromLatin1(CurrentIndex), index);
}

std::shared_ptr<GlobalDirEntry> DirEntrySettings::globalDirEntry() const
{
    if (text(QString::fromLatin1(EntryId)).isEmpty() && text(QString::fromLatin1(DispatcherId)).isEmpty())
        return nullptr;
    auto entry = std::make_shared<GlobalDirEntry>();
    entry->setDispatcherID(text(QString::fromLatin1(DispatcherId)));
    entry->setStandardizedDispatcherID(entry->dispatcherID());
    entry->setPath(text(QString::fromLatin1(Path)).split(PathSeparator, Qt::SkipEmptyParts));
    const QString readable = text(QString::fromLatin1(PathAsString));
    QStringList names = readable.split(SelectedPath::separator(), Qt::SkipEmptyParts);
    if (names.size() != entry->path().size())
        names.clear();
    entry->setStringPath(names);
    Header header;
    header.setName(text(QString::fromLatin1(HeaderName)));
    header.setCreationTimestamp(Timestamp::fromString(text(QString::fromLatin1(HeaderCreation))));
    header.setCreatorId(text(QString::fromLatin1(HeaderCreator)));
    entry->setHeader(header);
    entry->setEntryObjectType(text(QString::fromLatin1(EntryType)));
    entry->setEntryObjectId(text(QString::fromLatin1(EntryId)));
    entry->setVersion(number(QString::fromLatin1(EntryVersion)));
    entry->setUuid(QUuid::fromString(text(QString::fromLatin1(EntryUuid))));
    entry->setVariant(text(QString::fromLatin1(EntryVariant)).toInt());
    entry->setIsStored(flag(QString::fromLatin1(EntryIsStored)));
    return entry;
}

void DirEntrySettings::setGlobalDirEntry(const GlobalDirEntry &entry)
{
    setText(QString::fromLatin1(DispatcherId), entry.dispatcherID());
    setText(QString::fromLatin1(Path), entry.path().join(PathSeparator));
    setText(QString::fromLatin1(PathAsString), SelectedPath(entry.dispatcherID(), entry.path(), entry.stringPath()).pathToString());
    const Header &header = entry.header();
    setText(QString::fromLatin1(HeaderName), header.name());
    setNumber(QString::fromLatin1(HeaderVersion), entry.version());
    setText(QString::fromLatin1(HeaderCreation), header.creationTimestamp().toString());
    setText(QString::fromLatin1(HeaderCreator), header.creatorId());
    setText(QString::fromLatin1(HeaderUuid), entry.uuid().isNull() ? QString() : entry.uuid().toString());
    setText(QString::fromLatin1(HeaderVariant), QString::number(entry.variant()));
    setFlag(QString::fromLatin1(HeaderIsStored), entry.isStored());
    setText(QString::fromLatin1(EntryType), entry.entryObjectType());
    setText(QString::fromLatin1(EntryId), entry.entryObjectId());
    setNumber(QString::fromLatin1(EntryVersion), entry.version());
    setText(QString::fromLatin1(EntryUuid), entry.uuid().isNull() ? QString() : entry.uuid().toString());
    setText(QString::fromLatin1(EntryVariant), QString::number(entry.variant()));
    setFlag(QString::fromLatin1(EntryIsStored), entry.isStored());
}

QString DirEntrySettings::displayText() const
{
    QString path = text(QString::fromLatin1(PathAsString));
    const QString name = text(QString::fromLatin1(HeaderName));
    if (path.isEmpty())
        path = SelectedPath::separator();
    if (name.isEmpty())
        return path;
    return path.endsWith(SelectedPath::separator()) ? path + name : path + SelectedPath::separator() + name;
}

std::shared_ptr<SettingsSection> DirEntrySettings::clone(const QString &sectionName, const QString &displayName) const
{
    auto copy = std::make_shared<DirEntrySettings>(sectionName);
    copy->setDisplayName(displayName);
    copy->setGroupName(groupName());
    copy->copyValuesFrom(*this);
    return copy;
}

} // namespace vexa
