#include "fixtures.h"

#include <vexa/models/trialselectionmodel.h>

#include <colorimetry/colorconverter.h>
#include <colorimetry/colordifferencecalculator.h>
#include <domain/labvalue.h>
#include <domain/tagdefinition.h>
#include <domain/tagvalue.h>
#include <domain/texturevalues.h>
#include <sampledata/sampledata.h>
#include <store/objectcodec.h>
#include <store/sqliteobjectstore.h>

#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

#include <map>

using namespace vexa;

namespace {

// Records every signal of the model, in emission order, as one list.
class SignalLog : public QObject
{
public:
    explicit SignalLog(TrialSelectionModel &m)
    {
        using S = TrialSelectionModel;
        connect(&m, &S::sgTrialSelectionChanged, this, [this] { lines << "selection"; });
        connect(&m, &S::sgActiveTrialsChanged, this, [this] { lines << "active"; });
        connect(&m, &S::sgColorGeometrySelectionChanged, this, [this] { lines << "colorGeometry"; });
        connect(&m, &S::sgColorGeometryFilterChanged, this, [this] { lines << "colorFilter"; });
        connect(&m, &S::sgTextureGeometrySelectionChanged, this, [this] { lines << "textureGeometry"; });
        connect(&m, &S::sgTextureGeometryFilterChanged, this, [this] { lines << "textureFilter"; });
        connect(&m, &S::sgStandardGeometryChanged, this,
                [this](const Geometry &g) { lines << "standardGeometry(" + g.toString() + ")"; });
    }
    QStringList lines;
};

std::set<Geometry> geometrySet(const QString &text)
{
    std::set<Geometry> set;
    if (text == "-")
        return set;
    for (const QString &g : text.split(';'))
        set.insert(Geometry(g));
    return set;
}

// The trial nearest to the mean colour by CIEDE2000 under D65/10, averaged over the
// given geometries, computed the long way.
QString bruteForceMedian(const std::vector<std::shared_ptr<Trial>> &trials, const QVector<Geometry> &geometries)
{
    const ColorimetricCondition d65(QStringLiteral("D65"), QStringLiteral("10"));
    std::map<Geometry, std::array<double, 3>> mean;
    for (const auto &t : trials)
        for (const Geometry &g : geometries) {
            const LabValue lab = ColorConverter::toLabValue(*t->appearanceValues(), g, d65);
            auto &m = mean[g];
            m[0] += lab.l() / trials.size();
            m[1] += lab.a() / trials.size();
            m[2] += lab.b() / trials.size();
        }
    QString nearest;
    double best = 1e9;
    for (const auto &t : trials) {
        double sum = 0;
        for (const Geometry &g : geometries) {
            const auto &m = mean[g];
            sum += ColorDifferenceCalculator::Default_DE("CIE2000", LabValue(m[0], m[1], m[2], d65),
                                                         ColorConverter::toLabValue(*t->appearanceValues(), g, d65),
                                                         1, 1, 1);
        }
        if (sum / geometries.size() < best) {
            best = sum / geometries.size();
            nearest = t->name();
        }
    }
    return nearest;
}

} // namespace

class tst_TrialSelectionModel : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void initTestCase();
    void init();
    void defaults();
    void signalSequences_data();
    void signalSequences();
    void copyKeepsEveryField();
    void groupsByTagValue();
    void medianIsNearestToMean();
    void medianEdgeCases();
    void medianAndAverageOfSampleData();
    void averageIsElementwiseMean();
    void averageSkipsMismatchedLayouts();

private:
    void run(TrialSelectionModel &model, const QString &script);
    QString state(const TrialSelectionModel &model) const;
    std::map<QString, std::shared_ptr<Trial>> m_trials;
};

void tst_TrialSelectionModel::initTestCase()
{
    qRegisterMetaType<vexa::Geometry>();
}

void tst_TrialSelectionModel::init()
{
    m_trials.clear();
    m_trials["A"] = fixtures::trial("A", 0.20);
    m_trials["B"] = fixtures::trial("B", 0.22);
    m_trials["C"] = fixtures::trial("C", 0.24);
}

