#include "fixtures.h"

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/geometryprovider.h>
#include <vexa/models/trialselectionmodel.h>

#include <domain/labvalue.h>
#include <domain/qcjob.h>
#include <domain/qcjobtemplate.h>

#include <QtTest>

using namespace vexa;

namespace {

class SignalLog : public QObject
{
public:
    explicit SignalLog(AppearanceViewDataModel &m)
    {
        using M = AppearanceViewDataModel;
        connect(&m, &M::sgQCJobChanged, this, [this] { lines << "job"; });
        connect(&m, &M::sgStandardChanged, this, [this] { lines << "standard"; });
        connect(&m, &M::sgToleranceSetChanged, this, [this] { lines << "tolerance"; });
        connect(&m, &M::sgTrialsChanged, this, [this] { lines << "trials"; });
        connect(&m, &M::sgColorimetricConditionChanged, this, [this] { lines << "condition"; });
        connect(&m, &M::sgJobTemplateChanged, this, [this] { lines << "template"; });
    }
    QStringList lines;
};

QStringList names(const std::vector<std::shared_ptr<ToleranceSet>> &sets)
{
    QStringList n;
    for (const auto &s : sets)
        n << (s ? s->name() : "-");
    return n;
}

} // namespace

class tst_AppearanceViewDataModel : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void init();
    void signalSequences_data();
    void signalSequences();
    void toleranceSetsInForce_data();
    void toleranceSetsInForce();
    void userChoiceAmongSeveralSets();
    void conversionsUseTheModelsCondition();
    void copyKeepsEveryField();
    void toleranceGeometryProvider();
    void selectorGeometryProvider();

private:
    void run(AppearanceViewDataModel &model, const QString &script);

    std::map<QString, std::shared_ptr<Trial>> m_trials;
    std::map<QString, std::shared_ptr<Standard>> m_standards;
    std::map<QString, std::shared_ptr<ToleranceSet>> m_sets;
    std::shared_ptr<QCJob> m_job;
    std::shared_ptr<QCJobTemplate> m_template;
};

void tst_AppearanceViewDataModel::init()
{
    m_trials = {{"A", fixtures::trial("A", 0.2)}, {"B", fixtures::trial("B", 0.25)}};
    for (const char *n : {"S1", "S2", "D1", "D2", "T1"})
        m_sets[n] = fixtures::toleranceSet(n, fixtures::threeAngles());
    m_standards["none"] = fixtures::standard("no sets", 0.2);
    m_standards["one"] = fixtures::standard("one set", 0.2);
    m_standards["one"]->setToleranceSets({m_sets["S1"]});
    m_standards["two"] = fixtures::standard("two sets", 0.2);
    m_standards["two"]->setToleranceSets({m_sets["S1"], m_sets["S2"]});
    m_job = std::make_shared<QCJob>();
    m_template = std::make_shared<QCJobTemplate>();
    m_template->setToleranceSets({m_sets["T1"]});
}

void tst_AppearanceViewDataModel::run(AppearanceViewDataModel &model, const QString &script)
{
    for (const QString &op : script.split('|', Qt::SkipEmptyParts)) {
        const QString verb = op.section(' ', 0, 0);
        const QString arg = op.section(' ', 1);
        if (verb == "job")
            model.setQcJob(arg == "-" ? nullptr : m_job);
        else if (verb == "std")
            model.setStandard(arg == "-" ? nullptr : m_standards.at(arg));
        else if (verb == "trials") {
            std::vector<std::shared_ptr<Trial>> v;
            if (arg != "-")
                for (const QString &n : arg.split(','))
                    v.push_back(m_trials.at(n));
            model.setTrials(v);
        } else if (verb == "add")
            model.addTrial(m_trials.at(arg));
        else if (verb == "clearTrials")
            model.clearTrials();
        else if (verb == "current")
            model.setCurrentToleranceSet(arg == "-" ? nullptr : m_sets.at(arg));
        else if (verb == "defaults") {
            std::vector<std::shared_ptr<ToleranceSet>> v;
            if (arg != "-")
                for (const QString &n : arg.split(','))
                    v.push_back(m_sets.at(n));
            model.setDefaultTolerances(v);
        } else if (verb == "template")
            model.setJobTemplate(arg == "-" ? nullptr : m_template);
        else if (verb == "condition")
            model.setColorimetricCondition(ColorimetricCondition::fromString(arg));
        else if (verb == "format")
            model.setNameFormat(arg.toStdString());
        else
            QFAIL(qPrintable("unknown op " + op));
    }
}

