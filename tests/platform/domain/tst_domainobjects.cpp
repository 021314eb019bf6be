#include <domain/appearancevalues.h>
#include <domain/appearancevalueshelper.h>
#include <domain/colorant.h>
#include <domain/domainmetatypes.h>
#include <domain/formula.h>
#include <domain/labchvalue.h>
#include <domain/labvalue.h>
#include <domain/reflectancespectrum.h>
#include <domain/reflection.h>
#include <domain/standard.h>
#include <domain/toleranceruleregistry.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>

#include <QStandardItemModel>
#include <QThread>
#include <QtTest>

#include <atomic>

using namespace vexa;

namespace {

std::shared_ptr<ColorValues> labAt(const char *geometry, double l)
{
    auto lab = std::make_shared<LabValue>(l, 0.0, 0.0);
    lab->setGeometry(Geometry(geometry));
    return lab;
}

// Passes when the trial's L* at the tolerance's geometry is within the "dL" limit.
class LightnessRule : public ToleranceRule
{
public:
    ToleranceJudgement judge(const Tolerance &tolerance, const AppearanceValues &trial, const AppearanceValues &standard,
                             const ColorimetricCondition &) const override
    {
        ToleranceJudgement j;
        const auto t = trial.colorValuesForGeometries({tolerance.geometryValue()});
        const auto s = standard.colorValuesForGeometries({tolerance.geometryValue()});
        if (t.empty() || s.empty())
            return j;
        const double dl = std::static_pointer_cast<LabValue>(t[0])->l() - std::static_pointer_cast<LabValue>(s[0])->l();
        j.colorDifferences = {dl};
        j.differenceNames = QStringList{QStringLiteral("dL")};
        j.normalizedDifference = std::abs(dl) / tolerance.toleranceValue(QStringLiteral("dL"))->valueAsDouble();
        j.status = tolerance.statusOfNormalizedDifference(j.normalizedDifference);
        return j;
    }
};

class ThrowingRule : public ToleranceRule
{
public:
    ToleranceJudgement judge(const Tolerance &, const AppearanceValues &, const AppearanceValues &,
                             const ColorimetricCondition &) const override
    {
        throw std::runtime_error("broken rule");
    }
};

} // namespace

class tst_DomainObjects : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void appearanceValuesLookups();
    void standardMeasurements();
    void toleranceJudgement_data();
    void toleranceJudgement();
    void statusOfNormalizedDifference_data();
    void statusOfNormalizedDifference();
    void toleranceWithoutRuleGivesNoVerdict();
    void ruleRegistryFromThreads();
    void formulaHelpers();
    void labChDerivesChromaAndHue();
    void globalDirEntryTakesTheEntry();
    void metaTypesTravelInDragData();
};

void tst_DomainObjects::appearanceValuesLookups()
{
    AppearanceValues av;
    auto spectrum = std::make_shared<ReflectanceSpectrum>(QVector<double>{0.1, 0.2}, 400, 10);
    spectrum->setGeometry(Geometry("45as15"));
    av.setColorValues({labAt("45as15", 50), spectrum, labAt("45as110", 20), labAt("bad", 1)});

    QCOMPARE(av.reflectanceAt(Geometry("45as15")), spectrum);
    QVERIFY(!av.reflectanceAt(Geometry("45as110")));
    QCOMPARE(av.colorValuesForGeometries({Geometry("45as15")}).size(), size_t(2));

    std::set<Geometry> geometries;
    AppearanceValuesHelper::addGeometriesFromAppearanceValues(av, geometries);
    QCOMPARE(geometries, (std::set<Geometry>{Geometry("45as15"), Geometry("45as110")}));

    av.removeColorValuesOfTypeAndGeometry(QStringLiteral("LabValue"), Geometry("45as15"));
    QCOMPARE(av.colorValues().size(), size_t(3));
    QCOMPARE(av.reflectanceAt(Geometry("45as15")), spectrum);
    QCOMPARE(av.colorValuesForGeometries({Geometry("45as15")}).size(), size_t(1));
}

void tst_DomainObjects::standardMeasurements()
{
    Standard standard;
    QVERIFY(!standard.appearanceValues());
    auto first = std::make_shared<AppearanceValues>();
    auto second = std::make_shared<AppearanceValues>();
    standard.setAppearanceValuesList({first, second});
    QCOMPARE(standard.appearanceValues(), first);
    QCOMPARE(standard.appearanceValues(1), second);
    QVERIFY(!standard.appearanceValues(2));
    QVERIFY(!standard.appearanceValues(-1));
    standard.setAppearanceValues(second);
    QCOMPARE(standard.appearanceValuesList().size(), size_t(1));
}

void tst_DomainObjects::toleranceJudgement_data()
{
    QTest::addColumn<double>("trialL");
    QTest::addColumn<int>("status");
    QTest::newRow("inside the check threshold") << 50.3 << 1;
    QTest::newRow("exactly at the check threshold") << 50.5 << 1;
    QTest::newRow("between check and pass") << 50.9 << 2;
    QTest::newRow("beyond the limit") << 48.0 << 3;
}

