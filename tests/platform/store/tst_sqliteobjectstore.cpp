#include <store/sqliteobjectstore.h>

#include <QSqlDatabase>
#include <QSqlQuery>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

namespace {

StoreRecord record(const QString &type, const QString &name, const QByteArray &data = QByteArray("{}"))
{
    StoreRecord r;
    r.type = type;
    r.name = name;
    r.header = QByteArray("{\"name\":\"") + name.toUtf8() + "\"}";
    r.data = data;
    return r;
}

// The whole store as text: one line per record, for "nothing changed" checks.
QString dump(ObjectStore &store)
{
    QStringList lines;
    store.visitAll(
        [&](const StoreRecord &r) {
            lines << QStringLiteral("%1|%2|%3|%4|%5|%6|%7")
                         .arg(r.id, r.uuid, r.type, r.parentId, r.name)
                         .arg(r.version)
                         .arg(QString::fromUtf8(r.data));
            return true;
        },
        nullptr);
    return lines.join(QLatin1Char('\n'));
}

} // namespace

class tst_SqliteObjectStore : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void opensInWalModeWithRootFolder();
    void refusesUnopenableFiles_data();
    void refusesUnopenableFiles();
    void addListFetch();
    void listFiltersByType();
    void givenIdsAreKeptAndDuplicatesRefused();
    void updateIncrementsVersion();
    void moveAndCopy();
    void deleteFolderRecursively();
    void badRequestsChangeNothing_data();
    void badRequestsChangeNothing();
    void survivesReopen();

private:
    QTemporaryDir m_dir;
    std::unique_ptr<SqliteObjectStore> m_store;
    QString m_folderA, m_folderB, m_sub, m_trial;
};

void tst_SqliteObjectStore::init()
{
    QVERIFY(m_dir.isValid());
    QFile::remove(m_dir.filePath(QStringLiteral("store.db")));
    m_store = std::make_unique<SqliteObjectStore>(m_dir.filePath(QStringLiteral("store.db")));
    ErrorInfo error;
    QVERIFY2(m_store->open(&error), qPrintable(error.toString()));
    // root / A / Sub / Trial 1, root / B
    std::vector<StoreRecord> top{record(QStringLiteral("Folder"), QStringLiteral("A")),
                                 record(QStringLiteral("Folder"), QStringLiteral("B"))};
    QVERIFY(m_store->add(&top, QString(), &error));
    m_folderA = top[0].id;
    m_folderB = top[1].id;
    std::vector<StoreRecord> sub{record(QStringLiteral("Folder"), QStringLiteral("Sub"))};
    QVERIFY(m_store->add(&sub, m_folderA, &error));
    m_sub = sub[0].id;
    std::vector<StoreRecord> trial{record(QStringLiteral("Trial"), QStringLiteral("Trial 1"), "payload")};
    QVERIFY(m_store->add(&trial, m_sub, &error));
    m_trial = trial[0].id;
}

void tst_SqliteObjectStore::cleanup()
{
    m_store.reset();
}

void tst_SqliteObjectStore::opensInWalModeWithRootFolder()
{
    QSqlDatabase db = QSqlDatabase::database(m_store->connectionName());
    QSqlQuery query(db);
    QVERIFY(query.exec(QStringLiteral("PRAGMA journal_mode")) && query.next());
    QCOMPARE(query.value(0).toString(), QStringLiteral("wal"));
    QVERIFY(query.exec(QStringLiteral("PRAGMA synchronous")) && query.next());
    QCOMPARE(query.value(0).toInt(), 2); // FULL
    std::vector<StoreRecord> root;
    QVERIFY(m_store->fetch({m_store->rootFolderId()}, QStringLiteral("Folder"), &root, nullptr));
    QCOMPARE(m_store->count(nullptr), 4);
}

void tst_SqliteObjectStore::refusesUnopenableFiles_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("mustExist");
    QTest::newRow("missing folder") << QStringLiteral("/nonexistent-vexa-dir/x.db") << false;
    QTest::newRow("missing file, must exist") << QStringLiteral("missing.db") << true;
    QTest::newRow("a folder") << QStringLiteral(".") << false;
    QTest::newRow("empty name") << QString() << false;
}