// A tiny script: operations separated by '|', e.g. "act A,B|sel B|tog A".
void tst_TrialSelectionModel::run(TrialSelectionModel &model, const QString &script)
{
    auto trials = [this](const QString &list) {
        std::vector<std::shared_ptr<Trial>> v;
        if (list != "-")
            for (const QString &n : list.split(','))
                v.push_back(m_trials.at(n));
        return v;
    };
    for (const QString &op : script.split('|', Qt::SkipEmptyParts)) {
        const QString verb = op.section(' ', 0, 0);
        const QString arg = op.section(' ', 1);
        if (verb == "sel")
            model.setSelectedTrial(arg == "-" ? nullptr : m_trials.at(arg));
        else if (verb == "act")
            model.setActiveTrials(trials(arg));
        else if (verb == "actf")
            model.setActiveTrials(trials(arg), true);
        else if (verb == "tog")
            model.toggleActiveTrial(m_trials.at(arg));
        else if (verb == "clearTrials")
            model.clearTrials();
        else if (verb == "clear")
            model.clear();
        else if (verb == "group")
            model.setGroupProperty(nullptr);
        else if (verb == "cg")
            model.setSelectedColorGeometry(Geometry(arg));
        else if (verb == "tg")
            model.setSelectedTextureGeometry(Geometry(arg));
        else if (verb == "sg")
            model.setSelectedStandardGeometry(Geometry(arg));
        else if (verb == "cf")
            model.setColorGeometryFilter(geometrySet(arg));
        else if (verb == "tf")
            model.setTextureGeometryFilter(geometrySet(arg));
        else
            QFAIL(qPrintable("unknown op " + op));
    }
}

QString tst_TrialSelectionModel::state(const TrialSelectionModel &model) const
{
    auto nameOf = [](const std::shared_ptr<Trial> &t) { return t ? t->name() : QStringLiteral("-"); };
    QStringList active;
    for (const auto &t : model.activeTrials())
        active << nameOf(t);
    return QStringLiteral("sel=%1 act=%2 cg=%3 tg=%4 sg=%5")
        .arg(nameOf(model.selectedTrial()), active.isEmpty() ? "-" : active.join(','),
             model.selectedColorGeometry().toString(), model.selectedTextureGeometry().toString(),
             model.selectedStandardGeometry().toString());
}

void tst_TrialSelectionModel::defaults()
{
    TrialSelectionModel model;
    QCOMPARE(state(model), QStringLiteral("sel=- act=- cg=45as45 tg=15as15 sg=45as45"));
    QVERIFY(model.colorGeometryFilter().empty());
    QVERIFY(model.textureGeometryFilter().empty());
    QVERIFY(!model.groupProperty());
    // The standard geometry is a property of the meta-object, with its change signal.
    const int index = model.metaObject()->indexOfProperty("selectedStandardGeometry");
    QVERIFY(index >= 0);
    QVERIFY(model.metaObject()->property(index).hasNotifySignal());
}

