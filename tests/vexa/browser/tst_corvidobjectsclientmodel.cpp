#include "browserfixtures.h"

#include <vexa/browser/corvidobjectsclientmodel.h>
#include <vexa/browser/objectbrowsertreeitem.h>
#include <vexa/browser/selectedpath.h>

#include <context/getdirentries.h>
#include <context/progressmodel.h>
#include <context/response.h>
#include <domain/domainmetatypes.h>
#include <domain/globaldirentry.h>
#include <store/errorinfo.h>
#include <utilities/logger.h>

#include <QAbstractItemModelTester>
#include <QIdentityProxyModel>
#include <QElapsedTimer>
#include <QMimeData>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;
using namespace browserfixtures;

namespace {

// Collects the application log.
class LogSink : public LogInterface
{
public:
    LogSink() { Logger::instance().registerLogger(this); }
    ~LogSink() override { Logger::instance().unregisterLogger(this); }
    void log(LogLevel, LogCategory, const QString &message) override { lines << message; }
    QStringList lines;
};

// The model with its protected answer handler in reach.
class ClientModel : public CorvidObjectsClientModel
{
public:
    using CorvidObjectsClientModel::CorvidObjectsClientModel;
    using CorvidObjectsClientModel::dirEntriesLoaded;
};

QStringList names(const QAbstractItemModel &model, const QModelIndex &parent = QModelIndex())
{
    QStringList result;
    for (int row = 0; row < model.rowCount(parent); ++row)
        result << model.index(row, 0, parent).data().toString();
    return result;
}

QModelIndex child(const QAbstractItemModel &model, const QString &name, const QModelIndex &parent = QModelIndex())
{
    for (int row = 0; row < model.rowCount(parent); ++row) {
        const QModelIndex index = model.index(row, 0, parent);
        if (index.data().toString() == name)
            return index;
    }
    return QModelIndex();
}

} // namespace

// The client model over real store files: the tree loads lazily from the store, and every
// change (new folder, rename, delete, move, copy) reaches the tree only through the store.
class tst_CorvidObjectsClientModel : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();

    void foldersLoadWhenOpened();
    void topLevelListsFoldersOnly_data();
    void topLevelListsFoldersOnly();
    void answerOfAnotherCommandChangesNothing();
    void newFolderArrivesFromTheStore();
    void renameIsStored();
    void badNamesAreRefused_data();
    void badNamesAreRefused();
    void deleteRemovesRowsAndNonEmptyFolderIsRefused();
    void dropMovesWithinTheStore();
    void dropCopiesWithinTheStore();
    void refusedDrops_data();
    void refusedDrops();
    void moveFromAnotherStoreIsRefused();
    void copyFromAnotherStoreAsksForReferences_data();
    void copyFromAnotherStoreAsksForReferences();
    void connectionWaitEndsWithItsText();
    void withoutCorvidModelRequestsThrow();
    void removeRowsRemovesSubfoldersFirst();
    void flagsAndHeader();

private:
    QModelIndex loaded(const QModelIndex &folder);

    QTemporaryDir m_dir;
    LabStore m_lab;
    std::unique_ptr<CorvidModel> m_corvid;
    std::unique_ptr<ClientModel> m_model;
    std::unique_ptr<EmptyAreaDropFlagOnly> m_proxy;
    std::unique_ptr<QAbstractItemModelTester> m_tester;
    int m_round = 0;
};

void tst_CorvidObjectsClientModel::initTestCase()
{
    QVERIFY(m_dir.isValid());
    registerDomainMetaTypes();
}

