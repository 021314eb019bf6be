#include <store/sqliteobjectstore.h>

#include <utilities/logger.h>

#include <QAtomicInteger>
#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QSqlError>
#include <QSqlQuery>
#include <QUuid>
#include <QVariant>

#include <unordered_set>

namespace vexa {

namespace {

const int SchemaVersion = 1;

QString tr(const char *text)
{
    return QCoreApplication::translate("vexa::SqliteObjectStore", text);
}

QString newId()
{
    return QUuid::createUuid().toString(QUuid::WithoutBraces);
}

QString nextConnectionName()
{
    static QAtomicInteger<int> counter;
    return QStringLiteral("vexa-store-%1").arg(counter.fetchAndAddRelaxed(1) + 1);
}

const char *EntryColumns = "e.id, e.uuid, e.type, e.parent_id, e.name, e.header, e.version";

StoreRecord readEntry(const QSqlQuery &query, bool withData)
{
    StoreRecord r;
    r.id = query.value(0).toString();
    r.uuid = query.value(1).toString();
    r.type = query.value(2).toString();
    r.parentId = query.value(3).toString();
    r.name = query.value(4).toString();
    r.header = query.value(5).toByteArray();
    r.version = query.value(6).toInt();
    if (withData)
        r.data = query.value(7).toByteArray();
    return r;
}

} // namespace

// Begins a transaction on construction and rolls it back on destruction unless committed.
class SqliteObjectStore::Transaction
{
public:
    explicit Transaction(QSqlDatabase &db)
        : m_db(db)
        , m_active(db.transaction())
    {
    }
    ~Transaction()
    {
        if (m_active)
            m_db.rollback();
    }
    bool isActive() const { return m_active; }
    bool commit()
    {
        if (!m_active)
            return false;
        m_active = false;
        if (m_db.commit())
            return true;
        m_db.rollback();
        return false;
    }

private:
    QSqlDatabase &m_db;
    bool m_active;
};

SqliteObjectStore::SqliteObjectStore(const QString &filePath, OpenMode mode)
    : m_filePath(filePath)
    , m_mode(mode)
    , m_connectionName(nextConnectionName())
{
}

SqliteObjectStore::~SqliteObjectStore()
{
    close();
}

bool SqliteObjectStore::open(ErrorInfo *error)
{
    if (isOpen())
        return true;
    const QFileInfo info(m_filePath);
    const auto cannotOpen = [&](const QString &detail) {
        Logger::instance().error(LogCategory::Store,
                                 QStringLiteral("SqliteObjectStore::open: %1: %2").arg(m_filePath, detail));
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected,
                               tr("The object store \"%1\" cannot be opened.").arg(m_filePath), detail);
    };
    if (m_filePath.isEmpty())
        return cannotOpen(QStringLiteral("no file name"));
    if (info.exists()) {
        if (!info.isFile() || !info.isWritable())
            return cannotOpen(QStringLiteral("not a writable file"));
    } else {
        if (m_mode == OpenMode::MustExist)
            return cannotOpen(QStringLiteral("file does not exist"));
        const QFileInfo dir(info.absolutePath());
        if (!dir.isDir() || !dir.isWritable())
            return cannotOpen(QStringLiteral("folder missing or not writable"));
    }

    m_db = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), m_connectionName);
    m_db.setDatabaseName(info.absoluteFilePath());
    m_db.setConnectOptions(QStringLiteral("QSQLITE_BUSY_TIMEOUT=5000"));
    if (!m_db.open()) {
        const QString detail = m_db.lastError().text();
        close();
        return cannotOpen(detail);
    }
    QSqlQuery query(m_db);
    if (!query.exec(QStringLiteral("PRAGMA journal_mode=WAL")) || !query.next()
        || query.value(0).toString().compare(QLatin1String("wal"), Qt::CaseInsensitive) != 0) {
        const QString detail = QStringLiteral("write-ahead log not available: ") + query.lastError().text();
        close();
        return cannotOpen(detail);
    }
    // FULL: in WAL mode NORMAL may lose the last commits on a power loss; the
    // store's commits are user actions, so an fsync per commit costs little.
    query.exec(QStringLiteral("PRAGMA synchronous=FULL"));
    if (!createSchema(error)) {
        close();
        return false;
    }
    return true;
}