void tst_TrialSelectionModel::signalSequences_data()
{
    QTest::addColumn<QString>("setup");
    QTest::addColumn<QString>("action");
    QTest::addColumn<QStringList>("signals");
    QTest::addColumn<QString>("after");

    const QString base = "cg=45as45 tg=15as15 sg=45as45";
    QTest::newRow("select") << "" << "sel A" << QStringList{"selection"} << "sel=A act=- " + base;
    QTest::newRow("select same trial again") << "sel A" << "sel A" << QStringList{} << "sel=A act=- " + base;
    QTest::newRow("select null") << "sel A" << "sel -" << QStringList{"selection"} << "sel=- act=- " + base;
    QTest::newRow("activate selects the head") << "" << "act A,B" << QStringList{"active", "selection"}
                                               << "sel=A act=A,B " + base;
    QTest::newRow("activating B,A moves the selection off A") << "act A,B" << "act B,A"
                                                              << QStringList{"active", "selection"}
                                                              << "sel=B act=B,A " + base;
    QTest::newRow("same list is silent") << "act A,B" << "act A,B" << QStringList{} << "sel=A act=A,B " + base;
    QTest::newRow("forced same list, head already selected") << "act A,B" << "actf A,B" << QStringList{"active"}
                                                             << "sel=A act=A,B " + base;
    QTest::newRow("forced same list moves the selection to the head")
        << "act A,B|sel B" << "actf A,B" << QStringList{"active", "selection"} << "sel=A act=A,B " + base;
    QTest::newRow("emptying clears the selection") << "act A,B" << "act -" << QStringList{"active", "selection"}
                                                   << "sel=- act=- " + base;
    QTest::newRow("emptying without selection") << "" << "actf -" << QStringList{"active"} << "sel=- act=- " + base;
    QTest::newRow("toggle off keeps the selection") << "act A,B" << "tog A" << QStringList{"active"}
                                                    << "sel=A act=B " + base;
    QTest::newRow("toggle twice moves to the end") << "act A,B,C" << "tog A|tog A"
                                                   << QStringList{"active", "active"} << "sel=A act=B,C,A " + base;
    QTest::newRow("clearTrials with a selection") << "act A,B" << "clearTrials" << QStringList{"selection"}
                                                  << "sel=- act=- " + base;
    QTest::newRow("clear without a selection is silent") << "act A|sel -" << "clear" << QStringList{}
                                                         << "sel=- act=- " + base;
    QTest::newRow("group always announces") << "" << "group|group" << QStringList{"active", "active"}
                                            << "sel=- act=- " + base;
    QTest::newRow("colour geometry") << "" << "cg 45as15" << QStringList{"colorGeometry"}
                                     << "sel=- act=- cg=45as15 tg=15as15 sg=45as45";
    QTest::newRow("same colour geometry is silent") << "" << "cg 45as45" << QStringList{} << "sel=- act=- " + base;
    QTest::newRow("texture geometry") << "" << "tg 45as15" << QStringList{"textureGeometry"}
                                      << "sel=- act=- cg=45as45 tg=45as15 sg=45as45";
    QTest::newRow("standard geometry carries the geometry")
        << "" << "sg 45as110|sg 45as110" << QStringList{"standardGeometry(45as110)"}
        << "sel=- act=- cg=45as45 tg=15as15 sg=45as110";
    QTest::newRow("one-geometry filter selects it") << "" << "cf 45as15"
                                                    << QStringList{"colorGeometry", "colorFilter"}
                                                    << "sel=- act=- cg=45as15 tg=15as15 sg=45as45";
    QTest::newRow("two-geometry filter selects 45as45 even over a member")
        << "cg 45as110" << "cf 45as15;45as110" << QStringList{"colorGeometry", "colorFilter"}
        << "sel=- act=- " + base;
    QTest::newRow("same filter is silent") << "cf 45as15;45as110" << "cf 45as110;45as15" << QStringList{}
                                           << "sel=- act=- " + base;
    QTest::newRow("clearing the filter") << "cf 45as15" << "cf -" << QStringList{"colorGeometry", "colorFilter"}
                                         << "sel=- act=- " + base;
    QTest::newRow("texture filter") << "" << "tf 45as15" << QStringList{"textureGeometry", "textureFilter"}
                                    << "sel=- act=- cg=45as45 tg=45as15 sg=45as45";
    QTest::newRow("texture filter of two resets to 15as15")
        << "tf 45as15" << "tf 45as15;15as15" << QStringList{"textureGeometry", "textureFilter"}
        << "sel=- act=- " + base;
}

void tst_TrialSelectionModel::signalSequences()
{
    QFETCH(QString, setup);
    QFETCH(QString, action);
    QFETCH(QStringList, signals);
    QFETCH(QString, after);

    TrialSelectionModel model;
    run(model, setup);
    SignalLog log(model);
    run(model, action);
    QCOMPARE(log.lines, signals);
    QCOMPARE(state(model), after);
}

void tst_TrialSelectionModel::copyKeepsEveryField()
{
    TrialSelectionModel model;
    run(model, "act A,B|sel B|cf 45as15|tf 45as15;15as15|sg 45as110");
    const TrialSelectionModel copy(model);
    QCOMPARE(state(copy), state(model));
    QCOMPARE(copy.colorGeometryFilter(), model.colorGeometryFilter());
    QCOMPARE(copy.textureGeometryFilter(), model.textureGeometryFilter());
    QVERIFY(copy.isActive(m_trials["A"]));
    QVERIFY(!copy.isActive(m_trials["C"]));
    // Identity, not content: an equal trial object is not active.
    QVERIFY(!copy.isActive(fixtures::trial("A", 0.20)));
}

void tst_TrialSelectionModel::groupsByTagValue()
{
    auto definition = std::make_shared<TagDefinition>();
    definition->setId("tag-batch");
    auto tagFor = [&](const std::shared_ptr<Trial> &trial, const QString &value) {
        auto tag = std::make_shared<TagValue>();
        tag->setTagDefinitionId(definition->id());
        tag->setValue(value);
        trial->setTagValues({tag});
        return tag;
    };
    const auto tagA = tagFor(m_trials["A"], "batch 1");
    const auto tagB = tagFor(m_trials["B"], "batch 2");

    TrialSelectionModel model;
    run(model, "act A,B,C");
    QSignalSpy spy(&model, &TrialSelectionModel::sgActiveTrialsChanged);
    model.setGroupProperty(definition);
    QCOMPARE(spy.count(), 1);
    const auto groups = model.activeTrialsByGroup();
    QCOMPARE(groups.size(), size_t(3));
    QCOMPARE(groups.find(tagA)->second, m_trials["A"]);
    QCOMPARE(groups.find(tagB)->second, m_trials["B"]);
    QCOMPARE(groups.find(nullptr)->second, m_trials["C"]); // C carries no value of the tag
}

