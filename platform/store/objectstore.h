#pragma once

#include <store/errorinfo.h>
#include <store/storerecord.h>
#include <store/store_export.h>

#include <QStringList>

#include <functional>
#include <vector>

namespace vexa {

// The object store: folders, directory entries and serialized objects.
//
// Every operation is one transaction: it either completes or changes nothing,
// and reports a failure through *error (ErrorInfo with a CorvidErrorCode of its
// own per failure kind). An empty parent folder id means the root folder.
//
// A store instance is used from one thread at a time, the thread that opened it
// (database connections belong to their thread).
class VEXA_STORE_EXPORT ObjectStore
{
public:
    virtual ~ObjectStore();

    virtual bool open(ErrorInfo *error = nullptr) = 0;
    virtual void close() = 0;
    virtual bool isOpen() const = 0;
    // Where the store lives (a file path for an embedded store).
    virtual QString location() const = 0;
    virtual QString rootFolderId() const;

    // The entries (data left empty) of a folder, optionally only of the given
    // types, in the order they were added.
    virtual bool listEntries(const QString &parentFolderId, const QStringList &types,
                             std::vector<StoreRecord> *entries, ErrorInfo *error) = 0;
    // The full records of the given ids, in that order. With a type, every
    // record must be of that type.
    virtual bool fetch(const QStringList &ids, const QString &type, std::vector<StoreRecord> *records,
                       ErrorInfo *error) = 0;
    // The full records in a folder, optionally of one type.
    virtual bool fetchChildren(const QString &parentFolderId, const QString &type,
                               std::vector<StoreRecord> *records, ErrorInfo *error) = 0;
    // Adds records below a folder. An empty id or uuid is generated; a given id
    // must be free. On success the records carry their ids, parent and version 1.
    virtual bool add(std::vector<StoreRecord> *records, const QString &parentFolderId, ErrorInfo *error) = 0;
    // Replaces name, header and data of a stored record. record->version must be
    // the version the caller read (optimistic locking); on success it is the new one.
    virtual bool update(StoreRecord *record, ErrorInfo *error) = 0;
    // Deletes objects. A non-empty folder is refused unless recursive; with a
    // type every id must be of that type. *removedIds lists every id removed.
    virtual bool remove(const QStringList &ids, const QString &type, bool recursive, QStringList *removedIds,
                        ErrorInfo *error) = 0;
    // Moves an object (a folder with its contents) into another folder.
    virtual bool move(const QString &id, const QString &targetFolderId, StoreRecord *movedEntry,
                      ErrorInfo *error) = 0;
    // Copies an object (a folder with everything below it) into a folder. The
    // copies get new ids and uuids; their serialized forms are copied unchanged,
    // so references to other objects keep pointing at the originals.
    virtual bool copy(const QString &id, const QString &targetFolderId, StoreRecord *copiedEntry,
                      ErrorInfo *error) = 0;
    // Every record below a folder (depth first, folders before their contents),
    // handed to the visitor one by one; the visitor returns false to stop.
    virtual bool visitAll(const std::function<bool(const StoreRecord &)> &visitor, ErrorInfo *error) = 0;
    virtual int count(ErrorInfo *error) = 0;

    // The object type names the store accepts.
    static QStringList knownTypes();
    static bool isKnownType(const QString &type);
    // Adds a type name (thread-safe; types are never removed).
    static void registerType(const QString &type);
};

} // namespace vexa