void tst_SqliteObjectStore::refusesUnopenableFiles()
{
    QFETCH(QString, path);
    QFETCH(bool, mustExist);
    if (!path.isEmpty() && !path.startsWith(QLatin1Char('/')))
        path = m_dir.filePath(path);
    SqliteObjectStore store(path, mustExist ? SqliteObjectStore::OpenMode::MustExist
                                            : SqliteObjectStore::OpenMode::CreateIfMissing);
    ErrorInfo error;
    QVERIFY(!store.open(&error));
    QVERIFY(!store.isOpen());
    QCOMPARE(error.errorCode(), CorvidErrorCode::NotConnected);
    QVERIFY(!error.message().isEmpty());
    std::vector<StoreRecord> entries;
    QVERIFY(!store.listEntries(QString(), {}, &entries, &error));
    QCOMPARE(error.errorCode(), CorvidErrorCode::NotConnected);
}

void tst_SqliteObjectStore::addListFetch()
{
    std::vector<StoreRecord> entries;
    ErrorInfo error;
    QVERIFY(m_store->listEntries(QString(), {}, &entries, &error));
    QCOMPARE(entries.size(), size_t(2));
    QCOMPARE(entries[0].name, QStringLiteral("A"));
    QCOMPARE(entries[1].name, QStringLiteral("B"));
    QVERIFY(entries[0].data.isEmpty());
    QCOMPARE(entries[0].parentId, m_store->rootFolderId());

    std::vector<StoreRecord> records;
    QVERIFY(m_store->fetch({m_trial}, QStringLiteral("Trial"), &records, &error));
    QCOMPARE(records.size(), size_t(1));
    QCOMPARE(records[0].data, QByteArray("payload"));
    QCOMPARE(records[0].version, 1);
    QCOMPARE(records[0].parentId, m_sub);
    QVERIFY(!records[0].uuid.isEmpty());

    QVERIFY(m_store->fetchChildren(m_sub, QString(), &records, &error));
    QCOMPARE(records.size(), size_t(1));
    QCOMPARE(records[0].id, m_trial);
}

void tst_SqliteObjectStore::listFiltersByType()
{
    std::vector<StoreRecord> more{record(QStringLiteral("Standard"), QStringLiteral("S")),
                                  record(QStringLiteral("Trial"), QStringLiteral("T2"))};
    QVERIFY(m_store->add(&more, m_sub, nullptr));
    std::vector<StoreRecord> entries;
    QVERIFY(m_store->listEntries(m_sub, {QStringLiteral("Trial")}, &entries, nullptr));
    QCOMPARE(entries.size(), size_t(2));
    QVERIFY(m_store->listEntries(m_sub, {QStringLiteral("Standard"), QStringLiteral("Folder")}, &entries, nullptr));
    QCOMPARE(entries.size(), size_t(1));
    QCOMPARE(entries[0].name, QStringLiteral("S"));
}

void tst_SqliteObjectStore::givenIdsAreKeptAndDuplicatesRefused()
{
    std::vector<StoreRecord> records{record(QStringLiteral("Trial"), QStringLiteral("X"))};
    records[0].id = QStringLiteral("my-id");
    QVERIFY(m_store->add(&records, m_folderB, nullptr));
    QCOMPARE(records[0].id, QStringLiteral("my-id"));
    ErrorInfo error;
    QVERIFY(!m_store->add(&records, m_folderB, &error));
    QCOMPARE(error.errorCode(), CorvidErrorCode::DuplicateId);
}

void tst_SqliteObjectStore::updateIncrementsVersion()
{
    std::vector<StoreRecord> records;
    QVERIFY(m_store->fetch({m_trial}, QString(), &records, nullptr));
    StoreRecord edited = records[0];
    edited.name = QStringLiteral("Renamed");
    edited.data = "changed";
    ErrorInfo error;
    QVERIFY2(m_store->update(&edited, &error), qPrintable(error.toString()));
    QCOMPARE(edited.version, 2);
    QVERIFY(m_store->fetch({m_trial}, QString(), &records, nullptr));
    QCOMPARE(records[0].name, QStringLiteral("Renamed"));
    QCOMPARE(records[0].data, QByteArray("changed"));
    QCOMPARE(records[0].version, 2);
}

