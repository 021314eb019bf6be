#include <context/addobject.h>
#include <context/addobjectresponse.h>
#include <context/commanddispatcher.h>
#include <context/copyobject.h>
#include <context/copyobjectresponse.h>
#include <context/deleteobject.h>
#include <context/fullobjectloader.h>
#include <context/getappearanceimage.h>
#include <context/getcorvidobject.h>
#include <context/getcorvidobjectresponse.h>
#include <context/getcorvidobjects.h>
#include <context/getcorvidobjectsresponse.h>
#include <context/getdatabases.h>
#include <context/getdatabasesresponse.h>
#include <context/getdirentries.h>
#include <context/getdirentriesresponse.h>
#include <context/moveobject.h>
#include <context/moveobjectresponse.h>
#include <context/qtcommand.h>
#include <context/updateobject.h>
#include <context/updateobjectresponse.h>

#include <domain/direntry.h>
#include <domain/folder.h>
#include <domain/standard.h>
#include <domain/trial.h>

#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

namespace {

template<typename T>
std::shared_ptr<T> named(const QString &name)
{
    auto object = std::make_shared<T>();
    object->setName(name);
    return object;
}

} // namespace

class tst_Commands : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void addListAndLoad();
    void loadResolvesReferencesOnRequest();
    void updateMoveCopyDelete();
    void fullObjectLoaderCollectsReferences();
    void databasesAndImages();
    void badRequests_data();
    void badRequests();

private:
    // Sends a command and waits (event loop running) for its answer on this thread.
    std::shared_ptr<Response> send(const std::shared_ptr<Command> &command, std::shared_ptr<ErrorInfo> *error = nullptr);
    QStringList listing(const QString &folderId);

    QTemporaryDir m_dir;
    std::unique_ptr<CommandDispatcher> m_dispatcher;
    std::shared_ptr<Folder> m_standards, m_trials, m_sub;
    std::shared_ptr<Standard> m_standard;
    std::shared_ptr<Trial> m_trial;
};

std::shared_ptr<Response> tst_Commands::send(const std::shared_ptr<Command> &command,
                                             std::shared_ptr<ErrorInfo> *error)
{
    command->generateId();
    QtCommand *qtCommand = m_dispatcher->execute(command);
    std::shared_ptr<Response> response;
    std::shared_ptr<ErrorInfo> failure;
    bool onGuiThread = true;
    connect(qtCommand, &QtCommand::responseReceived, this, [&](std::shared_ptr<Response> r) {
        onGuiThread = onGuiThread && QThread::currentThread() == thread();
        response = r;
    });
    connect(qtCommand, &QtCommand::errorReceived, this, [&](std::shared_ptr<ErrorInfo> e) {
        onGuiThread = onGuiThread && QThread::currentThread() == thread();
        failure = e;
    });
    if (!QTest::qWaitFor([&] { return response || failure; }, 10000))
        return nullptr;
    if (!onGuiThread)
        qWarning("answer delivered off the GUI thread");
    if (response && response->commandId() != command->commandId())
        return nullptr;
    if (error)
        *error = failure;
    return onGuiThread ? response : nullptr;
}

QStringList tst_Commands::listing(const QString &folderId)
{
    auto command = std::make_shared<GetDirEntries>();
    command->setParentFolderId(folderId);
    auto response = std::dynamic_pointer_cast<GetDirEntriesResponse>(send(command));
    QStringList names;
    if (response) {
        for (const auto &entry : response->dirEntries())
            names << entry->header().name();
    }
    return names;
}

void tst_Commands::init()
{
    QFile::remove(m_dir.filePath(QStringLiteral("c.db")));
    m_dispatcher = std::make_unique<CommandDispatcher>(ServerId(m_dir.filePath(QStringLiteral("c.db")).toStdString()));
    m_dispatcher->connectToServer();
    QTRY_VERIFY(m_dispatcher->isConnected());

    m_standards = named<Folder>(QStringLiteral("Standards"));
    m_trials = named<Folder>(QStringLiteral("Trials"));
    auto add = std::make_shared<AddObject>();
    add->setObjects({m_standards, m_trials});
    auto added = std::dynamic_pointer_cast<AddObjectResponse>(send(add));
    QVERIFY(added);
    QCOMPARE(added->dirEntries().size(), size_t(2));
    QCOMPARE(added->dirEntries()[0]->entryObjectId(), m_standards->id());

    m_sub = named<Folder>(QStringLiteral("Sub"));
    add = std::make_shared<AddObject>();
    add->setObject(m_sub);
    add->setParentFolderId(m_trials->id());
    QVERIFY(send(add));

    m_standard = named<Standard>(QStringLiteral("Silver"));
    add = std::make_shared<AddObject>();
    add->setObject(m_standard);
    add->setParentFolderId(m_standards->id());
    QVERIFY(send(add));

    m_trial = named<Trial>(QStringLiteral("Trial 1"));
    m_trial->setStandard(m_standard);
    add = std::make_shared<AddObject>();
    add->setObject(m_trial);
    add->setParentFolderId(m_sub->id());
    QVERIFY(send(add));
    QVERIFY(m_trial->isStored());
    QCOMPARE(m_trial->version(), 1);
}