void tst_CorvidObjectsClientModel::init()
{
    m_lab = makeLabStore(m_dir.filePath(QStringLiteral("lab%1.vexastore").arg(++m_round)));
    m_corvid = std::make_unique<CorvidModel>();
    CommandDispatcher *dispatcher = browserfixtures::connect(*m_corvid, m_lab.path);
    m_corvid->setDefaultDispatcherId(dispatcher->dispatcherId());
    m_model = std::make_unique<ClientModel>(m_corvid.get(), dispatcher->dispatcherId());
    m_model->setColumns({CorvidObjectsClientModel::NameColumn, CorvidObjectsClientModel::TypeColumn,
                         CorvidObjectsClientModel::CreatedColumn});
    m_proxy = std::make_unique<EmptyAreaDropFlagOnly>();
    m_proxy->setSourceModel(m_model.get());
    m_tester = std::make_unique<QAbstractItemModelTester>(m_proxy.get(),
                                                          QAbstractItemModelTester::FailureReportingMode::QtTest);
}

void tst_CorvidObjectsClientModel::cleanup()
{
    m_tester.reset();
    m_proxy.reset();
    m_model.reset();
    m_corvid.reset();
}

// Opens a folder (the top for an invalid index) and waits for its entries.
QModelIndex tst_CorvidObjectsClientModel::loaded(const QModelIndex &folder)
{
    if (m_model->canFetchMore(folder))
        m_model->fetchMore(folder);
    if (!QTest::qWaitFor([&] { return !m_model->isLoading(folder); }, 5000))
        qWarning("folder did not load");
    return folder;
}

void tst_CorvidObjectsClientModel::foldersLoadWhenOpened()
{
    QVERIFY(m_model->hasChildren());
    loaded(QModelIndex());
    QCOMPARE(names(*m_model), (QStringList{"Standards", "Tolerance Sets", "Archive", "Empty"}));
    QVERIFY(!m_model->canFetchMore(QModelIndex()));

    const QModelIndex archive = child(*m_model, "Archive");
    QVERIFY(m_model->hasChildren(archive));
    loaded(archive);
    QVERIFY(!m_model->canFetchMore(archive));
    const QModelIndex old = child(*m_model, "Old", archive);
    QVERIFY(old.isValid());
    QCOMPARE(old.parent(), archive);
    loaded(old);
    const QModelIndex archived = child(*m_model, "Archived", old);
    QCOMPARE(archived.siblingAtColumn(1).data().toString(), QStringLiteral("Tolerance set"));
    QVERIFY(!m_model->hasChildren(archived));
    QVERIFY(!m_model->canFetchMore(archived));

    // The row carries its entry with store and path.
    const auto entry = archived.data(CorvidObjectsClientModel::GlobalDirEntryRole).value<std::shared_ptr<GlobalDirEntry>>();
    QVERIFY(entry);
    QCOMPARE(entry->entryObjectId(), m_lab.ids["Archived"]);
    QCOMPARE(entry->path(), (QStringList{m_lab.ids["Archive"], m_lab.ids["Old"]}));
    QCOMPARE(entry->stringPath(), (QStringList{"Archive", "Old"}));
    QCOMPARE(entry->dispatcherID().toStdString(), m_model->defaultDispatcherId());
    QCOMPARE(m_model->selectedPath(old)->pathToString(), QStringLiteral("/Archive/Old"));

    // Marked for reloading, a folder lists its entries once more, not twice.
    m_model->reload(archive);
    QTRY_COMPARE(names(*m_model, archive), QStringList{"Old"});
}

void tst_CorvidObjectsClientModel::topLevelListsFoldersOnly_data()
{
    QTest::addColumn<std::vector<std::string>>("filter");
    QTest::addColumn<QStringList>("inStandards");
    QTest::newRow("no filter") << std::vector<std::string>{} << QStringList{"Silver", "Blue"};
    QTest::newRow("tolerance sets") << std::vector<std::string>{"ToleranceSet"} << QStringList{};
    QTest::newRow("standards") << std::vector<std::string>{"Standard"} << QStringList{"Silver", "Blue"};
}