void tst_SqliteObjectStore::moveAndCopy()
{
    StoreRecord moved;
    QVERIFY(m_store->move(m_sub, m_folderB, &moved, nullptr));
    QCOMPARE(moved.parentId, m_folderB);
    std::vector<StoreRecord> entries;
    QVERIFY(m_store->listEntries(m_folderA, {}, &entries, nullptr));
    QVERIFY(entries.empty());

    StoreRecord copied;
    QVERIFY(m_store->copy(m_folderB, m_folderA, &copied, nullptr));
    QVERIFY(copied.id != m_folderB);
    QCOMPARE(copied.parentId, m_folderA);
    QCOMPARE(m_store->count(nullptr), 7); // B/Sub/Trial copied below A
    QVERIFY(m_store->listEntries(copied.id, {}, &entries, nullptr));
    QCOMPARE(entries.size(), size_t(1));
    QVERIFY(entries[0].id != m_sub);
    std::vector<StoreRecord> copies;
    QVERIFY(m_store->fetchChildren(entries[0].id, QString(), &copies, nullptr));
    QCOMPARE(copies.size(), size_t(1));
    QCOMPARE(copies[0].data, QByteArray("payload"));
    QVERIFY(copies[0].id != m_trial);

    // A folder copied into its own subfolder is copied once.
    QVERIFY(m_store->copy(m_folderB, m_sub, &copied, nullptr));
    QCOMPARE(m_store->count(nullptr), 10);
}

void tst_SqliteObjectStore::deleteFolderRecursively()
{
    QStringList removed;
    ErrorInfo error;
    QVERIFY2(m_store->remove({m_folderA}, QString(), true, &removed, &error), qPrintable(error.toString()));
    QCOMPARE(removed.size(), 3);
    QCOMPARE(removed.first(), m_trial); // contents first
    QCOMPARE(m_store->count(nullptr), 1);
    std::vector<StoreRecord> records;
    QVERIFY(!m_store->fetch({m_trial}, QString(), &records, &error));
    QCOMPARE(error.errorCode(), CorvidErrorCode::ObjectNotFound);
}

void tst_SqliteObjectStore::badRequestsChangeNothing_data()
{
    QTest::addColumn<QString>("request");
    QTest::addColumn<int>("code");
    QTest::newRow("fetch unknown id") << "fetch-unknown" << int(CorvidErrorCode::ObjectNotFound);
    QTest::newRow("list unknown type") << "list-unknown-type" << int(CorvidErrorCode::UnknownType);
    QTest::newRow("list in a trial") << "list-not-folder" << int(CorvidErrorCode::NotAFolder);
    QTest::newRow("list unknown folder") << "list-unknown-folder" << int(CorvidErrorCode::FolderNotFound);
    QTest::newRow("add unknown type") << "add-unknown-type" << int(CorvidErrorCode::UnknownType);
    QTest::newRow("add batch with a duplicate") << "add-duplicate" << int(CorvidErrorCode::DuplicateId);
    QTest::newRow("move into own subfolder") << "move-into-sub" << int(CorvidErrorCode::MoveIntoOwnSubfolder);
    QTest::newRow("move into itself") << "move-into-self" << int(CorvidErrorCode::MoveIntoOwnSubfolder);
    QTest::newRow("move into a trial") << "move-into-trial" << int(CorvidErrorCode::NotAFolder);
    QTest::newRow("stale update") << "stale-update" << int(CorvidErrorCode::VersionConflict);
    QTest::newRow("update unknown id") << "update-unknown" << int(CorvidErrorCode::ObjectNotFound);
    QTest::newRow("delete non-empty folder") << "delete-non-empty" << int(CorvidErrorCode::FolderNotEmpty);
    QTest::newRow("delete batch with unknown id") << "delete-partly-unknown" << int(CorvidErrorCode::ObjectNotFound);
    QTest::newRow("delete with wrong type") << "delete-wrong-type" << int(CorvidErrorCode::TypeMismatch);
    QTest::newRow("delete root") << "delete-root" << int(CorvidErrorCode::RootFolderProtected);
    QTest::newRow("copy unknown id") << "copy-unknown" << int(CorvidErrorCode::ObjectNotFound);
}

