#pragma once

#include <store/store_export.h>

#include <QByteArray>
#include <QString>

namespace vexa {

// One stored object as the store sees it: its directory entry (id, type,
// parent folder, name, header) and the object's serialized form. The store
// does not look inside `data`.
class VEXA_STORE_EXPORT StoreRecord
{
public:
    static QString folderType(); // "Folder"

    bool isFolder() const { return type == folderType(); }

    QString id;
    QString uuid;
    QString type;
    QString parentId;
    QString name;
    QByteArray header; // The header as JSON, as the object's serialized form writes it.
    int version = 0;   // 1 on the first store, incremented by every update.
    QByteArray data;   // Empty in directory listings.
};

} // namespace vexa
