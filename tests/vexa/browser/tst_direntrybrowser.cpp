#include "browserfixtures.h"

#include <vexa/browser/direntrybrowserinterface.h>
#include <vexa/browser/direntrybrowserwidget.h>
#include <vexa/browser/direntrypersistancemanager.h>
#include <vexa/browser/direntrytreemodel.h>
#include <vexa/browser/direntrytreeview.h>

#include <context/addobject.h>
#include <context/getcorvidobject.h>
#include <context/getcorvidobjectresponse.h>
#include <context/progress.h>
#include <context/progressmodel.h>
#include <domain/domainmetatypes.h>
#include <domain/globaldirentry.h>
#include <store/errorinfo.h>

#include <QLabel>
#include <QLayout>
#include <QMenu>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QToolButton>
#include <QtTest>

using namespace vexa;
using namespace browserfixtures;
using Node = BaseObjectTreeModel::Node;
using DirEntryNode = DirEntryTreeModel::DirEntryNode;

namespace {

// The manager with its answer handlers in reach, for answers a real store never gives.
class Manager : public DirEntryPersistanceManager
{
public:
    using DirEntryPersistanceManager::DirEntryPersistanceManager;
    using DirEntryPersistanceManager::onDirEntryLoaded;
    using DirEntryPersistanceManager::onObjectLoaded;
    using DirEntryPersistanceManager::onObjectLoadedForDuplication;
    using DirEntryPersistanceManager::onObjectStoreProgress;
    using DirEntryPersistanceManager::onObjectUpdatedError;
    using DirEntryPersistanceManager::setObjectLoading;
};

std::shared_ptr<GlobalDirEntry> entryOf(const LabStore &lab, const QString &name, const QString &type,
                                        const QString &folder, const std::string &dispatcherId)
{
    auto entry = std::make_shared<GlobalDirEntry>();
    entry->setEntryObjectId(lab.ids.at(name));
    entry->setEntryObjectType(type);
    entry->header().setName(name);
    entry->setDispatcherID(QString::fromStdString(dispatcherId));
    entry->setPath({lab.ids.at(folder)});
    entry->setStringPath({folder});
    return entry;
}

} // namespace

// The folder tree of edited objects over a real store: the life cycle of an object
// (loading, loaded, modified, saving, saved or failed), the error texts, the progress
// arithmetic, duplicates and the questions of the close and save actions.
class tst_DirEntryBrowser : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();

    void objectLifeCycle();
    void staleVersionKeepsTheEdit();
    void nullAnswersHaveTextsOfTheirOwn_data();
    void nullAnswersHaveTextsOfTheirOwn();
    void updateErrorGoesToBothSignals();
    void storeProgressIsScaled_data();
    void storeProgressIsScaled();
    void duplicateIsNamedCopy();
    void newObjectIsStoredInItsFolder();
    void closeAsksToSave_data();
    void closeAsksToSave();
    void closeAllAsksOnceAndSaves();
    void menusAndParts();
    void renameRefusesBadNames();
    void vanishedStoreKeepsTheObject();

private:
    DirEntryNode *openLoaded(const QString &name, const QString &type, const QString &folder);

    QTemporaryDir m_dir;
    LabStore m_lab;
    int m_round = 0;
    std::unique_ptr<CorvidModel> m_corvid;
    std::string m_dispatcherId;
    std::shared_ptr<Manager> m_manager;
    std::unique_ptr<DirEntryTreeModel> m_model;
    std::unique_ptr<ModelTester> m_tester;
    std::unique_ptr<DirEntryBrowserInterface> m_interface;
    std::unique_ptr<DirEntryBrowserWidget> m_widget;
};

void tst_DirEntryBrowser::initTestCase()
{
    QVERIFY(m_dir.isValid());
    registerDomainMetaTypes();
}

