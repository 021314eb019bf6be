#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>
#include <context/deleteobject.h>
#include <context/progresslistener.h>
#include <context/progresslistenerrange.h>
#include <context/progressmodel.h>
#include <context/qtcommand.h>
#include <context/serverinfo.h>
#include <context/serverinforesponse.h>

#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

class tst_CommandDispatcher : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void answersArriveOnTheGuiThread();
    void errorsArriveOnTheGuiThread();
    void noConnection_data();
    void noConnection();
    void commandWithoutConnectionIsAnsweredWithAnError();
    void standardizedDispatcherId_data();
    void standardizedDispatcherId();
    void corvidModelKeepsOneDispatcherPerStore();
    void progressListenerRangeMapsOntoParent_data();
    void progressListenerRangeMapsOntoParent();

private:
    QTemporaryDir m_dir;
};

void tst_CommandDispatcher::answersArriveOnTheGuiThread()
{
    CommandDispatcher dispatcher(ServerId(m_dir.filePath(QStringLiteral("a.db")).toStdString()));
    dispatcher.connectToServer();
    QTRY_VERIFY(dispatcher.isConnected());
    auto command = std::make_shared<ServerInfo>();
    command->generateId();
    QtCommand *qtCommand = dispatcher.execute(command);
    QThread *slotThread = nullptr;
    std::shared_ptr<Response> answer;
    connect(qtCommand, &QtCommand::responseReceived, this, [&](std::shared_ptr<Response> r) {
        slotThread = QThread::currentThread();
        answer = r;
    });
    QSignalSpy destroyed(qtCommand, &QObject::destroyed);
    QTRY_VERIFY(answer);
    QCOMPARE(slotThread, QThread::currentThread());
    QCOMPARE(answer->commandId(), command->commandId());
    auto info = std::dynamic_pointer_cast<ServerInfoResponse>(answer);
    QVERIFY(info);
    QVERIFY(info->serverName().endsWith(QStringLiteral("a.db")));
    QTRY_COMPARE(destroyed.count(), 1); // the QtCommand cleans up after its answer
}

void tst_CommandDispatcher::errorsArriveOnTheGuiThread()
{
    CommandDispatcher dispatcher(ServerId(m_dir.filePath(QStringLiteral("b.db")).toStdString()));
    dispatcher.connectToServer();
    auto command = std::make_shared<DeleteObject>();
    command->setId(QStringLiteral("no-such-object"));
    std::shared_ptr<ErrorInfo> error;
    QThread *slotThread = nullptr;
    dispatcher.execute(command, this, [](std::shared_ptr<Response>) { QFAIL("unexpected answer"); },
                       [&](std::shared_ptr<ErrorInfo> e) {
                           slotThread = QThread::currentThread();
                           error = e;
                       });
    QVERIFY(!command->commandId().empty());
    QTRY_VERIFY(error);
    QCOMPARE(slotThread, QThread::currentThread());
    QCOMPARE(error->errorCode(), CorvidErrorCode::ObjectNotFound);
}

void tst_CommandDispatcher::noConnection_data()
{
    QTest::addColumn<QString>("server");
    QTest::addColumn<int>("port");
    QTest::addColumn<bool>("refuse");
    QTest::newRow("missing folder") << QStringLiteral("/nonexistent-vexa/x.db") << 0 << false;
    QTest::newRow("network server") << QStringLiteral("corvid.example") << 8080 << false;
    QTest::newRow("refused by test hook") << QStringLiteral("c.db") << 0 << true;
}

void tst_CommandDispatcher::noConnection()
{
    QFETCH(QString, server);
    QFETCH(int, port);
    QFETCH(bool, refuse);
    if (port == 0 && !server.startsWith(QLatin1Char('/')))
        server = m_dir.filePath(server);
    CommandDispatcher dispatcher(ServerId(server.toStdString(), port));
    dispatcher.setRefuseConnections(refuse);
    QSignalSpy states(&dispatcher, &CommandDispatcher::sgConnectionStateChanged);
    // The clients' poll: 11 looks, 100 ms apart, asking to connect before each.
    int looks = 0;
    while (!dispatcher.isConnected() && looks < 11) {
        dispatcher.connectToServer();
        QThread::msleep(100);
        ++looks;
    }
    QCOMPARE(looks, 11);
    QVERIFY(!dispatcher.isConnected());
    QCOMPARE(dispatcher.connectionState(), CommandDispatcher::ConnectionState::Failed);
    QCOMPARE(dispatcher.connectionError().errorCode() == CorvidErrorCode::NotConnected
                 || dispatcher.connectionError().errorCode() == CorvidErrorCode::NotSupported,
             true);
    // The last announced state, once the queued announcements have arrived, is Failed.
    QTRY_VERIFY(!states.isEmpty()
                && states.last().first().value<CommandDispatcher::ConnectionState>()
                    == CommandDispatcher::ConnectionState::Failed);
}