void tst_CorvidObjectsClientModel::topLevelListsFoldersOnly()
{
    QFETCH(std::vector<std::string>, filter);
    QFETCH(QStringList, inStandards);
    {
        // A tolerance set at the top level is never listed there.
        SqliteObjectStore store(m_lab.path);
        QVERIFY(store.open());
        add(store, {named<ToleranceSet>("Loose at the top")});
    }
    m_model->setTypeFilter(filter);
    loaded(QModelIndex());
    QCOMPARE(names(*m_model), (QStringList{"Standards", "Tolerance Sets", "Archive", "Empty"}));
    const QModelIndex standards = loaded(child(*m_model, "Standards"));
    QCOMPARE(names(*m_model, standards), inStandards);
}

void tst_CorvidObjectsClientModel::answerOfAnotherCommandChangesNothing()
{
    loaded(QModelIndex());
    LogSink log;
    QSignalSpy inserted(m_model.get(), &QAbstractItemModel::rowsInserted);
    auto foreign = std::make_shared<Response>(std::make_shared<GetDirEntries>());
    foreign->command()->setCommandId("c-42");
    m_model->dirEntriesLoaded(foreign); // a plain answer, not a listing
    QCOMPARE(inserted.count(), 0);
    QCOMPARE(m_model->rowCount(), 4);
    QVERIFY(log.lines.filter("CorvidObjectsClientModel::dirEntriesLoaded fail").filter("c-42").size() == 1);
}

void tst_CorvidObjectsClientModel::newFolderArrivesFromTheStore()
{
    loaded(QModelIndex());
    const QModelIndex empty = loaded(child(*m_model, "Empty"));
    QSignalSpy created(m_model.get(), &CorvidObjectsClientModel::sgNewFolderCreated);
    m_model->createFolder(empty);
    QCOMPARE(m_model->rowCount(empty), 0); // nothing before the store answers
    QVERIFY(created.wait(5000));
    QCOMPARE(names(*m_model, empty), QStringList{"Untitled folder"});
    const auto path = created.front().front().value<std::shared_ptr<SelectedPath>>();
    QVERIFY(path);
    QCOMPARE(path->path().size(), 2);
    QCOMPARE(path->path().front(), m_lab.ids["Empty"]);
    QCOMPARE(path->pathToString(), QStringLiteral("/Empty/Untitled folder"));
    QVERIFY(m_model->hasChildren(m_model->index(0, 0, empty)));
}

void tst_CorvidObjectsClientModel::renameIsStored()
{
    loaded(QModelIndex());
    const QModelIndex sets = loaded(child(*m_model, "Tolerance Sets"));
    const QModelIndex silver = child(*m_model, "Silver tolerances", sets);
    QSignalSpy changed(m_model.get(), &QAbstractItemModel::dataChanged);
    QVERIFY(m_model->setData(silver, QStringLiteral("  Silver tolerances 2024 "), Qt::EditRole));
    QVERIFY(changed.wait(5000));
    QCOMPARE(silver.data().toString(), QStringLiteral("Silver tolerances 2024"));
    QCOMPARE(silver.siblingAtColumn(0).data(CorvidObjectsClientModel::ObjectIdRole).toString(),
             m_lab.ids["Silver tolerances"]);
    cleanup();
    SqliteObjectStore store(m_lab.path);
    QVERIFY(store.open());
    std::vector<StoreRecord> records;
    QVERIFY(store.fetch({m_lab.ids["Silver tolerances"]}, QString(), &records, nullptr));
    QCOMPARE(records.front().name, QStringLiteral("Silver tolerances 2024"));
    QCOMPARE(records.front().version, 2);
}

void tst_CorvidObjectsClientModel::badNamesAreRefused_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("message");
    QTest::newRow("empty") << QString() << QStringLiteral("A name cannot be empty.");
    QTest::newRow("blanks") << QStringLiteral("   ") << QStringLiteral("A name cannot be empty.");
    QTest::newRow("500 characters") << QString(500, QLatin1Char('x'))
                                    << QStringLiteral("A name can have at most 255 characters; this one has 500.");
}

