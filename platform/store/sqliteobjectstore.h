#pragma once

#include <store/objectstore.h>
#include <store/store_export.h>

#include <QSqlDatabase>
#include <QString>

namespace vexa {

// The embedded object store: one SQLite file in write-ahead-log mode with
// synchronous=FULL, so that a committed command survives a crash of the process
// and a power loss. Each instance owns a database connection of its own, named
// uniquely; it must be opened, used and closed on one thread.
//
// Schema: `entries` holds the directory entry of every object (folders
// included) in insertion order, `objects` the serialized form beside it, `meta`
// the schema version. The root folder has the id "root".
class VEXA_STORE_EXPORT SqliteObjectStore : public ObjectStore
{
public:
    enum class OpenMode { CreateIfMissing, MustExist };

    explicit SqliteObjectStore(const QString &filePath, OpenMode mode = OpenMode::CreateIfMissing);
    ~SqliteObjectStore() override;
    SqliteObjectStore(const SqliteObjectStore &) = delete;
    SqliteObjectStore &operator=(const SqliteObjectStore &) = delete;

    bool open(ErrorInfo *error = nullptr) override;
    void close() override;
    bool isOpen() const override;
    QString location() const override { return m_filePath; }

    bool listEntries(const QString &parentFolderId, const QStringList &types, std::vector<StoreRecord> *entries,
                     ErrorInfo *error) override;
    bool fetch(const QStringList &ids, const QString &type, std::vector<StoreRecord> *records,
               ErrorInfo *error) override;
    bool fetchChildren(const QString &parentFolderId, const QString &type, std::vector<StoreRecord> *records,
                       ErrorInfo *error) override;
    bool add(std::vector<StoreRecord> *records, const QString &parentFolderId, ErrorInfo *error) override;
    bool update(StoreRecord *record, ErrorInfo *error) override;
    bool remove(const QStringList &ids, const QString &type, bool recursive, QStringList *removedIds,
                ErrorInfo *error) override;
    bool move(const QString &id, const QString &targetFolderId, StoreRecord *movedEntry,
              ErrorInfo *error) override;
    bool copy(const QString &id, const QString &targetFolderId, StoreRecord *copiedEntry,
              ErrorInfo *error) override;
    bool visitAll(const std::function<bool(const StoreRecord &)> &visitor, ErrorInfo *error) override;
    int count(ErrorInfo *error) override;

    QString connectionName() const { return m_connectionName; }

private:
    class Transaction;

    bool createSchema(ErrorInfo *error);
    bool databaseError(ErrorInfo *error, const QString &what, const QString &detail);
    QString folderIdOrRoot(const QString &id) const;
    // Looks up an entry (data not read). Returns false with ObjectNotFound.
    bool entry(const QString &id, StoreRecord *record, ErrorInfo *error);
    bool requireFolder(const QString &id, StoreRecord *folder, ErrorInfo *error);
    // The ids of an object and everything below it, parents before children.
    bool subtree(const QString &id, QStringList *ids, ErrorInfo *error);

    QString m_filePath;
    OpenMode m_mode;
    QString m_connectionName;
    QSqlDatabase m_db;
};

} // namespace vexa
