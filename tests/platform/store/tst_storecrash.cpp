#include <store/sqliteobjectstore.h>

#include <QProcess>

#include <csignal>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

// A writer killed with SIGKILL in the middle of its writes loses no committed
// object and leaves a store that opens and lists.
class tst_StoreCrash : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void killedWriterLosesNoCommittedObject();
};

void tst_StoreCrash::killedWriterLosesNoCommittedObject()
{
    QTemporaryDir dir;
    const QString path = dir.filePath(QStringLiteral("crash.db"));
    QHash<QString, char> committed;
    for (int round = 0; round < 20; ++round) {
        QProcess writer;
        writer.start(QStringLiteral(VEXA_STORE_CRASH_WRITER), {path});
        QVERIFY2(writer.waitForStarted(5000), qPrintable(writer.errorString()));
        // Let it commit a varying number of batches, then kill it mid-write.
        const int wanted = 1 + (round * 7) % 13;
        QByteArray output;
        while (output.count('\n') < wanted * 5 && writer.state() == QProcess::Running) {
            writer.waitForReadyRead(2000);
            output += writer.readAllStandardOutput();
        }
        QCOMPARE(writer.state(), QProcess::Running);
        ::kill(pid_t(writer.processId()), SIGKILL);
        QVERIFY(writer.waitForFinished(5000));
        output += writer.readAllStandardOutput();
        const QList<QByteArray> lines = output.split('\n');
        for (const QByteArray &line : lines) {
            const QList<QByteArray> parts = line.split(' ');
            if (parts.size() == 2 && parts[1].size() == 1)
                committed.insert(QString::fromLatin1(parts[0]), parts[1].at(0));
        }

        SqliteObjectStore store(path, SqliteObjectStore::OpenMode::MustExist);
        ErrorInfo error;
        QVERIFY2(store.open(&error), qPrintable(error.toString()));
        std::vector<StoreRecord> entries;
        QVERIFY(store.listEntries(QString(), {}, &entries, &error));
        QVERIFY(entries.size() >= size_t(committed.size()));
        std::vector<StoreRecord> records;
        QVERIFY2(store.fetch(committed.keys(), QStringLiteral("Trial"), &records, &error),
                 qPrintable(error.toString()));
        for (const StoreRecord &record : records)
            QCOMPARE(record.data, QByteArray(4096, committed.value(record.id)));
    }
    QVERIFY(committed.size() >= 20 * 5);
}

QTEST_GUILESS_MAIN(tst_StoreCrash)
#include "tst_storecrash.moc"
