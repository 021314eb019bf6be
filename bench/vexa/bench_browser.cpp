// The object browser over real store files:
//  - expanding a folder of 10,000 entries until its first rows are painted, with the
//    longest stretch the GUI thread went without handling events meanwhile, beside the
//    store's own listing of that folder;
//  - copying 1,000 objects from one store into another by a drop, beside the stores' own
//    bulk read and bulk add of the same objects.
//
//   build/bench/vexa/bench_browser --benchmark_min_time=1

#include <vexa/browser/corvidobjectsclientmodel.h>
#include <vexa/browser/objectbrowserwidget.h>

#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>
#include <context/serverid.h>
#include <domain/domainmetatypes.h>
#include <domain/folder.h>
#include <domain/toleranceset.h>
#include <store/objectcodec.h>
#include <store/sqliteobjectstore.h>

#include <benchmark/benchmark.h>

#include <QApplication>
#include <QElapsedTimer>
#include <QEvent>
#include <QMimeData>
#include <QTemporaryDir>
#include <QThread>
#include <QTimer>
#include <QTreeView>

#include <functional>

using namespace vexa;

namespace {

QTemporaryDir &folder()
{
    static QTemporaryDir dir;
    return dir;
}

std::vector<StoreRecord> toleranceSets(int count, const QString &prefix)
{
    std::vector<StoreRecord> records(static_cast<size_t>(count));
    for (int i = 0; i < count; ++i) {
        ToleranceSet set;
        set.setName(QStringLiteral("%1 %2").arg(prefix).arg(i + 1, 5, 10, QLatin1Char('0')));
        ObjectCodec::toRecord(set, &records[size_t(i)], nullptr);
    }
    return records;
}

// A store with one folder "Big" holding count tolerance sets; returns the folder's id.
QString makeStore(const QString &path, int count)
{
    SqliteObjectStore store(path);
    store.open();
    Folder big;
    big.setName(QStringLiteral("Big"));
    std::vector<StoreRecord> folderRecord(1);
    ObjectCodec::toRecord(big, &folderRecord[0], nullptr);
    store.add(&folderRecord, QString(), nullptr);
    std::vector<StoreRecord> sets = toleranceSets(count, QStringLiteral("Set"));
    store.add(&sets, folderRecord[0].id, nullptr);
    return folderRecord[0].id;
}

bool waitFor(const std::function<bool()> &done, int timeoutMs = 60000)
{
    QElapsedTimer clock;
    clock.start();
    while (!done()) {
        if (clock.elapsed() > timeoutMs)
            return false;
        QCoreApplication::processEvents(QEventLoop::AllEvents, 5);
    }
    return true;
}

CommandDispatcher *connected(CorvidModel &model, const QString &path)
{
    CommandDispatcher *dispatcher = model.createCommandDispatcher(ServerId(path.toStdString(), 0));
    waitFor([dispatcher] { return dispatcher->isConnected(); });
    return dispatcher;
}

// The longest time between two turns of the event loop while it runs.
class StallMeter : public QObject
{
public:
    StallMeter()
    {
        m_timer.setInterval(0);
        connect(&m_timer, &QTimer::timeout, this, [this] {
            const qint64 now = m_clock.nsecsElapsed();
            if (m_last >= 0)
                m_longest = std::max(m_longest, now - m_last);
            m_last = now;
        });
    }
    void start()
    {
        m_longest = 0;
        m_last = -1;
        m_clock.start();
        m_timer.start();
    }
    double stop()
    {
        m_timer.stop();
        return double(m_longest) / 1e6;
    }

private:
    QTimer m_timer;
    QElapsedTimer m_clock;
    qint64 m_last = -1;
    qint64 m_longest = 0;
};

// Counts paints of a widget.
class PaintCounter : public QObject
{
public:
    int paints = 0;

protected:
    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (event->type() == QEvent::Paint)
            ++paints;
        return QObject::eventFilter(watched, event);
    }
};

constexpr int kLargeFolder = 10000;

const QString &largeStore(QString *bigId = nullptr)
{
    static QString id;
    static const QString path = [] {
        const QString p = folder().filePath(QStringLiteral("large.vexastore"));
        id = makeStore(p, kLargeFolder);
        return p;
    }();
    if (bigId)
        *bigId = id;
    return path;
}

void BM_ExpandLargeFolder(benchmark::State &state)
{
    QString bigId;
    const QString path = largeStore(&bigId);
    CorvidModel corvid;
    CommandDispatcher *dispatcher = connected(corvid, path);
    double longestStall = 0.0;
    for (auto _ : state) {
        ObjectBrowserWidget browser;
        browser.initialize(&corvid, dispatcher->dispatcherId());
        browser.resize(900, 600);
        browser.show();
        CorvidObjectsClientModel *model = browser.model();
        waitFor([model] { return model->rowCount() == 1; });
        const QModelIndex big = model->index(0, 0);
        PaintCounter painted;
        browser.detailView()->viewport()->installEventFilter(&painted);
        QCoreApplication::processEvents();
        StallMeter meter;
        meter.start();
        QElapsedTimer clock;
        clock.start();
        browser.setCurrentFolder(big);
        int paintsBefore = -1;
        waitFor([&] {
            if (paintsBefore < 0 && browser.detailModel()->rowCount(browser.detailView()->rootIndex()) > 0)
                paintsBefore = painted.paints;
            return paintsBefore >= 0 && painted.paints > paintsBefore;
        });
        state.SetIterationTime(double(clock.nsecsElapsed()) / 1e9);
        longestStall = std::max(longestStall, meter.stop());
        if (model->rowCount(big) != kLargeFolder)
            state.SkipWithError("the folder did not list all entries");
    }
    state.counters["longest_gui_stall_ms"] = longestStall;
    state.counters["rows"] = kLargeFolder;
}