void tst_DomainObjects::toleranceJudgement()
{
    QFETCH(double, trialL);
    QFETCH(int, status);
    ToleranceRuleRegistry::instance().registerRule(QStringLiteral("test-dL"), std::make_shared<LightnessRule>());

    ToleranceSet set;
    auto tolerance = std::make_shared<Tolerance>();
    tolerance->setToleranceType(QStringLiteral("test-dL"));
    tolerance->setGeometry(Geometry("45as15"));
    tolerance->setToleranceValues({std::make_shared<ToleranceValue>(QStringLiteral("dL"), QStringLiteral("dL*"), 1.0)});
    tolerance->setCheckThreshold(0.5);
    set.setTolerances({tolerance});
    QCOMPARE(tolerance->passThreshold(), 1.0);

    QVERIFY(!set.toleranceWithGeometry(Geometry("45as45")));
    const auto found = set.toleranceWithGeometry(Geometry("45as15"));
    QCOMPARE(found, tolerance);

    AppearanceValues standard;
    standard.setColorValues({labAt("45as15", 50.0)});
    AppearanceValues trial;
    trial.setColorValues({labAt("45as15", trialL)});
    const ToleranceJudgement j = found->judge(trial, standard, ColorimetricCondition());
    QCOMPARE(j.status, status);
    QCOMPARE(j.colorDifferences.size(), 1);
    QCOMPARE(j.differenceNames, QStringList{QStringLiteral("dL")});
    QCOMPARE(found->status(trial, standard, ColorimetricCondition()), status);

    // Nothing to compare at the geometry: no verdict.
    AppearanceValues empty;
    QCOMPARE(found->judge(empty, standard, ColorimetricCondition()).status, 0);
    ToleranceRuleRegistry::instance().unregisterRule(QStringLiteral("test-dL"));
}

void tst_DomainObjects::statusOfNormalizedDifference_data()
{
    QTest::addColumn<double>("difference");
    QTest::addColumn<int>("status");
    QTest::newRow("inside") << 0.5 << 1;
    QTest::newRow("at the check threshold") << 0.8 << 1;
    QTest::newRow("warning band") << 0.9 << 2;
    QTest::newRow("at the pass threshold") << 1.0 << 2;
    QTest::newRow("outside") << 1.5 << 3;
    QTest::newRow("NaN never passes") << qQNaN() << 3;
    QTest::newRow("infinity") << qInf() << 3;
}

void tst_DomainObjects::statusOfNormalizedDifference()
{
    QFETCH(double, difference);
    QFETCH(int, status);
    Tolerance tolerance; // thresholds 0.8 and 1.0
    QCOMPARE(tolerance.statusOfNormalizedDifference(difference), status);
}

void tst_DomainObjects::toleranceWithoutRuleGivesNoVerdict()
{
    Tolerance tolerance;
    tolerance.setToleranceType(QStringLiteral("no such type"));
    AppearanceValues values;
    const auto j = tolerance.judge(values, values, ColorimetricCondition());
    QCOMPARE(j.status, 0);
    QVERIFY(std::isnan(j.normalizedDifference));

    ToleranceRuleRegistry::instance().registerRule(QStringLiteral("throws"), std::make_shared<ThrowingRule>());
    tolerance.setToleranceType(QStringLiteral("throws"));
    QCOMPARE(tolerance.judge(values, values, ColorimetricCondition()).status, 0);
    ToleranceRuleRegistry::instance().registerRule(QStringLiteral("throws"), nullptr);
    QVERIFY(!ToleranceRuleRegistry::instance().rule(QStringLiteral("throws")));
}

void tst_DomainObjects::ruleRegistryFromThreads()
{
    std::atomic<int> judged{0};
    QVector<QThread *> threads;
    for (int t = 0; t < 4; ++t) {
        threads.append(QThread::create([t, &judged] {
            const QString type = QStringLiteral("thread-%1").arg(t % 2);
            for (int i = 0; i < 500; ++i) {
                ToleranceRuleRegistry::instance().registerRule(type, std::make_shared<LightnessRule>());
                if (ToleranceRuleRegistry::instance().rule(type))
                    ++judged;
                ToleranceRuleRegistry::instance().toleranceTypes();
            }
        }));
        threads.last()->start();
    }
    for (QThread *thread : threads) {
        QVERIFY(thread->wait(30000));
        delete thread;
    }
    QCOMPARE(judged.load(), 2000);
}

