#include <utilities/applicationinfo.h>
#include <utilities/logger.h>
#include <utilities/mathhelper.h>
#include <utilities/timehelper.h>

#include <QRegularExpression>
#include <QThread>

#include <mutex>
#include <QtTest>

#include <cmath>
#include <limits>

using namespace vexa;

namespace {
class RecordingSink : public LogInterface
{
public:
    void log(LogLevel level, LogCategory category, const QString &message) override
    {
        std::lock_guard<std::mutex> lock(mutex);
        lines << QStringLiteral("%1|%2|%3")
                     .arg(level == LogLevel::Error ? "E" : "D", logCategoryName(category), message);
    }
    std::mutex mutex;
    QStringList lines;
};
} // namespace

class tst_Utilities : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void cartesian_data();
    void cartesian();
    void angleConversionsRoundTrip();
    void roundDouble_data();
    void roundDouble();
    void timestampRoundTrip();
    void timestampRejectsBadText_data();
    void timestampRejectsBadText();
    void loggerRoutesToSinks();
    void loggerFallsBackToQtLog();
    void loggerIsThreadSafe();
    void versionIsSemantic();
};

void tst_Utilities::cartesian_data()
{
    QTest::addColumn<double>("radius");
    QTest::addColumn<double>("degrees");
    QTest::addColumn<QPointF>("expected");
    QTest::newRow("east") << 2.0 << 0.0 << QPointF(2, 0);
    QTest::newRow("north") << 2.0 << 90.0 << QPointF(0, 2);
    QTest::newRow("west") << 1.0 << 180.0 << QPointF(-1, 0);
    QTest::newRow("south-negative-angle") << 3.0 << -90.0 << QPointF(0, -3);
    QTest::newRow("diagonal") << std::sqrt(2.0) << 45.0 << QPointF(1, 1);
    QTest::newRow("full-turn") << 1.0 << 720.0 << QPointF(1, 0);
}

void tst_Utilities::cartesian()
{
    QFETCH(double, radius);
    QFETCH(double, degrees);
    QFETCH(QPointF, expected);
    const QPointF p = MathHelper::toCarthesianDeg(radius, degrees);
    QVERIFY2(std::abs(p.x() - expected.x()) < 1e-12, qPrintable(QString::number(p.x())));
    QVERIFY2(std::abs(p.y() - expected.y()) < 1e-12, qPrintable(QString::number(p.y())));
}

void tst_Utilities::angleConversionsRoundTrip()
{
    QCOMPARE(MathHelper::toDegree(M_PI), 180.0);
    QCOMPARE(MathHelper::toRadiant(90.0), M_PI / 2);
    for (double d = -720; d <= 720; d += 17.5)
        QVERIFY(std::abs(MathHelper::toDegree(MathHelper::toRadiant(d)) - d) < 1e-9);
    QCOMPARE(MathHelper::normalizeDegrees(-30.0), 330.0);
    QCOMPARE(MathHelper::normalizeDegrees(360.0), 0.0);
}

void tst_Utilities::roundDouble_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<int>("decimals");
    QTest::addColumn<double>("expected");
    QTest::newRow("half-up") << 1.25 << 1 << 1.3;
    QTest::newRow("half-away-negative") << -1.25 << 1 << -1.3;
    QTest::newRow("zero-decimals") << 2.5 << 0 << 3.0;
    QTest::newRow("four-decimals") << 2.04251 << 4 << 2.0425;
    QTest::newRow("negative-decimals") << 1234.0 << -2 << 1200.0;
}

void tst_Utilities::roundDouble()
{
    QFETCH(double, value);
    QFETCH(int, decimals);
    QFETCH(double, expected);
    QCOMPARE(MathHelper::roundDouble(value, decimals), expected);
}

void tst_Utilities::timestampRoundTrip()
{
    const Timestamp t(2024, 3, 5, 14, 7, 9);
    QCOMPARE(t.toString(), QStringLiteral("2024-03-05T14:07:09Z"));
    bool ok = false;
    QCOMPARE(Timestamp::fromString(t.toString(), &ok), t);
    QVERIFY(ok);
    const QDateTime dt = TimeHelper::convert(t);
    QCOMPARE(dt, QDateTime(QDate(2024, 3, 5), QTime(14, 7, 9), Qt::UTC));
    QCOMPARE(TimeHelper::convert(dt), t);
    QVERIFY(!TimeHelper::convert(Timestamp()).isValid());
    QVERIFY(TimeHelper::timestamp().isValid());
    QVERIFY(Timestamp(2023, 12, 31, 23, 59, 59) < t);
}

void tst_Utilities::timestampRejectsBadText_data()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("garbage") << "yesterday";
    QTest::newRow("month-13") << "2024-13-05T14:07:09Z";
    QTest::newRow("feb-30") << "2024-02-30T00:00:00Z";
    QTest::newRow("no-zone") << "2024-03-05T14:07:09";
}

void tst_Utilities::timestampRejectsBadText()
{
    QFETCH(QString, text);
    bool ok = true;
    QVERIFY(Timestamp::fromString(text, &ok).isNull());
    QVERIFY(!ok);
}

void tst_Utilities::loggerRoutesToSinks()
{
    RecordingSink sink;
    Logger::instance().registerLogger(&sink);
    Logger::instance().registerLogger(&sink); // twice is once
    Logger::instance().error(LogCategory::General, "BaseObjectTreeModel::moveRows: bad row");
    Logger::instance().debug(LogCategory::Store, "opened");
    Logger::instance().unregisterLogger(&sink);
    Logger::instance().error(LogCategory::General, "after unregister");
    QCOMPARE(sink.lines,
             QStringList({"E|General|BaseObjectTreeModel::moveRows: bad row", "D|Store|opened"}));
}

void tst_Utilities::loggerFallsBackToQtLog()
{
    QTest::ignoreMessage(QtCriticalMsg, "[General] nobody listens");
    Logger::instance().error(LogCategory::General, "nobody listens");
}

void tst_Utilities::loggerIsThreadSafe()
{
    RecordingSink sink;
    Logger::instance().registerLogger(&sink);
    QVector<QThread *> threads;
    for (int t = 0; t < 4; ++t) {
        threads << QThread::create([] {
            for (int i = 0; i < 250; ++i)
                Logger::instance().debug(LogCategory::General, QStringLiteral("line"));
        });
        threads.last()->start();
    }
    for (QThread *t : threads) {
        t->wait();
        delete t;
    }
    Logger::instance().unregisterLogger(&sink);
    QCOMPARE(sink.lines.size(), 1000);
}

void tst_Utilities::versionIsSemantic()
{
    QVERIFY(QRegularExpression("^\\d+\\.\\d+\\.\\d+$").match(ApplicationInfo::instance().version()).hasMatch());
}

QTEST_GUILESS_MAIN(tst_Utilities)
#include "tst_utilities.moc"