void tst_SqliteObjectStore::badRequestsChangeNothing()
{
    QFETCH(QString, request);
    QFETCH(int, code);
    const QString before = dump(*m_store);
    ErrorInfo error;
    bool ok = true;
    std::vector<StoreRecord> records;
    StoreRecord entry;
    if (request == "fetch-unknown") {
        ok = m_store->fetch({m_trial, QStringLiteral("nope")}, QString(), &records, &error);
    } else if (request == "list-unknown-type") {
        ok = m_store->listEntries(m_sub, {QStringLiteral("Trial"), QStringLiteral("Banana")}, &records, &error);
    } else if (request == "list-not-folder") {
        ok = m_store->listEntries(m_trial, {}, &records, &error);
    } else if (request == "list-unknown-folder") {
        ok = m_store->listEntries(QStringLiteral("nope"), {}, &records, &error);
    } else if (request == "add-unknown-type") {
        records = {record(QStringLiteral("Trial"), QStringLiteral("ok")), record(QStringLiteral("Banana"), "x")};
        ok = m_store->add(&records, m_folderB, &error);
    } else if (request == "add-duplicate") {
        records = {record(QStringLiteral("Trial"), QStringLiteral("ok")), record(QStringLiteral("Trial"), "dup")};
        records[1].id = m_trial;
        ok = m_store->add(&records, m_folderB, &error);
    } else if (request == "move-into-sub") {
        ok = m_store->move(m_folderA, m_sub, &entry, &error);
    } else if (request == "move-into-self") {
        ok = m_store->move(m_folderA, m_folderA, &entry, &error);
    } else if (request == "move-into-trial") {
        ok = m_store->move(m_folderB, m_trial, &entry, &error);
    } else if (request == "stale-update" || request == "update-unknown") {
        m_store->fetch({m_trial}, QString(), &records, nullptr);
        StoreRecord edited = records[0];
        edited.data = "edited";
        if (request == "stale-update") {
            StoreRecord first = records[0];
            QVERIFY(m_store->update(&first, nullptr)); // someone else saved meanwhile
        } else {
            edited.id = QStringLiteral("nope");
        }
        const QString afterOtherSave = dump(*m_store);
        ok = m_store->update(&edited, &error);
        QCOMPARE(dump(*m_store), afterOtherSave);
        QCOMPARE(int(error.errorCode()), code);
        QVERIFY(!ok);
        return;
    } else if (request == "delete-non-empty") {
        ok = m_store->remove({m_folderB, m_folderA}, QString(), false, nullptr, &error);
    } else if (request == "delete-partly-unknown") {
        ok = m_store->remove({m_trial, QStringLiteral("nope")}, QString(), false, nullptr, &error);
    } else if (request == "delete-wrong-type") {
        ok = m_store->remove({m_trial}, QStringLiteral("Standard"), false, nullptr, &error);
    } else if (request == "delete-root") {
        ok = m_store->remove({m_store->rootFolderId()}, QString(), true, nullptr, &error);
    } else if (request == "copy-unknown") {
        ok = m_store->copy(QStringLiteral("nope"), m_folderB, &entry, &error);
    }
    QVERIFY(!ok);
    QCOMPARE(int(error.errorCode()), code);
    QVERIFY(!error.message().isEmpty());
    QCOMPARE(dump(*m_store), before);
}

void tst_SqliteObjectStore::survivesReopen()
{
    const QString before = dump(*m_store);
    m_store->close();
    SqliteObjectStore again(m_dir.filePath(QStringLiteral("store.db")), SqliteObjectStore::OpenMode::MustExist);
    QVERIFY(again.open());
    QCOMPARE(dump(again), before);
}

QTEST_GUILESS_MAIN(tst_SqliteObjectStore)
#include "tst_sqliteobjectstore.moc"
