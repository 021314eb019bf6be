#include <domain/appearancevalues.h>
#include <domain/labvalue.h>
#include <domain/serialization.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/tolerancevalue.h>
#include <domain/trial.h>
#include <colorimetry/colordifferenceformulas.h>
#include <tolerances/tolerancefactory.h>

#include <QCryptographicHash>
#include <QProcess>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

namespace {

struct Result
{
    int exitCode = -1;
    QString out;
    QString err;
};

Result runTool(const QStringList &args)
{
    QProcess process;
    process.start(QStringLiteral(VEXA_TOOL_PATH), args);
    Result r;
    if (!process.waitForFinished(30000))
        return r;
    r.exitCode = process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1;
    r.out = QString::fromUtf8(process.readAllStandardOutput());
    r.err = QString::fromUtf8(process.readAllStandardError());
    return r;
}

QByteArray fileHash(const QString &path)
{
    QFile f(path);
    f.open(QIODevice::ReadOnly);
    return QCryptographicHash::hash(f.readAll(), QCryptographicHash::Sha256);
}

} // namespace

class tst_VexaTool : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void initTestCase();
    void listingVerbs();
    void checkGoodFiles();
    void checkBrokenFile_data();
    void checkBrokenFile();
    void wrongUsage();
    void colourDifferenceNamesItsFactors_data();
    void colourDifferenceNamesItsFactors();
    void judgeRefusesAToleranceThatCannotJudge();

private:
    QTemporaryDir m_dir;
    QString m_good;
};

void tst_VexaTool::initTestCase()
{
    QVERIFY(m_dir.isValid());
    auto trial = std::make_shared<Trial>();
    trial->setName(QStringLiteral("Fender"));
    trial->setAppearanceValues(std::make_shared<AppearanceValues>());
    trial->appearanceValues()->addColorValues(std::make_shared<LabValue>(40.0, 1.0, -2.0));
    m_good = m_dir.filePath(QStringLiteral("good.json"));
    QFile f(m_good);
    QVERIFY(f.open(QIODevice::WriteOnly));
    f.write(trial->serialize());
}

void tst_VexaTool::listingVerbs()
{
    const Result help = runTool({QStringLiteral("--help")});
    QCOMPARE(help.exitCode, 0);
    for (const char *verb : {"version", "geometries", "conditions", "check FILE"})
        QVERIFY2(help.out.contains(QLatin1String(verb)), verb);

    const Result version = runTool({QStringLiteral("version")});
    QCOMPARE(version.exitCode, 0);
    QVERIFY(version.out.startsWith(QStringLiteral("vexa-tool ")));

    const Result geometries = runTool({QStringLiteral("geometries")});
    QCOMPARE(geometries.exitCode, 0);
    QVERIFY(geometries.out.contains(QRegularExpression(QStringLiteral("\\n45as-15\\s+45\\s+-15\\s+directional\\n"))));
    QVERIFY(geometries.out.contains(QRegularExpression(QStringLiteral("\\nSPIN\\s"))));

    const Result conditions = runTool({QStringLiteral("conditions")});
    QCOMPARE(conditions.exitCode, 0);
    QCOMPARE(conditions.out.split(QLatin1Char('\n'), Qt::SkipEmptyParts).size(), 20);
    QVERIFY(conditions.out.contains(QStringLiteral("D65/10\n")));
}

void tst_VexaTool::checkGoodFiles()
{
    const Result good = runTool({QStringLiteral("check"), m_good});
    QCOMPARE(good.exitCode, 0);
    QVERIFY2(good.out.contains(QStringLiteral("OK, Trial \"Fender\"")), qPrintable(good.out));
    QVERIFY(good.err.isEmpty());

    const QString old = QStringLiteral(VEXA_SOURCE_DIR "/tests/platform/domain/data/trial-format1.json");
    const Result older = runTool({QStringLiteral("check"), old});
    QCOMPARE(older.exitCode, 0);
    QVERIFY2(older.out.contains(QStringLiteral("format 1 (older")), qPrintable(older.out));
}

void tst_VexaTool::checkBrokenFile_data()
{
    QTest::addColumn<int>("cut");
    QTest::addColumn<QString>("edit");
    QTest::addColumn<QString>("expected");
    QTest::newRow("truncated") << 200 << QString() << "JSON parse error at offset";
    QTest::newRow("hand-edited member") << -1 << "\"version\": \"three\"" << "Trial.version: expected an integer";
    QTest::newRow("empty") << 0 << QString() << "empty data";
}

void tst_VexaTool::checkBrokenFile()
{
    QFETCH(int, cut);
    QFETCH(QString, edit);
    QFETCH(QString, expected);
    QFile good(m_good);
    QVERIFY(good.open(QIODevice::ReadOnly));
    QByteArray bytes = good.readAll();
    if (cut >= 0)
        bytes = bytes.left(cut);
    if (!edit.isEmpty())
        bytes.replace(QByteArray("\"version\": 0"), edit.toUtf8());
    const QString path = m_dir.filePath(QStringLiteral("broken.json"));
    QFile broken(path);
    QVERIFY(broken.open(QIODevice::WriteOnly | QIODevice::Truncate));
    broken.write(bytes);
    broken.close();
    const QByteArray before = fileHash(path);
    const QStringList filesBefore = QDir(m_dir.path()).entryList(QDir::Files);

    const Result r = runTool({QStringLiteral("check"), path});
    QCOMPARE(r.exitCode, 1);
    QVERIFY(r.out.isEmpty());
    QVERIFY2(r.err.contains(path + QStringLiteral(": broken: ") + expected), qPrintable(r.err));
    // Nothing written: the file is unchanged and no file was added.
    QCOMPARE(fileHash(path), before);
    QCOMPARE(QDir(m_dir.path()).entryList(QDir::Files), filesBefore);
}