void SqliteObjectStore::close()
{
    if (!m_db.isValid())
        return;
    m_db.close();
    m_db = QSqlDatabase();
    QSqlDatabase::removeDatabase(m_connectionName);
}

bool SqliteObjectStore::isOpen() const
{
    return m_db.isValid() && m_db.isOpen();
}

bool SqliteObjectStore::databaseError(ErrorInfo *error, const QString &what, const QString &detail)
{
    Logger::instance().error(LogCategory::Store,
                             QStringLiteral("SqliteObjectStore::%1: %2 (%3)").arg(what, detail, m_filePath));
    return ErrorInfo::fail(error, CorvidErrorCode::DatabaseError, tr("The object store could not be accessed."),
                           what + QStringLiteral(": ") + detail);
}

bool SqliteObjectStore::createSchema(ErrorInfo *error)
{
    Transaction transaction(m_db);
    if (!transaction.isActive())
        return databaseError(error, QStringLiteral("createSchema"), m_db.lastError().text());
    QSqlQuery query(m_db);
    const QStringList statements{
        QStringLiteral("CREATE TABLE IF NOT EXISTS meta (key TEXT PRIMARY KEY, value TEXT NOT NULL)"),
        QStringLiteral("CREATE TABLE IF NOT EXISTS entries ("
                       " seq INTEGER PRIMARY KEY,"
                       " id TEXT NOT NULL UNIQUE,"
                       " uuid TEXT NOT NULL,"
                       " type TEXT NOT NULL,"
                       " parent_id TEXT,"
                       " name TEXT NOT NULL DEFAULT '',"
                       " header BLOB NOT NULL DEFAULT '{}',"
                       " version INTEGER NOT NULL DEFAULT 1)"),
        QStringLiteral("CREATE INDEX IF NOT EXISTS entries_parent ON entries (parent_id, seq)"),
        QStringLiteral("CREATE TABLE IF NOT EXISTS objects (id TEXT PRIMARY KEY, data BLOB NOT NULL) WITHOUT ROWID"),
    };
    for (const QString &statement : statements) {
        if (!query.exec(statement))
            return databaseError(error, QStringLiteral("createSchema"), query.lastError().text());
    }
    query.prepare(QStringLiteral("SELECT value FROM meta WHERE key = 'schema'"));
    if (!query.exec())
        return databaseError(error, QStringLiteral("createSchema"), query.lastError().text());
    if (query.next()) {
        if (query.value(0).toInt() > SchemaVersion)
            return ErrorInfo::fail(error, CorvidErrorCode::NotSupported,
                                   tr("The object store \"%1\" was written by a newer version.").arg(m_filePath),
                                   QStringLiteral("schema %1").arg(query.value(0).toString()));
    } else {
        query.prepare(QStringLiteral("INSERT INTO meta (key, value) VALUES ('schema', ?)"));
        query.addBindValue(QString::number(SchemaVersion));
        if (!query.exec())
            return databaseError(error, QStringLiteral("createSchema"), query.lastError().text());
    }
    query.prepare(QStringLiteral("INSERT OR IGNORE INTO entries (id, uuid, type, parent_id, name, header, version)"
                                 " VALUES (?, ?, ?, NULL, 'Root', '{}', 1)"));
    query.addBindValue(rootFolderId());
    query.addBindValue(newId());
    query.addBindValue(StoreRecord::folderType());
    if (!query.exec())
        return databaseError(error, QStringLiteral("createSchema"), query.lastError().text());
    query.prepare(QStringLiteral("INSERT OR IGNORE INTO objects (id, data) VALUES (?, ?)"));
    query.addBindValue(rootFolderId());
    query.addBindValue(QByteArray(""));
    if (!query.exec())
        return databaseError(error, QStringLiteral("createSchema"), query.lastError().text());
    if (!transaction.commit())
        return databaseError(error, QStringLiteral("createSchema"), m_db.lastError().text());
    return true;
}