void tst_DirEntryBrowser::init()
{
    m_lab = makeLabStore(m_dir.filePath(QStringLiteral("edit%1.vexastore").arg(++m_round)));
    m_corvid = std::make_unique<CorvidModel>();
    m_dispatcherId = browserfixtures::connect(*m_corvid, m_lab.path)->dispatcherId();
    m_corvid->setDefaultDispatcherId(m_dispatcherId);
    m_manager = std::make_shared<Manager>(*m_corvid);
    m_model = std::make_unique<DirEntryTreeModel>();
    m_model->setPersistanceInferface(m_manager);
    m_model->initialize();
    m_tester = std::make_unique<ModelTester>(m_model.get());
    m_interface = std::make_unique<DirEntryBrowserInterface>(QStringLiteral("Tolerance set"), "ToleranceSet");
    m_widget = std::make_unique<DirEntryBrowserWidget>();
    m_widget->initialize(m_model.get(), m_interface.get());
}

void tst_DirEntryBrowser::cleanup()
{
    m_widget.reset();
    m_tester.reset();
    m_model.reset();
    m_manager.reset();
    m_corvid.reset();
}

DirEntryNode *tst_DirEntryBrowser::openLoaded(const QString &name, const QString &type, const QString &folder)
{
    DirEntryNode *node = m_widget->openDirEntry(entryOf(m_lab, name, type, folder, m_dispatcherId));
    if (!QTest::qWaitFor([node] { return node->isLoaded(); }, 5000))
        qWarning("object did not load");
    return node;
}

void tst_DirEntryBrowser::objectLifeCycle()
{
    ProgressModel *progress = m_corvid->progressModel();
    // Not loaded: only the entry; loading: the id is in the loading set, "Loading" runs.
    DirEntryNode *node = m_widget->openDirEntry(
        entryOf(m_lab, "Silver tolerances", "ToleranceSet", "Tolerance Sets", m_dispatcherId));
    QVERIFY(node);
    QVERIFY(!node->isLoaded());
    QCOMPARE(node->name(), QStringLiteral("Silver tolerances"));
    QVERIFY(m_manager->isObjectLoading(m_lab.ids["Silver tolerances"].toStdString()));
    QCOMPARE(progress->progressListeners().size(), size_t(1));
    QCOMPARE(progress->progressListeners().front()->progressTitle(), QStringLiteral("Loading"));
    QCOMPARE(progress->progressListeners().front()->value(), 0.02);
    // Opening it again selects the same node.
    QCOMPARE(m_widget->openDirEntry(entryOf(m_lab, "Silver tolerances", "ToleranceSet", "Tolerance Sets", m_dispatcherId)),
             node);
    QCOMPARE(m_model->rowCount(), 1);

    // Loaded.
    QTRY_VERIFY(node->isLoaded());
    QVERIFY(!m_manager->isObjectLoading(m_lab.ids["Silver tolerances"].toStdString()));
    QVERIFY(progress->progressListeners().empty());
    const QModelIndex index = m_model->index(node);
    QCOMPARE(index.data().toString(), QStringLiteral("Silver tolerances"));

    // Modified: " *".
    QVERIFY(m_model->setData(index, QStringLiteral("Silver tolerances 2024"), Qt::EditRole));
    QCOMPARE(index.data().toString(), QStringLiteral("Silver tolerances 2024 *"));

    // Saving, then saved.
    QVector<Node *> nodes{node};
    m_widget->saveNodes(nodes, false);
    QVERIFY(node->isSaving());
    QCOMPARE(progress->progressListeners().front()->progressTitle(), QStringLiteral("Saving"));
    QCOMPARE(index.data().toString(), QStringLiteral("Silver tolerances 2024"));
    QTRY_VERIFY(!node->isSaving());
    QVERIFY(!node->isModified());
    QCOMPARE(node->cargo()->version(), 2);
    QVERIFY(progress->progressListeners().empty());
    SqliteObjectStore check(m_lab.path);
    QVERIFY(check.open());
    std::vector<StoreRecord> records;
    QVERIFY(check.fetch({m_lab.ids["Silver tolerances"]}, QString(), &records, nullptr));
    QCOMPARE(records.front().name, QStringLiteral("Silver tolerances 2024"));
}