void tst_CorvidObjectsClientModel::badNamesAreRefused()
{
    QFETCH(QString, name);
    QFETCH(QString, message);
    loaded(QModelIndex());
    const QModelIndex standards = child(*m_model, "Standards");
    QSignalSpy errors(m_model.get(), &CorvidObjectsClientModel::sgGeneralError);
    QVERIFY(!m_model->setData(standards, name, Qt::EditRole));
    QCOMPARE(errors.count(), 1);
    QCOMPARE(errors.front().front().toString(), message);
    QTest::qWait(50);
    QCOMPARE(standards.data().toString(), QStringLiteral("Standards"));
}

void tst_CorvidObjectsClientModel::deleteRemovesRowsAndNonEmptyFolderIsRefused()
{
    loaded(QModelIndex());
    const QModelIndex sets = loaded(child(*m_model, "Tolerance Sets"));
    QPersistentModelIndex archive = child(*m_model, "Archive");
    ProgressModel *progress = m_corvid->progressModel();

    QSignalSpy refused(m_model.get(), &CorvidObjectsClientModel::sgObjectDeletionError);
    const std::string refusedId = m_model->deleteObjects({archive}, nullptr);
    QCOMPARE(progress->progress(refusedId)->progressTitle(), QStringLiteral("Deleting"));
    QVERIFY(refused.wait(5000));
    QCOMPARE(refused.front().at(1).value<std::string>(), refusedId);
    const auto error = refused.front().at(2).value<std::shared_ptr<ErrorInfo>>();
    QCOMPARE(error->errorCode(), CorvidErrorCode::FolderNotEmpty);
    QVERIFY(archive.isValid()); // nothing lost
    QVERIFY(!progress->progress(refusedId));

    QSignalSpy deleted(m_model.get(), &CorvidObjectsClientModel::sgObjectDeleted);
    QWidget source;
    const QModelIndex blue = child(*m_model, "Blue tolerances", sets);
    const QModelIndex silver = child(*m_model, "Silver tolerances", sets);
    const std::string commandId = m_model->deleteObjects({blue, silver, blue.siblingAtColumn(1)}, &source);
    QTRY_COMPARE(deleted.count(), 2);
    QCOMPARE(deleted.front().at(0).value<QWidget *>(), &source);
    QCOMPARE(deleted.front().at(1).value<std::string>(), commandId);
    QCOMPARE(m_model->rowCount(sets), 0);
    QVERIFY(!progress->progress(commandId));
}

void tst_CorvidObjectsClientModel::dropMovesWithinTheStore()
{
    loaded(QModelIndex());
    const QModelIndex sets = loaded(child(*m_model, "Tolerance Sets"));
    const QModelIndex archive = loaded(child(*m_model, "Archive"));
    const QModelIndex blue = child(*m_model, "Blue tolerances", sets);
    std::unique_ptr<QMimeData> data(m_model->mimeData({blue, blue.siblingAtColumn(1)}));
    QSignalSpy moved(m_model.get(), &QAbstractItemModel::rowsMoved);
    QVERIFY(m_model->dropMimeData(data.get(), Qt::MoveAction, -1, 0, archive));
    QVERIFY(moved.wait(5000));
    QCOMPARE(names(*m_model, sets), QStringList{"Silver tolerances"});
    QCOMPARE(names(*m_model, archive), (QStringList{"Old", "Blue tolerances"}));

    // The store agrees (it lists in the order the objects were made).
    m_tester.reset();
    m_proxy.reset();
    m_model = std::make_unique<ClientModel>(m_corvid.get(), m_corvid->defaultDispatcherId());
    loaded(QModelIndex());
    QCOMPARE(names(*m_model, loaded(child(*m_model, "Archive"))), (QStringList{"Blue tolerances", "Old"}));
}