QString SqliteObjectStore::folderIdOrRoot(const QString &id) const
{
    return id.isEmpty() ? rootFolderId() : id;
}

bool SqliteObjectStore::entry(const QString &id, StoreRecord *record, ErrorInfo *error)
{
    QSqlQuery query(m_db);
    query.prepare(QStringLiteral("SELECT %1 FROM entries e WHERE e.id = ?").arg(QLatin1String(EntryColumns)));
    query.addBindValue(id);
    if (!query.exec())
        return databaseError(error, QStringLiteral("entry"), query.lastError().text());
    if (!query.next())
        return ErrorInfo::fail(error, CorvidErrorCode::ObjectNotFound,
                               tr("The object \"%1\" does not exist.").arg(id));
    if (record)
        *record = readEntry(query, false);
    return true;
}

bool SqliteObjectStore::requireFolder(const QString &id, StoreRecord *folder, ErrorInfo *error)
{
    StoreRecord found;
    ErrorInfo lookup;
    if (!entry(id, &found, &lookup)) {
        if (lookup.errorCode() == CorvidErrorCode::ObjectNotFound)
            return ErrorInfo::fail(error, CorvidErrorCode::FolderNotFound,
                                   tr("The folder \"%1\" does not exist.").arg(id));
        if (error)
            *error = lookup;
        return false;
    }
    if (!found.isFolder())
        return ErrorInfo::fail(error, CorvidErrorCode::NotAFolder,
                               tr("\"%1\" is not a folder.").arg(found.name.isEmpty() ? id : found.name));
    if (folder)
        *folder = found;
    return true;
}

bool SqliteObjectStore::subtree(const QString &id, QStringList *ids, ErrorInfo *error)
{
    // Breadth first: a folder's id always comes before the ids of its contents.
    QSqlQuery query(m_db);
    query.prepare(QStringLiteral("WITH RECURSIVE sub(id) AS (SELECT ? UNION ALL"
                                 " SELECT e.id FROM entries e JOIN sub ON e.parent_id = sub.id)"
                                 " SELECT id FROM sub"));
    query.addBindValue(id);
    if (!query.exec())
        return databaseError(error, QStringLiteral("subtree"), query.lastError().text());
    ids->clear();
    while (query.next())
        ids->append(query.value(0).toString());
    return true;
}

bool SqliteObjectStore::listEntries(const QString &parentFolderId, const QStringList &types,
                                    std::vector<StoreRecord> *entries, ErrorInfo *error)
{
    if (!isOpen())
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
    for (const QString &type : types) {
        if (!isKnownType(type))
            return ErrorInfo::fail(error, CorvidErrorCode::UnknownType, tr("Unknown object type \"%1\".").arg(type));
    }
    const QString parent = folderIdOrRoot(parentFolderId);
    Transaction transaction(m_db);
    if (!requireFolder(parent, nullptr, error))
        return false;
    QString sql = QStringLiteral("SELECT %1 FROM entries e WHERE e.parent_id = ?").arg(QLatin1String(EntryColumns));
    if (!types.isEmpty()) {
        QStringList marks;
        for (int i = 0; i < types.size(); ++i)
            marks << QStringLiteral("?");
        sql += QStringLiteral(" AND e.type IN (%1)").arg(marks.join(QLatin1Char(',')));
    }
    sql += QStringLiteral(" ORDER BY e.seq");
    QSqlQuery query(m_db);
    query.setForwardOnly(true);
    query.prepare(sql);
    query.addBindValue(parent);
    for (const QString &type : types)
        query.addBindValue(type);
    if (!query.exec())
        return databaseError(error, QStringLiteral("listEntries"), query.lastError().text());
    std::vector<StoreRecord> result;
    while (query.next())
        result.push_back(readEntry(query, false));
    *entries = std::move(result);
    return true;
}