void tst_Commands::cleanup()
{
    m_dispatcher.reset();
}

void tst_Commands::addListAndLoad()
{
    QCOMPARE(listing(QString()), QStringList({"Standards", "Trials"}));
    auto folders = std::make_shared<GetDirEntries>();
    folders->setParentFolderId(m_trials->id());
    folders->setType(Folder::typeId());
    auto response = std::dynamic_pointer_cast<GetDirEntriesResponse>(send(folders));
    QVERIFY(response);
    QCOMPARE(response->dirEntries().size(), size_t(1));
    QCOMPARE(response->dirEntries()[0]->entryObjectType(), Folder::typeId());

    auto get = std::make_shared<GetCorvidObject>();
    get->setId(m_trial->id());
    get->setType(Trial::typeId());
    auto loaded = std::dynamic_pointer_cast<GetCorvidObjectResponse>(send(get));
    QVERIFY(loaded);
    auto trial = std::dynamic_pointer_cast<Trial>(loaded->object());
    QVERIFY(trial);
    QCOMPARE(trial->name(), QStringLiteral("Trial 1"));
    QCOMPARE(trial->uuid(), m_trial->uuid());
    QVERIFY(trial->isStored());
    // Depth 0: the standard is a stub known only by its id.
    QVERIFY(trial->standard());
    QVERIFY(trial->standard()->isStub());
    QCOMPARE(trial->standard()->id(), m_standard->id());

    auto many = std::make_shared<GetCorvidObjects>();
    many->setParentFolderId(m_standards->id());
    auto all = std::dynamic_pointer_cast<GetCorvidObjectsResponse>(send(many));
    QVERIFY(all);
    QCOMPARE(all->objects().size(), size_t(1));
    QCOMPARE(all->objects()[0]->typeName(), Standard::typeId());
}

void tst_Commands::loadResolvesReferencesOnRequest()
{
    auto get = std::make_shared<GetCorvidObject>();
    get->setId(m_trial->id());
    get->setDepth(1);
    auto loaded = std::dynamic_pointer_cast<GetCorvidObjectResponse>(send(get));
    QVERIFY(loaded);
    auto trial = std::dynamic_pointer_cast<Trial>(loaded->object());
    QVERIFY(trial && trial->standard());
    QVERIFY(!trial->standard()->isStub());
    QCOMPARE(trial->standard()->name(), QStringLiteral("Silver"));
}

void tst_Commands::updateMoveCopyDelete()
{
    m_trial->setName(QStringLiteral("Renamed"));
    auto update = std::make_shared<UpdateObject>();
    update->setObject(m_trial);
    auto updated = std::dynamic_pointer_cast<UpdateObjectResponse>(send(update));
    QVERIFY(updated);
    QCOMPARE(updated->updatedObject()->version(), 2);
    QCOMPARE(listing(m_sub->id()), QStringList{"Renamed"});

    auto move = std::make_shared<MoveObject>();
    move->setId(m_sub->id());
    move->setTargetFolderId(m_standards->id());
    auto moved = std::dynamic_pointer_cast<MoveObjectResponse>(send(move));
    QVERIFY(moved);
    QCOMPARE(moved->dirEntry()->parentFolderId(), m_standards->id());
    QCOMPARE(listing(m_standards->id()), QStringList({"Sub", "Silver"}));

    auto copy = std::make_shared<CopyObject>();
    copy->setId(m_standards->id());
    copy->setTargetFolderId(m_trials->id());
    auto copied = std::dynamic_pointer_cast<CopyObjectResponse>(send(copy));
    QVERIFY(copied);
    const QString copyId = copied->dirEntry()->entryObjectId();
    QVERIFY(copyId != m_standards->id());
    QCOMPARE(listing(copyId), QStringList({"Sub", "Silver"}));

    auto remove = std::make_shared<DeleteObject>();
    remove->setIds({copyId});
    remove->setRecursive(true);
    QVERIFY(send(remove));
    QVERIFY(listing(m_trials->id()).isEmpty());
}