void tst_CommandDispatcher::commandWithoutConnectionIsAnsweredWithAnError()
{
    CommandDispatcher dispatcher(ServerId(m_dir.filePath(QStringLiteral("never.db")).toStdString()));
    QtCommand *qtCommand = dispatcher.execute(std::make_shared<ServerInfo>());
    QSignalSpy errors(qtCommand, &QtCommand::errorReceived);
    QTRY_COMPARE(errors.count(), 1);
    QCOMPARE(errors.first().first().value<std::shared_ptr<ErrorInfo>>()->errorCode(), CorvidErrorCode::NotConnected);
    QVERIFY(!QFile::exists(m_dir.filePath(QStringLiteral("never.db"))));
}

void tst_CommandDispatcher::standardizedDispatcherId_data()
{
    QTest::addColumn<QString>("given");
    QTest::addColumn<QString>("expected");
    QTest::newRow("clean path") << "/tmp/x/store.db" << "/tmp/x/store.db";
    QTest::newRow("dots") << "/tmp/x/../x/./store.db" << "/tmp/x/store.db";
    QTest::newRow("relative") << "store.db" << QDir::current().absoluteFilePath("store.db");
    QTest::newRow("host and port") << "Corvid.Example:8080" << "corvid.example:8080";
    QTest::newRow("empty") << "" << "";
}

void tst_CommandDispatcher::standardizedDispatcherId()
{
    QFETCH(QString, given);
    QFETCH(QString, expected);
    QCOMPARE(QString::fromStdString(CommandDispatcher::standardizedDispatcherId(given.toStdString())), expected);
}

void tst_CommandDispatcher::corvidModelKeepsOneDispatcherPerStore()
{
    CorvidModel model;
    QVERIFY(!model.commandDispatcher());
    const std::string path = m_dir.filePath(QStringLiteral("d.db")).toStdString();
    CommandDispatcher *created = model.createCommandDispatcher(ServerId(path));
    model.setDefaultDispatcherId(path);
    QCOMPARE(model.commandDispatcher(), created);
    QCOMPARE(model.commandDispatcher(m_dir.path().toStdString() + "/./d.db"), created);
    QTRY_VERIFY(created->isConnected());
    CommandDispatcher *other = model.commandDispatcher(m_dir.filePath(QStringLiteral("e.db")).toStdString());
    QVERIFY(other && other != created);
    QTRY_VERIFY(other->isConnected()); // an unknown id is a local store, connected on demand
}

void tst_CommandDispatcher::progressListenerRangeMapsOntoParent_data()
{
    QTest::addColumn<double>("sub");
    QTest::addColumn<double>("expected");
    QTest::newRow("start") << 0.0 << 0.02;
    QTest::newRow("half") << 0.5 << 0.31;
    QTest::newRow("end") << 1.0 << 0.6;
    QTest::newRow("beyond end is clamped") << 3.0 << 0.6;
    QTest::newRow("NaN counts as nothing done") << qQNaN() << 0.02;
}

void tst_CommandDispatcher::progressListenerRangeMapsOntoParent()
{
    QFETCH(double, sub);
    QFETCH(double, expected);
    ProgressModel model;
    QSignalSpy changed(&model, &ProgressModel::sgProgressChanged);
    auto task = model.startProgress(QStringLiteral("Copy"));
    auto parent = std::make_shared<ProgressListener>(&model, task->id());
    ProgressListenerRange range(parent, 0.02, 0.6);
    range.setProgress(sub);
    QCOMPARE(model.progressListeners().size(), size_t(1));
    QCOMPARE(model.progressListeners().front()->progressTitle(), QStringLiteral("Copy"));
    QVERIFY(qAbs(task->value() - expected) < 1e-12);
    parent->finish();
    QVERIFY(model.progressListeners().empty());
    QCOMPARE(changed.count(), 3);
}

QTEST_GUILESS_MAIN(tst_CommandDispatcher)
#include "tst_commanddispatcher.moc"
