// Inserting and listing 10,000 objects through the store, beside raw SQLite
// doing the same inserts (one transaction, prepared statements, same pragmas).
#include <store/sqliteobjectstore.h>

#include <benchmark/benchmark.h>
#include <sqlite3.h>

#include <QCoreApplication>
#include <QTemporaryDir>

using namespace vexa;

namespace {

const int Count = 10000;
const QByteArray Payload(2048, 'x'); // about the size of a trial's stored form

std::vector<StoreRecord> records()
{
    std::vector<StoreRecord> result(Count);
    for (int i = 0; i < Count; ++i) {
        result[size_t(i)].type = QStringLiteral("Trial");
        result[size_t(i)].name = QStringLiteral("Trial %1").arg(i);
        result[size_t(i)].header = "{\"name\":\"Trial\"}";
        result[size_t(i)].data = Payload;
    }
    return result;
}

void StoreInsert10k(benchmark::State &state)
{
    for (auto _ : state) {
        state.PauseTiming();
        QTemporaryDir dir;
        SqliteObjectStore store(dir.filePath(QStringLiteral("b.db")));
        store.open();
        auto batch = records();
        state.ResumeTiming();
        store.add(&batch, QString(), nullptr);
    }
    state.SetItemsProcessed(state.iterations() * Count);
}

void StoreList10k(benchmark::State &state)
{
    QTemporaryDir dir;
    SqliteObjectStore store(dir.filePath(QStringLiteral("b.db")));
    store.open();
    auto batch = records();
    store.add(&batch, QString(), nullptr);
    for (auto _ : state) {
        std::vector<StoreRecord> entries;
        store.listEntries(QString(), {}, &entries, nullptr);
        benchmark::DoNotOptimize(entries.data());
    }
    state.SetItemsProcessed(state.iterations() * Count);
}

void RawSqliteInsert10k(benchmark::State &state)
{
    for (auto _ : state) {
        state.PauseTiming();
        QTemporaryDir dir;
        sqlite3 *db = nullptr;
        sqlite3_open(dir.filePath(QStringLiteral("raw.db")).toUtf8().constData(), &db);
        sqlite3_exec(db, "PRAGMA journal_mode=WAL; PRAGMA synchronous=FULL;"
                         "CREATE TABLE entries (seq INTEGER PRIMARY KEY, id TEXT NOT NULL UNIQUE, uuid TEXT,"
                         " type TEXT, parent_id TEXT, name TEXT, header BLOB, version INTEGER);"
                         "CREATE INDEX entries_parent ON entries (parent_id, seq);"
                         "CREATE TABLE objects (id TEXT PRIMARY KEY, data BLOB) WITHOUT ROWID;",
                     nullptr, nullptr, nullptr);
        std::vector<std::string> ids;
        for (int i = 0; i < Count; ++i)
            ids.push_back("00000000-0000-4000-8000-" + std::to_string(100000000000LL + i));
        state.ResumeTiming();
        sqlite3_stmt *entry = nullptr;
        sqlite3_stmt *object = nullptr;
        sqlite3_exec(db, "BEGIN", nullptr, nullptr, nullptr);
        sqlite3_prepare_v2(db, "INSERT INTO entries (id, uuid, type, parent_id, name, header, version)"
                               " VALUES (?, ?, 'Trial', 'root', 'Trial', '{}', 1)", -1, &entry, nullptr);
        sqlite3_prepare_v2(db, "INSERT INTO objects (id, data) VALUES (?, ?)", -1, &object, nullptr);
        for (const std::string &id : ids) {
            sqlite3_bind_text(entry, 1, id.c_str(), -1, SQLITE_STATIC);
            sqlite3_bind_text(entry, 2, id.c_str(), -1, SQLITE_STATIC);
            sqlite3_step(entry);
            sqlite3_reset(entry);
            sqlite3_bind_text(object, 1, id.c_str(), -1, SQLITE_STATIC);
            sqlite3_bind_blob(object, 2, Payload.constData(), Payload.size(), SQLITE_STATIC);
            sqlite3_step(object);
            sqlite3_reset(object);
        }
        sqlite3_exec(db, "COMMIT", nullptr, nullptr, nullptr);
        sqlite3_finalize(entry);
        sqlite3_finalize(object);
        state.PauseTiming();
        sqlite3_close(db);
        state.ResumeTiming();
    }
    state.SetItemsProcessed(state.iterations() * Count);
}

} // namespace

BENCHMARK(StoreInsert10k)->Unit(benchmark::kMillisecond);
BENCHMARK(StoreList10k)->Unit(benchmark::kMillisecond);
BENCHMARK(RawSqliteInsert10k)->Unit(benchmark::kMillisecond);

int main(int argc, char **argv)
{
    QCoreApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