// The store's own listing of the folder, with the entries made as the dispatcher makes them.
void BM_ListLargeFolderRaw(benchmark::State &state)
{
    QString bigId;
    const QString path = largeStore(&bigId);
    SqliteObjectStore store(path);
    store.open();
    for (auto _ : state) {
        std::vector<StoreRecord> records;
        store.listEntries(bigId, {}, &records, nullptr);
        std::vector<std::shared_ptr<DirEntry>> entries;
        entries.reserve(records.size());
        for (const StoreRecord &record : records)
            entries.push_back(ObjectCodec::toDirEntry(record));
        benchmark::DoNotOptimize(entries.data());
    }
}

constexpr int kCopied = 1000;

const QString &copySource(QString *bigId = nullptr)
{
    static QString id;
    static const QString path = [] {
        const QString p = folder().filePath(QStringLiteral("copy-source.vexastore"));
        id = makeStore(p, kCopied);
        return p;
    }();
    if (bigId)
        *bigId = id;
    return path;
}

void BM_CopyBetweenStores(benchmark::State &state)
{
    const QString sourcePath = copySource();
    CorvidModel corvid;
    CommandDispatcher *source = connected(corvid, sourcePath);
    CorvidObjectsClientModel sourceModel(&corvid, source->dispatcherId());
    sourceModel.fetchMore(QModelIndex());
    waitFor([&] { return sourceModel.rowCount() == 1; });
    const QModelIndex big = sourceModel.index(0, 0);
    sourceModel.fetchMore(big);
    waitFor([&] { return sourceModel.rowCount(big) == kCopied; });
    QModelIndexList rows;
    for (int r = 0; r < kCopied; ++r)
        rows << sourceModel.index(r, 0, big);
    int round = 0;
    double longestStall = 0.0;
    for (auto _ : state) {
        state.PauseTiming();
        const QString targetPath = folder().filePath(QStringLiteral("copy-target-%1.vexastore").arg(++round));
        CommandDispatcher *target = connected(corvid, targetPath);
        CorvidObjectsClientModel targetModel(&corvid, target->dispatcherId());
        targetModel.fetchMore(QModelIndex());
        waitFor([&] { return !targetModel.isLoading(QModelIndex()); });
        std::unique_ptr<QMimeData> data(sourceModel.mimeData(rows));
        state.ResumeTiming();
        StallMeter meter;
        meter.start();
        QElapsedTimer clock;
        clock.start();
        targetModel.dropMimeData(data.get(), Qt::CopyAction, -1, 0, QModelIndex());
        // The top level takes folders only: copy into a folder made for it.
        if (targetModel.rowCount() == 0) {
            state.PauseTiming();
            targetModel.createFolder(QModelIndex());
            waitFor([&] { return targetModel.rowCount() == 1; });
            const QModelIndex into = targetModel.index(0, 0);
            targetModel.fetchMore(into);
            waitFor([&] { return !targetModel.isLoading(into); });
            state.ResumeTiming();
            meter.start();
            clock.restart();
            targetModel.dropMimeData(data.get(), Qt::CopyAction, -1, 0, into);
            waitFor([&] { return targetModel.rowCount(into) == kCopied; });
        }
        state.SetIterationTime(double(clock.nsecsElapsed()) / 1e9);
        longestStall = std::max(longestStall, meter.stop());
    }
    state.counters["longest_gui_stall_ms"] = longestStall;
    state.counters["objects"] = kCopied;
}

// The stores' own work for the same copy: read the 1,000 objects from one store and add
// them to another in one transaction.
void BM_BulkReadAndAddRaw(benchmark::State &state)
{
    QString bigId;
    const QString sourcePath = copySource(&bigId);
    SqliteObjectStore source(sourcePath);
    source.open();
    int round = 0;
    for (auto _ : state) {
        state.PauseTiming();
        SqliteObjectStore target(folder().filePath(QStringLiteral("raw-target-%1.vexastore").arg(++round)));
        target.open();
        state.ResumeTiming();
        std::vector<StoreRecord> records;
        source.fetchChildren(bigId, QString(), &records, nullptr);
        for (StoreRecord &record : records)
            record.parentId.clear();
        target.add(&records, QString(), nullptr);
        benchmark::DoNotOptimize(records.data());
    }
}

} // namespace

BENCHMARK(BM_ExpandLargeFolder)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(5);
BENCHMARK(BM_ListLargeFolderRaw)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_CopyBetweenStores)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(3);
BENCHMARK(BM_BulkReadAndAddRaw)->Unit(benchmark::kMillisecond)->Iterations(3);

int main(int argc, char **argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    registerDomainMetaTypes();
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 1;
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