void tst_AppearanceViewDataModel::signalSequences_data()
{
    QTest::addColumn<QString>("setup");
    QTest::addColumn<QString>("action");
    QTest::addColumn<QStringList>("signals");

    QTest::newRow("new job resets silently") << "std one|trials A,B|template x" << "job x" << QStringList{"job"};
    QTest::newRow("same job is silent") << "job x" << "job x" << QStringList{};
    QTest::newRow("standard with one set makes it current") << "" << "std one"
                                                            << QStringList{"standard", "tolerance"};
    QTest::newRow("standard with one set already current") << "current S1" << "std one"
                                                           << QStringList{"standard"};
    QTest::newRow("standard with two sets clears a choice") << "current S1" << "std two"
                                                            << QStringList{"standard", "tolerance"};
    QTest::newRow("standard with two sets, nothing chosen") << "" << "std two" << QStringList{"standard"};
    QTest::newRow("same standard is silent") << "std one" << "std one" << QStringList{};
    QTest::newRow("trials") << "" << "trials A,B" << QStringList{"trials"};
    QTest::newRow("same trials are silent") << "trials A,B" << "trials A,B" << QStringList{};
    QTest::newRow("reordered trials") << "trials A,B" << "trials B,A" << QStringList{"trials"};
    QTest::newRow("add has no duplicate check") << "trials A" << "add A" << QStringList{"trials"};
    QTest::newRow("clearing an empty list still announces") << "" << "clearTrials" << QStringList{"trials"};
    QTest::newRow("current set") << "" << "current S1|current S1" << QStringList{"tolerance"};
    QTest::newRow("default sets") << "" << "defaults D1,D2|defaults D1,D2" << QStringList{"tolerance"};
    QTest::newRow("template") << "" << "template x|template x" << QStringList{"template"};
    QTest::newRow("same condition still announces") << "" << "condition D65/10|condition D65/10"
                                                    << QStringList{"condition", "condition"};
    QTest::newRow("name format is silent") << "" << "format <Name> <Day>" << QStringList{};
}

void tst_AppearanceViewDataModel::signalSequences()
{
    QFETCH(QString, setup);
    QFETCH(QString, action);
    QFETCH(QStringList, signals);
    AppearanceViewDataModel model(ColorimetricCondition("D65", "10"));
    run(model, setup);
    SignalLog log(model);
    run(model, action);
    QCOMPARE(log.lines, signals);
}

void tst_AppearanceViewDataModel::toleranceSetsInForce_data()
{
    QTest::addColumn<QString>("script");
    QTest::addColumn<QStringList>("inForce");
    QTest::addColumn<QString>("current");

    QTest::newRow("nothing") << "" << QStringList{} << "-";
    QTest::newRow("two defaults") << "defaults D1,D2" << QStringList{"D1", "D2"} << "-";
    QTest::newRow("one default is current whatever was stored") << "defaults D1|current S2"
                                                                << QStringList{"D1"} << "D1";
    QTest::newRow("template beats defaults") << "defaults D1,D2|template x" << QStringList{"T1"} << "T1";
    QTest::newRow("standard without sets falls back to the template")
        << "defaults D1|template x|std none" << QStringList{"T1"} << "T1";
    QTest::newRow("standard beats template") << "template x|std two" << QStringList{"S1", "S2"} << "-";
}

void tst_AppearanceViewDataModel::toleranceSetsInForce()
{
    QFETCH(QString, script);
    QFETCH(QStringList, inForce);
    QFETCH(QString, current);
    AppearanceViewDataModel model(ColorimetricCondition("D65", "10"));
    run(model, script);
    QCOMPARE(names(model.toleranceSets()), inForce);
    QCOMPARE(names({model.currentToleranceSet()}), QStringList{current});
}