bool SqliteObjectStore::fetch(const QStringList &ids, const QString &type, std::vector<StoreRecord> *records,
                              ErrorInfo *error)
{
    if (!isOpen())
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
    if (!type.isEmpty() && !isKnownType(type))
        return ErrorInfo::fail(error, CorvidErrorCode::UnknownType, tr("Unknown object type \"%1\".").arg(type));
    Transaction transaction(m_db);
    QSqlQuery query(m_db);
    query.setForwardOnly(true);
    query.prepare(QStringLiteral("SELECT %1, o.data FROM entries e JOIN objects o ON o.id = e.id WHERE e.id = ?")
                      .arg(QLatin1String(EntryColumns)));
    std::vector<StoreRecord> result;
    result.reserve(ids.size());
    for (const QString &id : ids) {
        query.addBindValue(id);
        if (!query.exec())
            return databaseError(error, QStringLiteral("fetch"), query.lastError().text());
        if (!query.next())
            return ErrorInfo::fail(error, CorvidErrorCode::ObjectNotFound,
                                   tr("The object \"%1\" does not exist.").arg(id));
        StoreRecord record = readEntry(query, true);
        if (!type.isEmpty() && record.type != type)
            return ErrorInfo::fail(error, CorvidErrorCode::TypeMismatch,
                                   tr("The object \"%1\" is a %2, not a %3.").arg(record.name, record.type, type));
        result.push_back(std::move(record));
        query.finish();
    }
    *records = std::move(result);
    return true;
}

bool SqliteObjectStore::fetchChildren(const QString &parentFolderId, const QString &type,
                                      std::vector<StoreRecord> *records, ErrorInfo *error)
{
    if (!isOpen())
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
    if (!type.isEmpty() && !isKnownType(type))
        return ErrorInfo::fail(error, CorvidErrorCode::UnknownType, tr("Unknown object type \"%1\".").arg(type));
    const QString parent = folderIdOrRoot(parentFolderId);
    Transaction transaction(m_db);
    if (!requireFolder(parent, nullptr, error))
        return false;
    QSqlQuery query(m_db);
    query.setForwardOnly(true);
    query.prepare(QStringLiteral("SELECT %1, o.data FROM entries e JOIN objects o ON o.id = e.id"
                                 " WHERE e.parent_id = ?%2 ORDER BY e.seq")
                      .arg(QLatin1String(EntryColumns),
                           type.isEmpty() ? QString() : QStringLiteral(" AND e.type = ?")));
    query.addBindValue(parent);
    if (!type.isEmpty())
        query.addBindValue(type);
    if (!query.exec())
        return databaseError(error, QStringLiteral("fetchChildren"), query.lastError().text());
    std::vector<StoreRecord> result;
    while (query.next())
        result.push_back(readEntry(query, true));
    *records = std::move(result);
    return true;
}

bool SqliteObjectStore::add(std::vector<StoreRecord> *records, const QString &parentFolderId, ErrorInfo *error)
{
    if (!isOpen())
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
    const QString parent = folderIdOrRoot(parentFolderId);
    for (const StoreRecord &record : *records) {
        if (!isKnownType(record.type))
            return ErrorInfo::fail(error, CorvidErrorCode::UnknownType,
                                   tr("Unknown object type \"%1\".").arg(record.type));
    }
    Transaction transaction(m_db);
    if (!transaction.isActive())
        return databaseError(error, QStringLiteral("add"), m_db.lastError().text());
    if (!requireFolder(parent, nullptr, error))
        return false;

    std::vector<StoreRecord> stored = *records;
    QSqlQuery exists(m_db);
    exists.prepare(QStringLiteral("SELECT 1 FROM entries WHERE id = ?"));
    QSqlQuery insertEntry(m_db);
    insertEntry.prepare(QStringLiteral("INSERT INTO entries (id, uuid, type, parent_id, name, header, version)"
                                       " VALUES (?, ?, ?, ?, ?, ?, 1)"));
    QSqlQuery insertData(m_db);
    insertData.prepare(QStringLiteral("INSERT INTO objects (id, data) VALUES (?, ?)"));
    std::unordered_set<QString> seen;
    for (StoreRecord &record : stored) {
        if (record.id.isEmpty()) {
            record.id = newId();
        } else {
            exists.addBindValue(record.id);
            if (!exists.exec())
                return databaseError(error, QStringLiteral("add"), exists.lastError().text());
            const bool taken = exists.next();
            exists.finish();
            if (taken || !seen.insert(record.id).second)
                return ErrorInfo::fail(error, CorvidErrorCode::DuplicateId,
                                       tr("An object with the id \"%1\" already exists.").arg(record.id));
        }
        if (record.uuid.isEmpty())
            record.uuid = newId();
        record.parentId = parent;
        record.version = 1;
        insertEntry.addBindValue(record.id);
        insertEntry.addBindValue(record.uuid);
        insertEntry.addBindValue(record.type);
        insertEntry.addBindValue(record.parentId);
        insertEntry.addBindValue(record.name);
        insertEntry.addBindValue(record.header.isEmpty() ? QByteArray("{}") : record.header);
        if (!insertEntry.exec())
            return databaseError(error, QStringLiteral("add"), insertEntry.lastError().text());
        insertData.addBindValue(record.id);
        insertData.addBindValue(record.data.isNull() ? QByteArray("") : record.data);
        if (!insertData.exec())
            return databaseError(error, QStringLiteral("add"), insertData.lastError().text());
    }
    if (!transaction.commit())
        return databaseError(error, QStringLiteral("add"), m_db.lastError().text());
    *records = std::move(stored);
    return true;
}

