#include "direntrypaths_p.h"

#include <context/commanddispatcher.h>
#include <domain/folder.h>
#include <domain/globaldirentry.h>

namespace vexa {

void placeInside(GlobalDirEntry &entry, const GlobalDirEntry &folder)
{
    entry.setDispatcherID(folder.dispatcherID());
    entry.setStandardizedDispatcherID(
        QString::fromStdString(CommandDispatcher::standardizedDispatcherId(folder.dispatcherID().toStdString())));
    QStringList path = folder.path();
    QStringList names = folder.stringPath();
    if (!folder.entryObjectId().isEmpty()) {
        path << folder.entryObjectId();
        names << folder.header().name();
    }
    entry.setPath(path);
    entry.setStringPath(names);
    entry.setParentFolderId(folder.entryObjectId());
}

std::shared_ptr<GlobalDirEntry> folderHolding(const GlobalDirEntry &entry)
{
    auto folder = std::make_shared<GlobalDirEntry>();
    folder->setDispatcherID(entry.dispatcherID());
    folder->setStandardizedDispatcherID(entry.standardizedDispatcherID());
    QStringList path = entry.path();
    QStringList names = entry.stringPath();
    folder->setEntryObjectType(Folder::typeId());
    folder->setEntryObjectId(path.isEmpty() ? QString() : path.takeLast());
    if (!names.isEmpty())
        folder->header().setName(names.takeLast());
    folder->setPath(path);
    folder->setStringPath(names);
    return folder;
}

} // namespace vexa