void tst_VexaTool::wrongUsage()
{
    QCOMPARE(runTool({}).exitCode, 2);
    const Result unknown = runTool({QStringLiteral("frobnicate")});
    QCOMPARE(unknown.exitCode, 2);
    QVERIFY(unknown.err.contains(QStringLiteral("unknown verb \"frobnicate\"")));
    QCOMPARE(runTool({QStringLiteral("check")}).exitCode, 2);
    const Result missing = runTool({QStringLiteral("check"), m_dir.filePath(QStringLiteral("missing.json"))});
    QCOMPARE(missing.exitCode, 1);
    QVERIFY(missing.err.contains(QStringLiteral("cannot open")));
}

void tst_VexaTool::colourDifferenceNamesItsFactors_data()
{
    QTest::addColumn<QStringList>("options");
    QTest::addColumn<int>("exitCode");
    QTest::addColumn<QString>("expected"); // the start of the line, or of the error
    const CieLab s{50.0, 20.0, 10.0};
    const CieLab t{52.0, 21.0, 11.5};
    const QString cmc21 = QString::number(ColorDifferenceFormulas::cmc(s, t, 2.0, 1.0).dE, 'f', 4);
    const QString cmc11 = QString::number(ColorDifferenceFormulas::cmc(s, t, 1.0, 1.0).dE, 'f', 4);
    const QString de00 = QString::number(ColorDifferenceFormulas::ciede2000(s, t, 1.0, 1.0, 1.0).dE, 'f', 10);
    const QString de00w = QString::number(ColorDifferenceFormulas::ciede2000(s, t, 2.0, 1.0, 1.0).dE, 'f', 4);
    QTest::newRow("CMC defaults to 2:1") << QStringList{"--formula", "CMC"} << 0 << "CMC l:c=2:1 dE=" + cmc21 + " ";
    QTest::newRow("CMC 1:1") << QStringList{"--formula", "CMC", "--lc", "1:1"} << 0 << "CMC l:c=1:1 dE=" + cmc11 + " ";
    QTest::newRow("more digits") << QStringList{"--precision", "10"} << 0 << "CIE2000 kL:kC:kH=1:1:1 dE=" + de00 + " ";
    QTest::newRow("CIEDE2000 weights") << QStringList{"--weights", "2:1:1"} << 0
                                       << "CIE2000 kL:kC:kH=2:1:1 dE=" + de00w + " ";
    QTest::newRow("CIELab has no factors") << QStringList{"--formula", "CIELab", "--precision", "2"} << 0
                                           << "CIELab dE=" + QString::number(ColorDifferenceFormulas::cie76(s, t).dE, 'f', 2) + " ";
    QTest::newRow("l:c with one number") << QStringList{"--formula", "CMC", "--lc", "2"} << 2
                                         << "--lc wants two positive numbers joined by ':' (got \"2\")";
    QTest::newRow("l:c of zero") << QStringList{"--formula", "CMC", "--lc", "0:1"} << 2 << "--lc wants two";
    QTest::newRow("l:c for CIEDE2000") << QStringList{"--lc", "2:1"} << 2 << "--lc sets CMC's l:c";
    QTest::newRow("precision too high") << QStringList{"--precision", "40"} << 2
                                        << "--precision wants a number of decimals from 0 to 15";
    QTest::newRow("unknown formula") << QStringList{"--formula", "CIE2001"} << 2 << "Unknown formula \"CIE2001\"";
}

void tst_VexaTool::colourDifferenceNamesItsFactors()
{
    QFETCH(QStringList, options);
    QFETCH(int, exitCode);
    QFETCH(QString, expected);
    const Result r = runTool(QStringList{"de", "50", "20", "10", "52", "21", "11.5"} + options);
    QCOMPARE(r.exitCode, exitCode);
    const QString text = exitCode == 0 ? r.out : r.err;
    QVERIFY2(text.startsWith(expected), qPrintable(text + " does not start with " + expected));
}

void tst_VexaTool::judgeRefusesAToleranceThatCannotJudge()
{
    auto write = [this](const QString &name, const BaseObject &object) {
        const QString path = m_dir.filePath(name);
        QFile f(path);
        f.open(QIODevice::WriteOnly);
        f.write(object.serialize());
        return path;
    };
    auto standard = std::make_shared<Trial>();
    standard->setAppearanceValues(std::make_shared<AppearanceValues>());
    auto lab = std::make_shared<LabValue>(50.0, 20.0, 10.0);
    lab->setGeometry(Geometry("45as45"));
    standard->appearanceValues()->addColorValues(lab);
    auto far = std::make_shared<Trial>();
    far->setAppearanceValues(std::make_shared<AppearanceValues>());
    auto farLab = std::make_shared<LabValue>(70.0, 20.0, 10.0);
    farLab->setGeometry(Geometry("45as45"));
    far->appearanceValues()->addColorValues(farLab);
    const auto set = ToleranceFactory::toleranceFactory()->createToleranceSet("CIEDE2000", "Broken", {Geometry("45as45")});
    set->tolerances().front()->toleranceValue("dE")->setValue(-1.0);
    const Result r = runTool({"judge", write("standard.json", *standard), write("far.json", *far), write("broken.json", *set)});
    // A negative limit used to pass a trial 20 ΔE away; now it refuses to judge and says why.
    QCOMPARE(r.exitCode, 2);
    QVERIFY2(!r.out.contains("PASS"), qPrintable(r.out));
    QVERIFY2(r.err.contains("the limit dE is negative (-1)"), qPrintable(r.err));
}

QTEST_GUILESS_MAIN(tst_VexaTool)
#include "tst_vexatool.moc"