void tst_CorvidObjectsClientModel::dropCopiesWithinTheStore()
{
    loaded(QModelIndex());
    const QModelIndex standards = loaded(child(*m_model, "Standards"));
    const QModelIndex empty = loaded(child(*m_model, "Empty"));
    std::unique_ptr<QMimeData> data(m_model->mimeData({child(*m_model, "Silver", standards)}));
    QVERIFY(m_model->dropMimeData(data.get(), Qt::CopyAction, 7, 0, empty)); // a row past the end appends
    QTRY_COMPARE(names(*m_model, empty), QStringList{"Silver"});
    QVERIFY(m_model->index(0, 0, empty).data(CorvidObjectsClientModel::ObjectIdRole).toString() != m_lab.ids["Silver"]);
    QCOMPARE(names(*m_model, standards), (QStringList{"Silver", "Blue"}));
}

void tst_CorvidObjectsClientModel::refusedDrops_data()
{
    QTest::addColumn<QString>("dragged");
    QTest::addColumn<QString>("target"); // empty: the empty area
    QTest::addColumn<int>("column");
    QTest::addColumn<QString>("message");
    QTest::newRow("object on the empty area") << "Blue tolerances" << QString() << 0 << QString();
    QTest::newRow("on a leaf") << "Blue tolerances" << "Silver tolerances" << 0
                               << "Objects can only be dropped into a folder.";
    QTest::newRow("column 2") << "Blue tolerances" << "Archive" << 2 << QString();
}

void tst_CorvidObjectsClientModel::refusedDrops()
{
    QFETCH(QString, dragged);
    QFETCH(QString, target);
    QFETCH(int, column);
    QFETCH(QString, message);
    loaded(QModelIndex());
    const QModelIndex sets = loaded(child(*m_model, "Tolerance Sets"));
    std::unique_ptr<QMimeData> data(m_model->mimeData({child(*m_model, dragged, sets)}));
    QModelIndex parent;
    if (!target.isEmpty())
        parent = child(*m_model, target).isValid() ? child(*m_model, target) : child(*m_model, target, sets);
    QSignalSpy errors(m_model.get(), &CorvidObjectsClientModel::sgGeneralError);
    QSignalSpy changes(m_model.get(), &QAbstractItemModel::rowsAboutToBeRemoved);
    QVERIFY(!m_model->dropMimeData(data.get(), Qt::MoveAction, -1, column, parent));
    QTest::qWait(100);
    QCOMPARE(changes.count(), 0);
    QCOMPARE(errors.isEmpty(), message.isEmpty());
    if (!message.isEmpty())
        QCOMPARE(errors.front().front().toString(), message);
    QVERIFY(!m_model->dropMimeData(nullptr, Qt::MoveAction, -1, 0, QModelIndex()));
}

void tst_CorvidObjectsClientModel::moveFromAnotherStoreIsRefused()
{
    LabStore other = makeLabStore(m_dir.filePath("other-move.vexastore"));
    browserfixtures::connect(*m_corvid, other.path);
    CorvidObjectsClientModel source(m_corvid.get(), other.path.toStdString());
    QSignalSpy sourceLoaded(&source, &CorvidObjectsClientModel::sgFolderLoaded);
    source.fetchMore(QModelIndex());
    QVERIFY(sourceLoaded.wait(5000));
    const QModelIndex otherSets = child(source, "Tolerance Sets");
    source.fetchMore(otherSets);
    QVERIFY(sourceLoaded.wait(5000));
    std::unique_ptr<QMimeData> data(source.mimeData({child(source, "Blue tolerances", otherSets)}));

    loaded(QModelIndex());
    const QModelIndex empty = loaded(child(*m_model, "Empty"));
    QSignalSpy errors(m_model.get(), &CorvidObjectsClientModel::sgGeneralError);
    QVERIFY(!m_model->dropMimeData(data.get(), Qt::MoveAction, -1, 0, empty));
    QCOMPARE(errors.count(), 1);
    QCOMPARE(errors.front().front().toString(), QStringLiteral("Moving objects from a different database is not allowed"));
    QTest::qWait(100);
    QCOMPARE(m_model->rowCount(empty), 0);
    QCOMPARE(source.rowCount(otherSets), 2);
}