bool SqliteObjectStore::update(StoreRecord *record, ErrorInfo *error)
{
    if (!isOpen())
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
    if (record->id == rootFolderId())
        return ErrorInfo::fail(error, CorvidErrorCode::RootFolderProtected, tr("The root folder cannot be changed."));
    Transaction transaction(m_db);
    if (!transaction.isActive())
        return databaseError(error, QStringLiteral("update"), m_db.lastError().text());
    StoreRecord current;
    if (!entry(record->id, &current, error))
        return false;
    if (current.type != record->type)
        return ErrorInfo::fail(error, CorvidErrorCode::TypeMismatch,
                               tr("The object \"%1\" is a %2, not a %3.").arg(current.name, current.type, record->type));
    if (current.version != record->version)
        return ErrorInfo::fail(error, CorvidErrorCode::VersionConflict,
                               tr("\"%1\" was changed meanwhile (stored version %2, edited version %3). "
                                  "Reload it and apply the changes again.")
                                   .arg(current.name)
                                   .arg(current.version)
                                   .arg(record->version));
    QSqlQuery query(m_db);
    query.prepare(QStringLiteral("UPDATE entries SET name = ?, header = ?, version = version + 1"
                                 " WHERE id = ? AND version = ?"));
    query.addBindValue(record->name);
    query.addBindValue(record->header.isEmpty() ? QByteArray("{}") : record->header);
    query.addBindValue(record->id);
    query.addBindValue(record->version);
    if (!query.exec() || query.numRowsAffected() != 1)
        return databaseError(error, QStringLiteral("update"), query.lastError().text());
    query.prepare(QStringLiteral("UPDATE objects SET data = ? WHERE id = ?"));
    query.addBindValue(record->data.isNull() ? QByteArray("") : record->data);
    query.addBindValue(record->id);
    if (!query.exec())
        return databaseError(error, QStringLiteral("update"), query.lastError().text());
    if (!transaction.commit())
        return databaseError(error, QStringLiteral("update"), m_db.lastError().text());
    record->version = current.version + 1;
    record->uuid = current.uuid;
    record->parentId = current.parentId;
    return true;
}