void tst_DirEntryBrowser::staleVersionKeepsTheEdit()
{
    DirEntryNode *node = openLoaded("Blue tolerances", "ToleranceSet", "Tolerance Sets");
    {
        // Someone else saves the object meanwhile.
        SqliteObjectStore other(m_lab.path);
        QVERIFY(other.open());
        std::vector<StoreRecord> records;
        QVERIFY(other.fetch({m_lab.ids["Blue tolerances"]}, QString(), &records, nullptr));
        records.front().name = QStringLiteral("Blue (theirs)");
        QVERIFY(other.update(&records.front(), nullptr));
    }
    QVERIFY(m_model->setData(m_model->index(node), QStringLiteral("Blue (mine)"), Qt::EditRole));
    QSignalSpy errors(m_manager.get(), &DirEntryPersistanceManager::sgErrorOccurred);
    QSignalSpy saveErrors(m_manager.get(), &DirEntryPersistanceManager::sgSaveErrorOccurred);
    QVector<Node *> nodes{node};
    m_widget->saveNodes(nodes, false);
    QVERIFY(saveErrors.wait(5000));
    QCOMPARE(errors.count(), 1);
    const QString text = saveErrors.front().front().toString();
    QVERIFY2(text.startsWith(QStringLiteral("Error occured during UpdateObject: ")) && text.endsWith(QStringLiteral(" (2008)")),
             qPrintable(text));
    QCOMPARE(m_widget->message(), text);
    QTRY_VERIFY(node->isModified());
    QVERIFY(!node->isSaving());
    QCOMPARE(node->name(), QStringLiteral("Blue (mine)"));
}

void tst_DirEntryBrowser::nullAnswersHaveTextsOfTheirOwn_data()
{
    QTest::addColumn<int>("handler");
    QTest::addColumn<QString>("text");
    QTest::newRow("load") << 0 << "Error occured during loadObject: (nullptr loaded)";
    QTest::newRow("duplication") << 1 << "Error occured during onObjectLoadedForDuplication: (nullptr loaded)";
}

void tst_DirEntryBrowser::nullAnswersHaveTextsOfTheirOwn()
{
    QFETCH(int, handler);
    QFETCH(QString, text);
    auto request = std::make_shared<GetCorvidObject>();
    request->setId(QStringLiteral("missing"));
    request->generateId();
    auto answer = std::make_shared<GetCorvidObjectResponse>(request);
    m_manager->setObjectLoading("missing");
    QSignalSpy errors(m_manager.get(), &DirEntryPersistanceManager::sgErrorOccurred);
    if (handler == 0)
        m_manager->onObjectLoaded(answer);
    else
        m_manager->onObjectLoadedForDuplication(answer);
    QCOMPARE(errors.count(), 1);
    QCOMPARE(errors.front().front().toString(), text);
    if (handler == 0)
        QVERIFY(!m_manager->isObjectLoading("missing"));

    // A directory-entry answer without entry reaches the failed callback with 2002.
    std::shared_ptr<ErrorInfo> failed;
    bool loaded = false;
    m_manager->loadDirEntry(m_dispatcherId, m_lab.ids["Blue"].toStdString(),
                            [&](std::shared_ptr<BaseObject>) { loaded = true; },
                            [&](std::shared_ptr<ErrorInfo> error) { failed = error; });
    QTRY_VERIFY(loaded); // the store's own answer carries the object
    m_manager->loadDirEntry(m_dispatcherId, "not-there", [&](std::shared_ptr<BaseObject>) { loaded = false; },
                            [&](std::shared_ptr<ErrorInfo> error) { failed = error; });
    const std::string commandId = m_manager->lastCommandId();
    auto empty = std::make_shared<GetCorvidObjectResponse>(request);
    request->setCommandId(commandId);
    m_manager->onDirEntryLoaded(empty);
    QVERIFY(failed);
    QCOMPARE(int(failed->errorCode()), 2002);
    QCOMPARE(failed->internalMessage(), QStringLiteral("DirEntry nulltpr retrieved"));
    QCOMPARE(failed->message(), QString::fromStdString(commandId));
    QVERIFY(loaded);
    failed.reset();
    QTest::qWait(100); // the store's refusal finds no callbacks left
    QVERIFY(!failed);
}