void tst_CorvidObjectsClientModel::copyFromAnotherStoreAsksForReferences_data()
{
    QTest::addColumn<QString>("dragged");
    QTest::addColumn<bool>("asks");
    QTest::addColumn<int>("answer");
    QTest::addColumn<QStringList>("copied");
    QTest::newRow("no references") << "Blue" << false << int(QMessageBox::Ok) << QStringList{"Blue"};
    QTest::newRow("references, OK") << "Silver" << true << int(QMessageBox::Ok)
                                    << QStringList{"Silver", "Silver tolerances"};
    QTest::newRow("references, Cancel") << "Silver" << true << int(QMessageBox::Cancel) << QStringList{};
}

void tst_CorvidObjectsClientModel::copyFromAnotherStoreAsksForReferences()
{
    QFETCH(QString, dragged);
    QFETCH(bool, asks);
    QFETCH(int, answer);
    QFETCH(QStringList, copied);
    LabStore other = makeLabStore(m_dir.filePath(QStringLiteral("other-copy%1.vexastore").arg(m_round)));
    browserfixtures::connect(*m_corvid, other.path);
    CorvidObjectsClientModel source(m_corvid.get(), other.path.toStdString());
    QSignalSpy sourceLoaded(&source, &CorvidObjectsClientModel::sgFolderLoaded);
    source.fetchMore(QModelIndex());
    QVERIFY(sourceLoaded.wait(5000));
    const QModelIndex otherStandards = child(source, "Standards");
    source.fetchMore(otherStandards);
    QVERIFY(sourceLoaded.wait(5000));
    std::unique_ptr<QMimeData> data(source.mimeData({child(source, dragged, otherStandards)}));

    loaded(QModelIndex());
    const QModelIndex empty = loaded(child(*m_model, "Empty"));
    ProgressModel *progress = m_corvid->progressModel();
    std::vector<double> copyProgress;
    QObject::connect(progress, &ProgressModel::sgProgressChanged, this, [&] {
        for (const auto &task : progress->progressListeners()) {
            if (task->progressTitle() == QLatin1String("Copy"))
                copyProgress.push_back(task->value());
        }
    });
    const auto box = answerNextMessageBox(QMessageBox::StandardButton(answer));
    QVERIFY(m_model->dropMimeData(data.get(), Qt::CopyAction, -1, 0, empty));
    QTRY_VERIFY(progress->progressListeners().empty());
    QTest::qWait(100);
    QCOMPARE(box->seen, asks);
    if (asks) {
        QCOMPARE(box->title, QStringLiteral("Copy items"));
        QCOMPARE(box->text, QStringLiteral("Referenced objects found.\nContinue copying?"));
        QCOMPARE(box->icon, QMessageBox::Information);
        QCOMPARE(box->defaultButton, QMessageBox::Ok);
    }
    QCOMPARE(names(*m_model, empty), copied);
    // The loading runs from 0.02 to 0.6 of the task.
    QVERIFY(!copyProgress.empty());
    QCOMPARE(copyProgress.front(), 0.0);
    for (double value : copyProgress)
        QVERIFY(value >= 0.0 && value <= 1.0);
    QVERIFY(std::find(copyProgress.begin(), copyProgress.end(), 0.6) != copyProgress.end());
    if (!copied.isEmpty()) {
        // The copies keep their ids: a reference still finds its tolerance set.
        QCOMPARE(m_model->index(0, 0, empty).data(CorvidObjectsClientModel::ObjectIdRole).toString(), other.ids[dragged]);
    }
}

