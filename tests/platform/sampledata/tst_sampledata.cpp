#include <sampledata/sampledata.h>

#include <domain/appearancevalues.h>
#include <domain/geometry.h>
#include <domain/reflectancespectrum.h>
#include <domain/standard.h>
#include <domain/colorimetriccondition.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>

#include <tolerances/tolerancefactory.h>

#include <store/objectcodec.h>
#include <store/sqliteobjectstore.h>

#include <QCryptographicHash>
#include <QTemporaryDir>
#include <QtTest>

using namespace vexa;

class tst_SampleData : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void isDeterministic();
    void counts_data();
    void counts();
    void spectraArePlausible();
    void verdictsAreMixed();

private:
    QByteArray fingerprint(const QString &file);
    QTemporaryDir m_dir;
    std::unique_ptr<SqliteObjectStore> m_store;
    QHash<QString, int> m_types;
    std::vector<StoreRecord> m_records;
};

QByteArray tst_SampleData::fingerprint(const QString &file)
{
    SqliteObjectStore store(m_dir.filePath(file));
    ErrorInfo error;
    if (!store.open(&error) || !SampleData::populate(store, &error))
        return error.toString().toUtf8();
    QCryptographicHash hash(QCryptographicHash::Sha256);
    store.visitAll(
        [&](const StoreRecord &r) {
            hash.addData((r.id + r.uuid + r.type + r.parentId + r.name).toUtf8());
            hash.addData(r.header);
            hash.addData(r.data);
            return true;
        },
        nullptr);
    return hash.result().toHex();
}

void tst_SampleData::initTestCase()
{
    m_store = std::make_unique<SqliteObjectStore>(m_dir.filePath(QStringLiteral("sample.db")));
    ErrorInfo error;
    QVERIFY(m_store->open(&error));
    QVERIFY2(SampleData::populate(*m_store, &error), qPrintable(error.toString() + error.internalMessage()));
    m_store->visitAll(
        [&](const StoreRecord &r) {
            ++m_types[r.type];
            m_records.push_back(r);
            return true;
        },
        nullptr);
}

void tst_SampleData::isDeterministic()
{
    const QByteArray first = fingerprint(QStringLiteral("one.db"));
    QCOMPARE(first.size(), 64);
    QCOMPARE(fingerprint(QStringLiteral("two.db")), first);
}

void tst_SampleData::counts_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<int>("count");
    QTest::newRow("folders") << "Folder" << 8; // five top-level folders and one trial folder per standard
    QTest::newRow("standards") << "Standard" << 3;
    QTest::newRow("trials") << "Trial" << 3 * SampleData::TrialsPerStandard;
    QTest::newRow("jobs") << "QCJob" << 3;
    QTest::newRow("job templates") << "QCJobTemplate" << 1;
    QTest::newRow("tolerance sets") << "ToleranceSet" << 4;
    QTest::newRow("colorants") << "Colorant" << 7;
    QTest::newRow("formulas") << "Formula" << 3;
    QTest::newRow("recipe trials") << "RecipeTrial" << 6; // a first trial and one correction per formula
}

void tst_SampleData::counts()
{
    QFETCH(QString, type);
    QFETCH(int, count);
    QCOMPARE(m_types.value(type), count);
}

void tst_SampleData::spectraArePlausible()
{
    int metallics = 0;
    for (const StoreRecord &record : m_records) {
        if (record.type != QLatin1String("Standard") && record.type != QLatin1String("Trial"))
            continue;
        ErrorInfo error;
        auto object = ObjectCodec::fromRecord(record, &error);
        QVERIFY2(object, qPrintable(error.internalMessage()));
        std::shared_ptr<AppearanceValues> values;
        if (auto s = std::dynamic_pointer_cast<Standard>(object))
            values = s->appearanceValues();
        else
            values = std::dynamic_pointer_cast<Trial>(object)->appearanceValues();
        QVERIFY(values);
        QCOMPARE(int(values->colorValues().size()), 6);
        for (const auto &colour : values->colorValues()) {
            auto spectrum = std::dynamic_pointer_cast<ReflectanceSpectrum>(colour);
            QVERIFY(spectrum);
            QCOMPARE(spectrum->spectralValues().size(), 31);
            QCOMPARE(spectrum->startWavelength(), 400.0);
            for (double r : spectrum->spectralValues())
                QVERIFY(r > 0.0 && r <= 1.5);
        }
        if (!values->textureValues().empty()) {
            ++metallics;
            const auto near = values->reflectanceAt(Geometry::toGeometry(QStringLiteral("45as15")));
            const auto far = values->reflectanceAt(Geometry::toGeometry(QStringLiteral("45as110")));
            QVERIFY(near && far);
            QVERIFY(near->spectralValues().at(15) > 2.0 * far->spectralValues().at(15)); // flop
        }
    }
    QCOMPARE(metallics, 2 * (1 + SampleData::TrialsPerStandard));
}

// Every standard's trials must show all three verdicts against its first tolerance set, so
// that the tables and plots have passes, warnings and failures to show.
void tst_SampleData::verdictsAreMixed()
{
    ToleranceFactory::toleranceFactory(); // registers the judging rules
    QHash<QString, std::shared_ptr<BaseObject>> objects;
    for (const StoreRecord &record : m_records) {
        ErrorInfo error;
        objects.insert(record.id, ObjectCodec::fromRecord(record, &error));
    }
    const ColorimetricCondition condition(QStringLiteral("D65"), QStringLiteral("10"));
    QHash<QString, QVector<int>> verdictsByStandard; // standard name -> counts of pass, warning, fail
    for (const auto &object : qAsConst(objects)) {
        const auto trial = std::dynamic_pointer_cast<Trial>(object);
        if (!trial)
            continue;
        QVERIFY(trial->standard());
        const auto standard = std::dynamic_pointer_cast<Standard>(objects.value(trial->standard()->id()));
        QVERIFY(standard && !standard->toleranceSets().empty());
        const auto set = std::dynamic_pointer_cast<ToleranceSet>(objects.value(standard->toleranceSets().front()->id()));
        QVERIFY(set);
        int worst = 0;
        for (const auto &tolerance : set->tolerances())
            worst = std::max(worst, tolerance->status(*trial->appearanceValues(), *standard->appearanceValues(), condition));
        QVERIFY2(worst >= 1 && worst <= 3, qPrintable(trial->name()));
        auto &counts = verdictsByStandard[standard->name()];
        counts.resize(3);
        ++counts[worst - 1];
    }
    QCOMPARE(verdictsByStandard.size(), 3);
    for (auto it = verdictsByStandard.cbegin(); it != verdictsByStandard.cend(); ++it) {
        const QVector<int> &c = it.value();
        QVERIFY2(c[0] >= 10 && c[1] >= 4 && c[2] >= 4,
                 qPrintable(QStringLiteral("%1: %2 pass, %3 warning, %4 fail").arg(it.key()).arg(c[0]).arg(c[1]).arg(c[2])));
    }
}

QTEST_GUILESS_MAIN(tst_SampleData)
#include "tst_sampledata.moc"