void tst_DirEntryBrowser::updateErrorGoesToBothSignals()
{
    QStringList order;
    connect(m_manager.get(), &DirEntryPersistanceManager::sgErrorOccurred, this,
            [&](const QString &text) { order << QStringLiteral("error: ") + text; });
    connect(m_manager.get(), &DirEntryPersistanceManager::sgSaveErrorOccurred, this,
            [&](const QString &text) { order << QStringLiteral("save: ") + text; });
    m_manager->onObjectUpdatedError(ErrorInfo::create(QStringLiteral("timeout"), 17, QString()));
    QCOMPARE(order, (QStringList{"error: Error occured during UpdateObject: timeout (17)",
                                 "save: Error occured during UpdateObject: timeout (17)"}));
}

void tst_DirEntryBrowser::storeProgressIsScaled_data()
{
    QTest::addColumn<double>("fraction");
    QTest::addColumn<double>("shown");
    QTest::newRow("start") << 0.0 << 0.05;
    QTest::newRow("half") << 0.5 << 0.475;
    QTest::newRow("done") << 1.0 << 0.9;
}

void tst_DirEntryBrowser::storeProgressIsScaled()
{
    QFETCH(double, fraction);
    QFETCH(double, shown);
    auto folder = entryOf(m_lab, "Empty", "Folder", "Empty", m_dispatcherId);
    folder->setPath({});
    m_manager->storeObject(named<ToleranceSet>("Fresh"), folder, nullptr);
    const std::string taskId = m_manager->lastCommandId();
    QVERIFY(m_corvid->progressModel()->progress(taskId));
    QCOMPARE(m_corvid->progressModel()->progress(taskId)->progressTitle(), QStringLiteral("Saving"));
    m_manager->onObjectStoreProgress(std::make_shared<Progress>(fraction, taskId));
    QVERIFY(qFuzzyCompare(m_corvid->progressModel()->progress(taskId)->value(), shown));
    QTRY_VERIFY(!m_corvid->progressModel()->progress(taskId));
}

void tst_DirEntryBrowser::duplicateIsNamedCopy()
{
    DirEntryNode *node = openLoaded("Silver tolerances", "ToleranceSet", "Tolerance Sets");
    m_widget->selectNodes({node});
    m_widget->treeView()->duplicateSelectedNodes(nullptr); // beside the original
    QTRY_COMPARE(m_model->rowCount(), 2);
    DirEntryNode *copy = m_model->dirEntryNodes().at(1);
    QTRY_VERIFY(copy->isLoaded());
    QCOMPARE(copy->name(), QStringLiteral("Silver tolerances( - Copy)"));
    QVERIFY(copy->cargo()->id() != node->cargo()->id());
    QCOMPARE(copy->globalDirEntry()->path(), QStringList{m_lab.ids["Tolerance Sets"]});

    // The manager's own duplicate loads the stored object and stores its copy.
    QSignalSpy duplicated(m_manager.get(), &DirEntryPersistanceManager::sgObjectDuplicated);
    auto folder = entryOf(m_lab, "Archive", "Folder", "Archive", m_dispatcherId);
    folder->setPath({});
    m_manager->duplicateObject(m_dispatcherId, m_lab.ids["Blue"].toStdString(), "Standard", folder);
    QVERIFY(duplicated.wait(5000));
    const auto entry = duplicated.front().front().value<std::shared_ptr<GlobalDirEntry>>();
    QCOMPARE(entry->header().name(), QStringLiteral("Blue( - Copy)"));
    QCOMPARE(entry->path(), QStringList{m_lab.ids["Archive"]});
}