void tst_TrialSelectionModel::medianIsNearestToMean()
{
    // Trials at different distances from a common centre, in a scrambled order.
    std::vector<std::shared_ptr<Trial>> trials;
    const double bases[] = {0.31, 0.18, 0.27, 0.22, 0.40, 0.24, 0.12};
    for (int i = 0; i < 7; ++i)
        trials.push_back(fixtures::trial(QStringLiteral("T%1").arg(i), bases[i], fixtures::threeAngles(),
                                         530 + 5 * i));

    const QString expected = bruteForceMedian(trials, Geometry::geometriesMultiAngleSimple());

    TrialSelectionModel model;
    // The page's filter does not change which geometries take part when it names them all.
    model.setColorGeometryFilter({Geometry("45as15"), Geometry("45as45"), Geometry("45as110")});
    const auto median = model.getMedianAppearanceValue(trials);
    QVERIFY(median);
    QCOMPARE(median->name(), expected);
    // It is a copy, not the trial's own values.
    for (const auto &t : trials)
        QVERIFY(median.get() != t->appearanceValues().get());

    model.setActiveTrials(trials);
    QCOMPARE(model.getActiveTrialsMedianAppearanceValue()->name(), expected);
}

void tst_TrialSelectionModel::medianEdgeCases()
{
    TrialSelectionModel model;
    QVERIFY(!model.getMedianAppearanceValue({}));
    QVERIFY(!model.averagedTrialMeasurements({}));

    // One trial: a copy of its values.
    const auto one = model.getMedianAppearanceValue({m_trials["A"]});
    QVERIFY(one);
    QCOMPARE(one->name(), QStringLiteral("A"));
    QCOMPARE(one->colorValues().size(), m_trials["A"]->appearanceValues()->colorValues().size());

    // No trial has values at any evaluated geometry: no median.
    auto empty = std::make_shared<Trial>();
    empty->setAppearanceValues(std::make_shared<AppearanceValues>());
    auto bare = std::make_shared<Trial>();
    QVERIFY(!model.getMedianAppearanceValue({empty, bare}));
    // A filter naming a geometry nobody measured: no median either.
    model.setColorGeometryFilter({Geometry("15as80")});
    QVERIFY(!model.getMedianAppearanceValue({m_trials["A"], m_trials["B"]}));
}

// The 30 trials of the sample store's silver metallic, six geometries each.
void tst_TrialSelectionModel::medianAndAverageOfSampleData()
{
    QTemporaryDir dir;
    SqliteObjectStore store(dir.filePath("sample.vexastore"));
    ErrorInfo error;
    QVERIFY(store.open(&error));
    QVERIFY(SampleData::populate(store, &error));
    std::vector<std::shared_ptr<Trial>> trials;
    store.visitAll(
        [&](const StoreRecord &record) {
            if (record.type == Trial::typeId() && record.name.startsWith("Silver Metallic"))
                trials.push_back(std::dynamic_pointer_cast<Trial>(ObjectCodec::fromRecord(record, &error)));
            return true;
        },
        &error);
    QCOMPARE(trials.size(), size_t(SampleData::TrialsPerStandard));

    TrialSelectionModel model;
    const auto median = model.getMedianAppearanceValue(trials);
    QVERIFY(median);
    // The copy keeps the ids of the median trial's values (their name is empty in the sample data).
    const QString expected = bruteForceMedian(trials, Geometry::geometries(GeometrySet::MultiAngle));
    const auto medianTrial = std::find_if(trials.begin(), trials.end(),
                                          [&](const std::shared_ptr<Trial> &t) { return t->name() == expected; });
    QVERIFY(medianTrial != trials.end());
    QCOMPARE(median->id(), (*medianTrial)->appearanceValues()->id());
    QVERIFY(median.get() != (*medianTrial)->appearanceValues().get());

    // The average: elementwise mean of the spectra at every position; the median's texture.
    const auto averaged = model.averagedTrialMeasurements(trials);
    QVERIFY(averaged);
    QCOMPARE(averaged->colorValues().size(), size_t(6));
    for (size_t k = 0; k < 6; ++k) {
        const auto avg = std::dynamic_pointer_cast<ReflectanceSpectrum>(averaged->colorValues()[k]);
        for (int i = 0; i < avg->spectralValues().size(); i += 7) {
            double sum = 0;
            for (const auto &t : trials)
                sum += std::dynamic_pointer_cast<ReflectanceSpectrum>(t->appearanceValues()->colorValues()[k])
                           ->spectralValues()[i];
            QVERIFY(std::abs(avg->spectralValues()[i] - sum / trials.size()) < 1e-12);
        }
    }
    QCOMPARE(averaged->textureValues().size(), median->textureValues().size());
}