bool SqliteObjectStore::remove(const QStringList &ids, const QString &type, bool recursive, QStringList *removedIds,
                               ErrorInfo *error)
{
    if (!isOpen())
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
    if (!type.isEmpty() && !isKnownType(type))
        return ErrorInfo::fail(error, CorvidErrorCode::UnknownType, tr("Unknown object type \"%1\".").arg(type));
    Transaction transaction(m_db);
    if (!transaction.isActive())
        return databaseError(error, QStringLiteral("remove"), m_db.lastError().text());
    QStringList all;
    QSqlQuery deleteEntry(m_db);
    deleteEntry.prepare(QStringLiteral("DELETE FROM entries WHERE id = ?"));
    QSqlQuery deleteData(m_db);
    deleteData.prepare(QStringLiteral("DELETE FROM objects WHERE id = ?"));
    for (const QString &id : ids) {
        if (id == rootFolderId() || id.isEmpty())
            return ErrorInfo::fail(error, CorvidErrorCode::RootFolderProtected,
                                   tr("The root folder cannot be changed."));
        StoreRecord current;
        if (all.contains(id))
            continue; // Already removed with a folder given earlier in the list.
        if (!entry(id, &current, error))
            return false;
        if (!type.isEmpty() && current.type != type)
            return ErrorInfo::fail(error, CorvidErrorCode::TypeMismatch,
                                   tr("The object \"%1\" is a %2, not a %3.").arg(current.name, current.type, type));
        QStringList below;
        if (!subtree(id, &below, error))
            return false;
        if (below.size() > 1 && !recursive)
            return ErrorInfo::fail(error, CorvidErrorCode::FolderNotEmpty,
                                   tr("The folder \"%1\" is not empty.").arg(current.name));
        // Contents first, so that no entry is ever left without its folder.
        for (auto it = below.crbegin(); it != below.crend(); ++it) {
            deleteEntry.addBindValue(*it);
            deleteData.addBindValue(*it);
            if (!deleteEntry.exec() || !deleteData.exec())
                return databaseError(error, QStringLiteral("remove"),
                                     deleteEntry.lastError().text() + deleteData.lastError().text());
            all.append(*it);
        }
    }
    if (!transaction.commit())
        return databaseError(error, QStringLiteral("remove"), m_db.lastError().text());
    if (removedIds)
        *removedIds = all;
    return true;
}

bool SqliteObjectStore::move(const QString &id, const QString &targetFolderId, StoreRecord *movedEntry,
                             ErrorInfo *error)
{
    if (!isOpen())
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
    if (id.isEmpty() || id == rootFolderId())
        return ErrorInfo::fail(error, CorvidErrorCode::RootFolderProtected, tr("The root folder cannot be changed."));
    const QString target = folderIdOrRoot(targetFolderId);
    Transaction transaction(m_db);
    if (!transaction.isActive())
        return databaseError(error, QStringLiteral("move"), m_db.lastError().text());
    StoreRecord moved;
    if (!entry(id, &moved, error) || !requireFolder(target, nullptr, error))
        return false;
    // Walk up from the target: meeting the moved object means a move into itself.
    QString cursor = target;
    QSqlQuery up(m_db);
    up.prepare(QStringLiteral("SELECT parent_id FROM entries WHERE id = ?"));
    int guard = 0;
    while (!cursor.isEmpty()) {
        if (cursor == id)
            return ErrorInfo::fail(error, CorvidErrorCode::MoveIntoOwnSubfolder,
                                   tr("The folder \"%1\" cannot be moved into itself or one of its subfolders.")
                                       .arg(moved.name));
        up.addBindValue(cursor);
        if (!up.exec())
            return databaseError(error, QStringLiteral("move"), up.lastError().text());
        cursor = up.next() ? up.value(0).toString() : QString();
        up.finish();
        if (++guard > 100000)
            return databaseError(error, QStringLiteral("move"), QStringLiteral("folder cycle"));
    }
    QSqlQuery query(m_db);
    query.prepare(QStringLiteral("UPDATE entries SET parent_id = ? WHERE id = ?"));
    query.addBindValue(target);
    query.addBindValue(id);
    if (!query.exec())
        return databaseError(error, QStringLiteral("move"), query.lastError().text());
    if (!transaction.commit())
        return databaseError(error, QStringLiteral("move"), m_db.lastError().text());
    moved.parentId = target;
    if (movedEntry)
        *movedEntry = moved;
    return true;
}