void tst_DirEntryBrowser::newObjectIsStoredInItsFolder()
{
    auto folder = entryOf(m_lab, "Empty", "Folder", "Empty", m_dispatcherId);
    folder->setPath({});
    m_interface->setDefaultFolder(folder);
    DirEntryNode *node = m_widget->newObject();
    QVERIFY(node);
    QCOMPARE(node->name(), QStringLiteral("Tolerance set 1"));
    QVERIFY(node->isModified());
    QVERIFY(!node->isStored());
    QVector<Node *> nodes{node};
    m_widget->saveNodes(nodes, false);
    QTRY_VERIFY(node->isStored());
    QVERIFY(!node->isModified());
    QCOMPARE(node->globalDirEntry()->path(), QStringList{m_lab.ids["Empty"]});
    QVERIFY(!node->cargo()->id().isEmpty());
}

void tst_DirEntryBrowser::closeAsksToSave_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<bool>("open");
    QTest::addColumn<QString>("stored");
    QTest::newRow("save") << int(QMessageBox::Save) << false << "Edited";
    QTest::newRow("discard") << int(QMessageBox::Discard) << false << "Blue tolerances";
    QTest::newRow("cancel") << int(QMessageBox::Cancel) << true << "Blue tolerances";
}

void tst_DirEntryBrowser::closeAsksToSave()
{
    QFETCH(int, answer);
    QFETCH(bool, open);
    QFETCH(QString, stored);
    DirEntryNode *node = openLoaded("Blue tolerances", "ToleranceSet", "Tolerance Sets");
    // Unmodified: closes without a question.
    DirEntryNode *other = openLoaded("Silver tolerances", "ToleranceSet", "Tolerance Sets");
    m_widget->closeActivated(other);
    QCOMPARE(m_model->rowCount(), 1);

    QVERIFY(m_model->setData(m_model->index(node), QStringLiteral("Edited"), Qt::EditRole));
    const auto box = answerNextMessageBox(QMessageBox::StandardButton(answer));
    m_widget->closeActivated(node);
    QVERIFY(box->seen);
    QCOMPARE(box->title, QStringLiteral("Save Changes"));
    QCOMPARE(box->text, QStringLiteral("Do you want to save Tolerance set \"Edited\"?"));
    QCOMPARE(box->icon, QMessageBox::Warning);
    QVERIFY(box->flags.testFlag(Qt::MSWindowsFixedSizeDialogHint));
    QCOMPARE(box->buttons, QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel);
    QCOMPARE(box->defaultButton, QMessageBox::Save);
    QTRY_COMPARE(m_model->rowCount(), open ? 1 : 0);
    QTest::qWait(50);
    QCOMPARE(m_model->rowCount(), open ? 1 : 0);
    SqliteObjectStore check(m_lab.path);
    QVERIFY(check.open());
    std::vector<StoreRecord> records;
    QVERIFY(check.fetch({m_lab.ids["Blue tolerances"]}, QString(), &records, nullptr));
    QCOMPARE(records.front().name, stored);
}

void tst_DirEntryBrowser::closeAllAsksOnceAndSaves()
{
    DirEntryNode *blue = openLoaded("Blue tolerances", "ToleranceSet", "Tolerance Sets");
    DirEntryNode *silver = openLoaded("Silver", "Standard", "Standards");
    QVERIFY(m_model->setData(m_model->index(blue), QStringLiteral("Blue 2"), Qt::EditRole));
    QVERIFY(m_model->setData(m_model->index(silver), QStringLiteral("Silver 2"), Qt::EditRole));
    const auto box = answerNextMessageBox(QMessageBox::Save);
    QVERIFY(m_widget->closeAll());
    QCOMPARE(box->text, QStringLiteral("Do you want to save all changed items?"));
    QCOMPARE(m_model->rowCount(), 0);
    SqliteObjectStore check(m_lab.path);
    QVERIFY(check.open());
    std::vector<StoreRecord> records;
    QVERIFY(check.fetch({m_lab.ids["Blue tolerances"], m_lab.ids["Silver"]}, QString(), &records, nullptr));
    QCOMPARE(records[0].name, QStringLiteral("Blue 2"));
    QCOMPARE(records[1].name, QStringLiteral("Silver 2"));
}