void tst_TrialSelectionModel::averageIsElementwiseMean()
{
    auto texture = std::make_shared<TextureValues>();
    m_trials["B"]->appearanceValues()->setTextureValues({texture});

    TrialSelectionModel model;
    const std::vector<std::shared_ptr<Trial>> trials{m_trials["A"], m_trials["B"], m_trials["C"]};
    const auto averaged = model.averagedTrialMeasurements(trials);
    QVERIFY(averaged);
    QCOMPARE(averaged->colorValues().size(), size_t(3));
    for (size_t k = 0; k < 3; ++k) {
        const auto avg = std::dynamic_pointer_cast<ReflectanceSpectrum>(averaged->colorValues()[k]);
        QVERIFY(avg);
        QVector<double> expected(31, 0.0);
        for (const auto &t : trials) {
            const auto s = std::dynamic_pointer_cast<ReflectanceSpectrum>(t->appearanceValues()->colorValues()[k]);
            for (int i = 0; i < 31; ++i)
                expected[i] += s->spectralValues()[i] / 3.0;
        }
        for (int i = 0; i < 31; ++i)
            QVERIFY(qFuzzyCompare(avg->spectralValues()[i], expected[i]));
        QCOMPARE(avg->startWavelength(), 400.0);
        QCOMPARE(avg->wavelengthInterval(), 10.0);
        QCOMPARE(avg->geometry(), Geometry(fixtures::threeAngles()[int(k)]));
    }
    // Texture comes from the median trial (B sits between A and C), never averaged.
    QCOMPARE(averaged->textureValues().size(), size_t(1));

    // One trial: its spectra unchanged.
    const auto single = model.averagedTrialMeasurements({m_trials["A"]});
    const auto s0 = std::dynamic_pointer_cast<ReflectanceSpectrum>(single->colorValues()[0]);
    const auto a0 = std::dynamic_pointer_cast<ReflectanceSpectrum>(m_trials["A"]->appearanceValues()->colorValues()[0]);
    QCOMPARE(s0->spectralValues(), a0->spectralValues());
}

void tst_TrialSelectionModel::averageSkipsMismatchedLayouts()
{
    // C has a longer layout (four geometries) and a spectrum of another length at the first position.
    auto odd = fixtures::trial("odd", 0.3, {"45as15", "45as45", "45as110", "45as25"});
    auto first = std::dynamic_pointer_cast<ReflectanceSpectrum>(odd->appearanceValues()->colorValues()[0]);
    first->setSpectralValues(QVector<double>(16, 0.5));
    first->setWavelengthInterval(20);

    TrialSelectionModel model;
    const auto averaged = model.averagedTrialMeasurements({m_trials["A"], odd, m_trials["B"]});
    QVERIFY(averaged);
    // The first trial fixes the layout: three positions, 31 values each.
    QCOMPARE(averaged->colorValues().size(), size_t(3));
    const auto p0 = std::dynamic_pointer_cast<ReflectanceSpectrum>(averaged->colorValues()[0]);
    QCOMPARE(p0->spectralValues().size(), 31);
    // Position 0 averages A and B only; the odd spectrum was left out, not read out of bounds.
    const auto a = std::dynamic_pointer_cast<ReflectanceSpectrum>(m_trials["A"]->appearanceValues()->colorValues()[0]);
    const auto b = std::dynamic_pointer_cast<ReflectanceSpectrum>(m_trials["B"]->appearanceValues()->colorValues()[0]);
    QVERIFY(qFuzzyCompare(p0->spectralValues()[5], (a->spectralValues()[5] + b->spectralValues()[5]) / 2));
}

QTEST_GUILESS_MAIN(tst_TrialSelectionModel)
#include "tst_trialselectionmodel.moc"