void tst_Commands::fullObjectLoaderCollectsReferences()
{
    auto entry = std::make_shared<DirEntry>();
    entry->setEntryObjectId(m_trial->id());
    entry->setEntryObjectType(Trial::typeId());
    FullObjectLoader loader;
    QSignalSpy loaded(&loader, &FullObjectLoader::sgObjectsLoaded);
    loader.collect(7, m_dispatcher.get(), {entry});
    QTRY_COMPARE(loaded.count(), 1);
    QCOMPARE(loaded.first().at(0).value<size_t>(), size_t(7));
    const auto objects = loaded.first().at(1).value<std::vector<std::shared_ptr<BaseObject>>>();
    QCOMPARE(objects.size(), size_t(2)); // the trial, then the standard it refers to
    QCOMPARE(objects[0]->id(), m_trial->id());
    QCOMPARE(objects[1]->id(), m_standard->id());
    QVERIFY(!objects[1]->isStub());
}

void tst_Commands::databasesAndImages()
{
    auto databases = std::dynamic_pointer_cast<GetDatabasesResponse>(send(std::make_shared<GetDatabases>()));
    QVERIFY(databases);
    QCOMPARE(databases->databases(), QStringList{"c"});
    std::shared_ptr<ErrorInfo> error;
    auto image = std::make_shared<GetAppearanceImage>();
    image->setTextureValuesId(QStringLiteral("tv"));
    QVERIFY(!send(image, &error));
    QVERIFY(error);
    QCOMPARE(error->errorCode(), CorvidErrorCode::ImageNotAvailable);
}

void tst_Commands::badRequests_data()
{
    QTest::addColumn<QString>("request");
    QTest::addColumn<int>("code");
    QTest::newRow("unknown id") << "unknown-id" << int(CorvidErrorCode::ObjectNotFound);
    QTest::newRow("unknown type in a filter") << "unknown-type" << int(CorvidErrorCode::UnknownType);
    QTest::newRow("move into own subfolder") << "move-into-sub" << int(CorvidErrorCode::MoveIntoOwnSubfolder);
    QTest::newRow("stale update") << "stale-update" << int(CorvidErrorCode::VersionConflict);
    QTest::newRow("delete non-empty folder") << "delete-non-empty" << int(CorvidErrorCode::FolderNotEmpty);
    QTest::newRow("add below a trial") << "add-below-trial" << int(CorvidErrorCode::NotAFolder);
}

void tst_Commands::badRequests()
{
    QFETCH(QString, request);
    QFETCH(int, code);
    const QStringList before = listing(QString()) + listing(m_trials->id()) + listing(m_sub->id());
    std::shared_ptr<Command> command;
    if (request == "unknown-id") {
        auto c = std::make_shared<GetCorvidObject>();
        c->setId(QStringLiteral("no-such-id"));
        command = c;
    } else if (request == "unknown-type") {
        auto c = std::make_shared<GetDirEntries>();
        c->setParentFolderId(m_trials->id());
        c->setTypes({Folder::typeId(), QStringLiteral("Banana")});
        command = c;
    } else if (request == "move-into-sub") {
        auto c = std::make_shared<MoveObject>();
        c->setId(m_trials->id());
        c->setTargetFolderId(m_sub->id());
        command = c;
    } else if (request == "stale-update") {
        auto stale = std::dynamic_pointer_cast<Trial>(m_trial->deepCopy());
        auto first = std::make_shared<UpdateObject>();
        first->setObject(m_trial);
        QVERIFY(send(first)); // someone else saved first
        stale->setName(QStringLiteral("Stale"));
        auto c = std::make_shared<UpdateObject>();
        c->setObject(stale);
        command = c;
    } else if (request == "delete-non-empty") {
        auto c = std::make_shared<DeleteObject>();
        c->setId(m_trials->id());
        command = c;
    } else if (request == "add-below-trial") {
        auto c = std::make_shared<AddObject>();
        c->setObject(named<Trial>(QStringLiteral("Orphan")));
        c->setParentFolderId(m_trial->id());
        command = c;
    }
    std::shared_ptr<ErrorInfo> error;
    QVERIFY(!send(command, &error));
    QVERIFY(error);
    QCOMPARE(int(error->errorCode()), code);
    QVERIFY(!error->message().isEmpty());
    QCOMPARE(listing(QString()) + listing(m_trials->id()) + listing(m_sub->id()), before);
}

QTEST_GUILESS_MAIN(tst_Commands)
#include "tst_commands.moc"