bool SqliteObjectStore::copy(const QString &id, const QString &targetFolderId, StoreRecord *copiedEntry,
                             ErrorInfo *error)
{
    if (!isOpen())
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
    if (id.isEmpty() || id == rootFolderId())
        return ErrorInfo::fail(error, CorvidErrorCode::RootFolderProtected, tr("The root folder cannot be changed."));
    const QString target = folderIdOrRoot(targetFolderId);
    Transaction transaction(m_db);
    if (!transaction.isActive())
        return databaseError(error, QStringLiteral("copy"), m_db.lastError().text());
    if (!entry(id, nullptr, error) || !requireFolder(target, nullptr, error))
        return false;
    // The subtree is read before anything is written, so copying a folder into
    // its own subfolder copies it once.
    QStringList ids;
    if (!subtree(id, &ids, error))
        return false;
    std::vector<StoreRecord> originals;
    QSqlQuery read(m_db);
    read.prepare(QStringLiteral("SELECT %1, o.data FROM entries e JOIN objects o ON o.id = e.id WHERE e.id = ?")
                     .arg(QLatin1String(EntryColumns)));
    for (const QString &oldId : ids) {
        read.addBindValue(oldId);
        if (!read.exec() || !read.next())
            return databaseError(error, QStringLiteral("copy"), read.lastError().text());
        originals.push_back(readEntry(read, true));
        read.finish();
    }
    QHash<QString, QString> newIds;
    QSqlQuery insertEntry(m_db);
    insertEntry.prepare(QStringLiteral("INSERT INTO entries (id, uuid, type, parent_id, name, header, version)"
                                       " VALUES (?, ?, ?, ?, ?, ?, 1)"));
    QSqlQuery insertData(m_db);
    insertData.prepare(QStringLiteral("INSERT INTO objects (id, data) VALUES (?, ?)"));
    StoreRecord top;
    for (StoreRecord &record : originals) {
        const QString copyId = newId();
        newIds.insert(record.id, copyId);
        record.parentId = record.id == id ? target : newIds.value(record.parentId);
        record.id = copyId;
        record.uuid = newId();
        record.version = 1;
        insertEntry.addBindValue(record.id);
        insertEntry.addBindValue(record.uuid);
        insertEntry.addBindValue(record.type);
        insertEntry.addBindValue(record.parentId);
        insertEntry.addBindValue(record.name);
        insertEntry.addBindValue(record.header);
        insertData.addBindValue(record.id);
        insertData.addBindValue(record.data);
        if (!insertEntry.exec() || !insertData.exec())
            return databaseError(error, QStringLiteral("copy"),
                                 insertEntry.lastError().text() + insertData.lastError().text());
        if (top.id.isEmpty()) {
            top = record;
            top.data.clear();
        }
    }
    if (!transaction.commit())
        return databaseError(error, QStringLiteral("copy"), m_db.lastError().text());
    if (copiedEntry)
        *copiedEntry = top;
    return true;
}

bool SqliteObjectStore::visitAll(const std::function<bool(const StoreRecord &)> &visitor, ErrorInfo *error)
{
    if (!isOpen())
        return ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
    Transaction transaction(m_db);
    QStringList ids;
    if (!subtree(rootFolderId(), &ids, error))
        return false;
    ids.removeFirst();
    QSqlQuery read(m_db);
    read.prepare(QStringLiteral("SELECT %1, o.data FROM entries e JOIN objects o ON o.id = e.id WHERE e.id = ?")
                     .arg(QLatin1String(EntryColumns)));
    for (const QString &id : qAsConst(ids)) {
        read.addBindValue(id);
        if (!read.exec() || !read.next())
            return databaseError(error, QStringLiteral("visitAll"), read.lastError().text());
        const StoreRecord record = readEntry(read, true);
        read.finish();
        if (!visitor(record))
            break;
    }
    return true;
}

int SqliteObjectStore::count(ErrorInfo *error)
{
    if (!isOpen()) {
        ErrorInfo::fail(error, CorvidErrorCode::NotConnected, tr("The object store is not open."));
        return -1;
    }
    QSqlQuery query(m_db);
    if (!query.exec(QStringLiteral("SELECT COUNT(*) FROM entries WHERE id <> 'root'")) || !query.next()) {
        databaseError(error, QStringLiteral("count"), query.lastError().text());
        return -1;
    }
    return query.value(0).toInt();
}

} // namespace vexa