void tst_AppearanceViewDataModel::userChoiceAmongSeveralSets()
{
    AppearanceViewDataModel model(ColorimetricCondition("D65", "10"));
    run(model, "std two");
    QVERIFY(!model.currentToleranceSet());
    QVERIFY(!model.tolerance(Geometry("45as45")));
    run(model, "current S2");
    QCOMPARE(model.currentToleranceSet(), m_sets["S2"]);
    QCOMPARE(model.tolerance(Geometry("45as45")), m_sets["S2"]->toleranceWithGeometry(Geometry("45as45")));
    QVERIFY(!model.tolerance(Geometry("45as25")));
}

void tst_AppearanceViewDataModel::conversionsUseTheModelsCondition()
{
    AppearanceViewDataModel model(ColorimetricCondition("D65", "10"));
    run(model, "std one|trials A,B");
    const Geometry g45("45as45");
    const auto d65 = model.standardAsLabValue(g45);
    QVERIFY(d65);
    QVERIFY(!model.standardAsLabValue(Geometry("45as25"))); // not measured there
    QVERIFY(!model.appearanceValueToLab(nullptr, g45));
    QVERIFY(!model.standardAsLabValue(nullptr, g45));

    run(model, "condition A/2");
    const auto a2 = model.standardAsLabValue(g45);
    QVERIFY(a2);
    QCOMPARE(a2->colorimetricCondition().toString(), QStringLiteral("A/2"));
    QVERIFY(std::abs(a2->a() - d65->a()) + std::abs(a2->b() - d65->b()) > 0.1);

    // One entry per trial, in order, with null where nothing converts.
    auto unmeasured = std::make_shared<Trial>();
    model.addTrial(unmeasured);
    const auto labs = model.trialsAsLabValues(g45);
    QCOMPARE(labs.size(), size_t(3));
    QVERIFY(labs[0] && labs[1] && !labs[2]);
    QVERIFY(labs[0]->l() < labs[1]->l()); // B is the lighter trial
}

void tst_AppearanceViewDataModel::copyKeepsEveryField()
{
    AppearanceViewDataModel model(ColorimetricCondition("C", "2"));
    run(model, "job x");
    run(model, "std two|trials A,B|current S2|defaults D1|template x|format <Name>-<Year>");
    const AppearanceViewDataModel copy(model);
    QCOMPARE(copy.qcJob(), model.qcJob());
    QCOMPARE(copy.standard(), model.standard());
    QCOMPARE(copy.trials(), model.trials());
    QCOMPARE(copy.currentToleranceSet(), m_sets["S2"]);
    QCOMPARE(copy.defaultTolerances(), model.defaultTolerances());
    QCOMPARE(copy.jobTemplate(), model.jobTemplate());
    QCOMPARE(copy.colorimetricCondition().toString(), QStringLiteral("C/2"));
    QCOMPARE(copy.nameFormat(), std::string("<Name>-<Year>"));
}

void tst_AppearanceViewDataModel::toleranceGeometryProvider()
{
    AppearanceViewDataModel model(ColorimetricCondition("D65", "10"));
    ToleranceGeometryProvider provider(model);
    QVERIFY(provider.geometries().empty());

    // Two sets sharing 45as15; a sample-wide tolerance without geometry contributes nothing.
    auto first = fixtures::toleranceSet("first", {"45as15", "45as110", ""});
    auto second = fixtures::toleranceSet("second", {"45as25", "45as15"});
    model.setDefaultTolerances({first, second});
    const std::set<Geometry> expected{Geometry("45as15"), Geometry("45as25"), Geometry("45as110")};
    QCOMPARE(provider.geometries(), expected);

    // Read afresh on every call: the standard's sets now win.
    run(model, "std one");
    QCOMPARE(provider.geometries().size(), size_t(3));
    QCOMPARE(*provider.geometries().begin(), Geometry("45as15"));
}

void tst_AppearanceViewDataModel::selectorGeometryProvider()
{
    TrialSelectionModel selection;
    SelectorGeometryProvider provider(selection);
    QVERIFY(provider.geometries().empty());
    selection.setColorGeometryFilter({Geometry("45as110"), Geometry("45as-15"), Geometry("45as45")});
    const std::set<Geometry> geometries = provider.geometries();
    const std::vector<Geometry> ordered(geometries.begin(), geometries.end());
    QCOMPARE(ordered, (std::vector<Geometry>{Geometry("45as-15"), Geometry("45as45"), Geometry("45as110")}));
}

QTEST_GUILESS_MAIN(tst_AppearanceViewDataModel)
#include "tst_appearanceviewdatamodel.moc"