void tst_DirEntryBrowser::menusAndParts()
{
    QMenu menu;
    m_widget->createCustomMenus(&menu, QStringLiteral("Tolerance Set"), QStringLiteral("Tolerance Sets"), true);
    QStringList texts;
    for (QAction *action : menu.actions()) {
        if (!action->isSeparator())
            texts << action->text();
    }
    QCOMPARE(texts, (QStringList{"&New Tolerance Set", "&Open Tolerance Set", "Reload Tolerance Set",
                                 "&Save Tolerance Set", "Save All Tolerance Sets", "&Close Tolerance Set",
                                 "Close All Tolerance Sets"}));
    QVERIFY(m_widget->findChild<QWidget *>("dirEntryBrowserWidget"));
    QVERIFY(m_widget->findChild<QLabel *>("label"));
    QVERIFY(m_widget->findChild<DirEntryTreeView *>("dirEntryTreeView"));
    auto *add = m_widget->findChild<QToolButton *>("addButton");
    QVERIFY(add);
    QVERIFY(!add->icon().isNull());
}

void tst_DirEntryBrowser::renameRefusesBadNames()
{
    DirEntryNode *node = openLoaded("Blue", "Standard", "Standards");
    QSignalSpy errors(m_model.get(), &DirEntryTreeModel::sgErrorOccurred);
    QVERIFY(!m_model->setData(m_model->index(node), QString(500, QLatin1Char('n')), Qt::EditRole));
    QVERIFY(!m_model->setData(m_model->index(node), QStringLiteral("  "), Qt::EditRole));
    QCOMPARE(errors.count(), 2);
    QCOMPARE(node->name(), QStringLiteral("Blue"));
    QVERIFY(!node->isModified());
    QCOMPARE(m_widget->message(), QStringLiteral("A name cannot be empty."));
}

void tst_DirEntryBrowser::vanishedStoreKeepsTheObject()
{
    // An object from a second store, edited; then that store's folder disappears and the
    // store is reached anew (as after a restart of the connection).
    QTemporaryDir gone;
    LabStore other = makeLabStore(gone.filePath("other.vexastore"));
    auto corvid = std::make_unique<CorvidModel>();
    CommandDispatcher *dispatcher = browserfixtures::connect(*corvid, other.path);
    const std::string otherId = dispatcher->dispatcherId();
    auto manager = std::make_shared<Manager>(*corvid);
    DirEntryTreeModel model;
    model.setPersistanceInferface(manager);
    model.initialize();
    DirEntryBrowserWidget widget;
    widget.initialize(&model, m_interface.get());
    DirEntryNode *node = widget.openDirEntry(entryOf(other, "Blue", "Standard", "Standards", otherId));
    QTRY_VERIFY(node->isLoaded());
    QVERIFY(model.setData(model.index(node), QStringLiteral("Blue, edited"), Qt::EditRole));
    corvid.reset(); // the connection goes
    QVERIFY(gone.remove());
    corvid = std::make_unique<CorvidModel>();
    manager = std::make_shared<Manager>(*corvid);
    model.setPersistanceInferface(manager);
    DirEntryBrowserWidget again;
    again.initialize(&model, m_interface.get());
    QVector<Node *> nodes{node};
    again.saveNodes(nodes, false);
    QCOMPARE(again.message(), QStringLiteral("No connection to server available! \n(") + QString::fromStdString(otherId)
                                    + QLatin1Char(')'));
    QVERIFY(node->isModified());
    QCOMPARE(node->name(), QStringLiteral("Blue, edited"));
}

QTEST_MAIN(tst_DirEntryBrowser)
#include "tst_direntrybrowser.moc"