void tst_CorvidObjectsClientModel::connectionWaitEndsWithItsText()
{
    // A store whose folder is gone never connects.
    const QString path = m_dir.filePath("gone/vanished.vexastore");
    CommandDispatcher *refusing = m_corvid->createCommandDispatcher(ServerId(path.toStdString(), 0));
    QTRY_COMPARE(refusing->connectionState(), CommandDispatcher::ConnectionState::Failed);
    CorvidObjectsClientModel model(m_corvid.get(), refusing->dispatcherId());
    QSignalSpy errors(&model, &CorvidObjectsClientModel::sgGeneralError);
    QElapsedTimer clock;
    clock.start();
    model.fetchMore(QModelIndex()); // loading catches the failure and reports it
    const qint64 waited = clock.elapsed();
    QVERIFY2(waited >= 1000 && waited < 3000, qPrintable(QString::number(waited)));
    QCOMPARE(errors.count(), 1);
    QCOMPARE(errors.front().front().toString(),
             QStringLiteral("No connection to server available! \n(") + QString::fromStdString(refusing->dispatcherId())
                 + QLatin1Char(')'));
    QCOMPARE(model.rowCount(), 0);
    // Requests that are not loads throw the same text.
    try {
        model.createFolder(QModelIndex());
        QFAIL("no exception");
    } catch (const std::logic_error &e) {
        QVERIFY(QString::fromUtf8(e.what()).startsWith(QStringLiteral("No connection to server available! \n(")));
    }
}

void tst_CorvidObjectsClientModel::withoutCorvidModelRequestsThrow()
{
    CorvidObjectsClientModel model(nullptr);
    model.fetchMore(QModelIndex()); // nothing to load from, nothing happens
    QCOMPARE(model.rowCount(), 0);
    try {
        model.createFolder(QModelIndex());
        QFAIL("no exception");
    } catch (const std::logic_error &e) {
        QCOMPARE(QString::fromUtf8(e.what()), QStringLiteral("No Corvid model set"));
    }
}

void tst_CorvidObjectsClientModel::removeRowsRemovesSubfoldersFirst()
{
    loaded(QModelIndex());
    const QModelIndex archive = loaded(child(*m_model, "Archive"));
    loaded(child(*m_model, "Old", archive));
    QVERIFY(m_model->removeRows(0, 0, QModelIndex()));
    QCOMPARE(m_model->rowCount(), 4);
    QStringList order;
    QObject::connect(m_model.get(), &QAbstractItemModel::rowsAboutToBeRemoved, this,
                     [&](const QModelIndex &parent, int first) { order << m_model->index(first, 0, parent).data().toString(); });
    QVERIFY(m_model->removeRows(2, 1, QModelIndex()));
    QCOMPARE(order, (QStringList{"Archived", "Old", "Archive"}));
    QCOMPARE(names(*m_model), (QStringList{"Standards", "Tolerance Sets", "Empty"}));
}

void tst_CorvidObjectsClientModel::flagsAndHeader()
{
    loaded(QModelIndex());
    const QModelIndex standards = child(*m_model, "Standards");
    QCOMPARE(m_model->flags(QModelIndex()) & (Qt::ItemIsDropEnabled | Qt::ItemIsEnabled),
             Qt::ItemIsDropEnabled | Qt::ItemIsEnabled);
    const Qt::ItemFlags first = m_model->flags(standards);
    for (Qt::ItemFlag flag : {Qt::ItemIsSelectable, Qt::ItemIsEditable, Qt::ItemIsDragEnabled, Qt::ItemIsDropEnabled})
        QVERIFY(first & flag);
    QVERIFY(!(m_model->flags(standards.siblingAtColumn(1)) & Qt::ItemIsSelectable));
    QCOMPARE(m_model->headerData(0, Qt::Horizontal).toString(), QStringLiteral("Name"));
    const QSize hint = m_model->headerData(1, Qt::Horizontal, Qt::SizeHintRole).toSize();
    QCOMPARE(hint.width(), 100); // short titles get the minimum width
    QVERIFY(hint.height() > 14);
    CorvidObjectsClientModel single(m_corvid.get());
    QCOMPARE(single.columnCount(), 1);
}

QTEST_MAIN(tst_CorvidObjectsClientModel)
#include "tst_corvidobjectsclientmodel.moc"