void tst_DomainObjects::formulaHelpers()
{
    auto red = std::make_shared<Colorant>();
    red->setName(QStringLiteral("Red"));
    red->setDisplayRGB(RGBValue(200, 10, 20));
    auto clear = std::make_shared<Colorant>();
    clear->setType(QLatin1String(ColorantType::Clear));
    Formula formula;
    formula.setIngredients({std::make_shared<Ingredient>(red, 12.5), std::make_shared<Ingredient>(clear, 87.5)});
    QCOMPARE(formula.calculatedTotalAmount(), 100.0);
    QCOMPARE(formula.colorantWithID(red->id()), red);
    QVERIFY(!formula.colorantWithID(QStringLiteral("nope")));
    QCOMPARE(formula.ingredientWithMatchingColorantId(clear->id())->concentration(), 87.5);
    QVERIFY(clear->type() == QLatin1String(ColorantType::Clear));
    QCOMPARE(red->displayRGB().R(), static_cast<unsigned char>(200));
}

void tst_DomainObjects::labChDerivesChromaAndHue()
{
    LabValue lab(50, 3, -4);
    lab.setGeometry(Geometry("45as45"));
    const LabChValue labCh(lab);
    QCOMPARE(labCh.c(), 5.0);
    QVERIFY(qAbs(labCh.h() - 306.86989764584405) < 1e-9);
    QCOMPARE(labCh.lab().values(), lab.values());
    QCOMPARE(labCh.physicalCondition().geometryValue(), Geometry("45as45"));
    QVERIFY(LabValue().isEmpty());
    QVERIFY(!LabValue().isValid());
    QVERIFY(!LabValue(1, qQNaN(), 2).isValid());
}

void tst_DomainObjects::globalDirEntryTakesTheEntry()
{
    auto trial = std::make_shared<Trial>();
    trial->setName(QStringLiteral("Hood"));
    DirEntry entry;
    entry.setEntryInfo(*trial);
    entry.setParentFolderId(QStringLiteral("folder-1"));
    QCOMPARE(entry.entryObjectId(), trial->id());
    QCOMPARE(entry.entryObjectType(), QStringLiteral("Trial"));
    QCOMPARE(entry.header().name(), QStringLiteral("Hood"));

    GlobalDirEntry global;
    global.setDispatcherID(QStringLiteral("local"));
    global.setDirEntry(entry);
    QCOMPARE(global.id(), entry.id());
    QCOMPARE(global.entryObjectId(), trial->id());
    QCOMPARE(global.parentFolderId(), QStringLiteral("folder-1"));
    QCOMPARE(global.header().name(), QStringLiteral("Hood"));
    QCOMPARE(global.dispatcherID(), QStringLiteral("local"));
}

void tst_DomainObjects::metaTypesTravelInDragData()
{
    registerDomainMetaTypes();
    registerDomainMetaTypes();
    QVERIFY(QMetaType::type("std::shared_ptr<vexa::BaseObject>") != QMetaType::UnknownType);
    QVERIFY(QMetaType::type("std::shared_ptr<vexa::GlobalDirEntry>") != QMetaType::UnknownType);

    auto trial = std::make_shared<Trial>();
    trial->setName(QStringLiteral("Dragged"));
    auto entry = std::make_shared<GlobalDirEntry>();
    entry->setStringPath({QStringLiteral("Root"), QStringLiteral("Jobs")});

    QStandardItemModel source(1, 2);
    source.setData(source.index(0, 0), QVariant::fromValue(std::static_pointer_cast<BaseObject>(trial)), Qt::UserRole);
    source.setData(source.index(0, 1), QVariant::fromValue(entry), Qt::UserRole);
    std::unique_ptr<QMimeData> mime(source.mimeData({source.index(0, 0), source.index(0, 1)}));
    QVERIFY(mime->hasFormat(QStringLiteral("application/x-qabstractitemmodeldatalist")));

    QStandardItemModel target;
    QVERIFY(target.dropMimeData(mime.get(), Qt::CopyAction, 0, 0, QModelIndex()));
    const auto object = target.index(0, 0).data(Qt::UserRole).value<std::shared_ptr<BaseObject>>();
    QVERIFY(object);
    QCOMPARE(object->id(), trial->id());
    QCOMPARE(std::dynamic_pointer_cast<Trial>(object)->name(), QStringLiteral("Dragged"));
    const auto droppedEntry = target.index(0, 1).data(Qt::UserRole).value<std::shared_ptr<GlobalDirEntry>>();
    QVERIFY(droppedEntry);
    QCOMPARE(droppedEntry->stringPath(), entry->stringPath());

    // A corrupt payload reads as null, not as half an object.
    QByteArray bytes;
    {
        QDataStream out(&bytes, QIODevice::WriteOnly);
        out << QByteArray("{\"format\": 2, \"type\": \"Trial\", \"object\": {\"version\": \"x\"}}");
    }
    QDataStream in(bytes);
    std::shared_ptr<BaseObject> read = trial;
    in >> read;
    QVERIFY(!read);
    QCOMPARE(in.status(), QDataStream::ReadCorruptData);
}

QTEST_MAIN(tst_DomainObjects)
#include "tst_domainobjects.moc"
