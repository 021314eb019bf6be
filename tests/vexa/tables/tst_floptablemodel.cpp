// The flop table model: rows of the standard and the trials, the flop index against an
// independent computation on the sample data, flop differences, verdict colours from the
// flop tolerance in force, the selected-trial flag and what changes when.

#include "samplestore.h"
#include "tablefixtures.h"

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/tables/columndefinition.h>
#include <vexa/tables/floptablemodel.h>

#include <colorimetry/colorconverter.h>
#include <domain/labvalue.h>
#include <settings/generalsettings.h>
#include <tolerances/tolerancefactory.h>

#include <QAbstractItemModelTester>
#include <QSignalSpy>
#include <QtTest>

#include <cmath>

using namespace vexa;

namespace {

// The flop index from the three lightnesses, written out here on its own:
// 2.69 · (L*15 − L*110)^1.11 / (L*45)^0.86, negative for a negative travel.
double flopIndex(double l15, double l45, double l110)
{
    const double d = l15 - l110;
    const double magnitude = 2.69 * std::pow(std::fabs(d), 1.11) / std::pow(l45, 0.86);
    return d < 0 ? -magnitude : magnitude;
}

double lightness(const std::shared_ptr<AppearanceValues> &values, const char *geometry, const ColorimetricCondition &c)
{
    return ColorConverter::toLabValue(*values, Geometry(geometry), c).l();
}

double independentFlop(const std::shared_ptr<AppearanceValues> &values, const ColorimetricCondition &c)
{
    return flopIndex(lightness(values, Geometry::ANGLE_45as15, c), lightness(values, Geometry::ANGLE_45as45, c),
                     lightness(values, Geometry::ANGLE_45as110, c));
}

std::shared_ptr<Tolerance> flopTolerance(double limit)
{
    auto tolerance = ToleranceFactory::toleranceFactory()->createTolerance(QStringLiteral("Flop Index(+/-)"), Geometry());
    for (const auto &value : tolerance->toleranceValues())
        value->setValue(value->valueAsDouble() * limit);
    return tolerance;
}

std::shared_ptr<ToleranceSet> setWith(const QString &name, const std::vector<std::shared_ptr<Tolerance>> &tolerances)
{
    auto set = std::make_shared<ToleranceSet>();
    set->setName(name);
    set->setTolerances(tolerances);
    return set;
}

// A page with the fixture standard and trials whose flop differs from the standard's.
struct FlopPage
{
    tablefixtures::Page page = tablefixtures::Page::make(false);
    std::shared_ptr<GeneralSettings> general = std::make_shared<GeneralSettings>();
    std::unique_ptr<FlopTableModel> model;

    FlopPage()
    {
        model = std::make_unique<FlopTableModel>(general);
        model->setModels(page.data, page.selection);
    }
};

double number(const QAbstractItemModel &model, int row, int column)
{
    return model.index(row, column).data().toDouble();
}

} // namespace

class TestFlopTableModel : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        ToleranceFactory::toleranceFactory();
        qRegisterMetaType<QList<QPersistentModelIndex>>();
        qRegisterMetaType<QAbstractItemModel::LayoutChangeHint>();
    }

    void shouldPassTheModelTester()
    {
        FlopPage p;
        QAbstractItemModelTester tester(p.model.get(), QAbstractItemModelTester::FailureReportingMode::QtTest);
        p.page.selection->setSelectedTrial(p.page.trials[1]);
        p.model->setSelectedTrialOnly(true);
        p.page.selection->setSelectedTrial(p.page.trials[2]);
        p.page.selection->setSelectedTrial(nullptr);
        p.page.selection->setSelectedTrial(p.page.trials[0]);
        p.model->setSelectedTrialOnly(false);
        p.page.data->addTrial(fixtures::trial("T4", 0.21));
        p.page.data->setStandard(nullptr);
        QCOMPARE(p.model->rowCount(), 0);
    }

    void shouldListTheStandardThenTheTrials()
    {
        FlopPage p;
        QCOMPARE(p.model->rowCount(), 4);
        QCOMPARE(p.model->columnCount(), 3);
        QStringList names;
        for (int r = 0; r < p.model->rowCount(); ++r)
            names << p.model->index(r, 0).data().toString();
        QCOMPARE(names, (QStringList{"STD", "T1", "T2", "T3"}));
        QCOMPARE(p.model->headerData(0, Qt::Horizontal).toString(), QStringLiteral("Name"));
        QCOMPARE(p.model->headerData(1, Qt::Horizontal).toString(), QString::fromUtf8("\u0394Flop-index"));
        QCOMPARE(p.model->headerData(2, Qt::Horizontal).toString(), QStringLiteral("Flop-index"));
        QCOMPARE(p.model->trialAt(2), p.page.trials[1]);
        QCOMPARE(p.model->rowOf(p.page.trials[2]), 3);
        QCOMPARE(p.model->objectAt(0), std::static_pointer_cast<NamedObject>(p.page.standard));
        // The standard's row has no flop difference.
        QVERIFY(!p.model->index(0, FlopTableModel::FlopDifferenceColumn).data().isValid());
        QVERIFY(p.model->index(0, FlopTableModel::FlopColumn).data().isValid());
    }

    void shouldHaveNoRowsWithoutAStandard()
    {
        FlopPage p;
        QSignalSpy reset(p.model.get(), &QAbstractItemModel::modelReset);
        p.page.data->setStandard(nullptr);
        QCOMPARE(reset.count(), 1);
        QCOMPARE(p.model->rowCount(), 0);
        QCOMPARE(p.page.data->trials().size(), size_t(3));
        p.model->setSelectedTrialOnly(true);
        p.page.selection->setSelectedTrial(p.page.trials[0]);
        QCOMPARE(p.model->rowCount(), 0);
        QCOMPARE(p.model->rowOf(p.page.trials[0]), -1);
    }

    // The silver metallic of the sample data: every flop index against the formula computed
    // here from the L* values, and every difference against the standard's.
    void shouldMatchAnIndependentComputationOnTheSampleTrials_data()
    {
        QTest::addColumn<QString>("generalCondition");
        QTest::addColumn<QString>("expectedCondition");
        QTest::newRow("D65/10") << "D65/10" << "D65/10";
        QTest::newRow("the illuminant of A/2 with the 10° observer") << "A/2" << "A/10";
    }

    void shouldMatchAnIndependentComputationOnTheSampleTrials()
    {
        QFETCH(QString, generalCondition);
        QFETCH(QString, expectedCondition);
        samplestore::SampleStore store;
        QVERIFY2(store.error.isEmpty(), qPrintable(store.error));
        const auto standard = store.standard("Silver Metallic");
        QVERIFY(standard);
        const auto trials = store.trialsOf(standard);
        QCOMPARE(trials.size(), size_t(SampleData::TrialsPerStandard));

        auto data = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition("D65", "10"));
        data->setStandard(standard);
        data->setTrials(trials);
        auto general = std::make_shared<GeneralSettings>();
        QVERIFY(general->setColorimetricCondition(generalCondition));
        FlopTableModel model(general);
        model.setModels(data, std::make_shared<TrialSelectionModel>());
        QCOMPARE(model.flopCondition().toString(), expectedCondition);

        const ColorimetricCondition condition = ColorimetricCondition::fromString(expectedCondition);
        const double standardFlop = independentFlop(standard->appearanceValues(), condition);
        QVERIFY(standardFlop > 5.0); // a metallic
        QVERIFY(std::fabs(number(model, 0, FlopTableModel::FlopColumn) - standardFlop) < 1e-9 * standardFlop);
        for (int i = 0; i < int(trials.size()); ++i) {
            const double flop = independentFlop(trials[size_t(i)]->appearanceValues(), condition);
            QVERIFY2(std::fabs(number(model, i + 1, FlopTableModel::FlopColumn) - flop) < 1e-9 * std::fabs(flop),
                     qPrintable(trials[size_t(i)]->name()));
            QVERIFY(std::fabs(number(model, i + 1, FlopTableModel::FlopDifferenceColumn) - (flop - standardFlop)) < 1e-9);
        }
    }

    // The sample's automotive ΔE set carries the flop tolerance; the page's first set does not.
    void shouldJudgeTheSampleTrialsWithTheFlopToleranceInForce()
    {
        samplestore::SampleStore store;
        const auto standard = store.standard("Silver Metallic");
        const auto trials = store.trialsOf(standard);
        auto data = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition("D65", "10"));
        data->setStandard(standard);
        data->setTrials(trials);
        QCOMPARE(data->toleranceSets().size(), size_t(2));
        data->setCurrentToleranceSet(data->toleranceSets().front());
        FlopTableModel model(std::make_shared<GeneralSettings>());
        model.setModels(data, std::make_shared<TrialSelectionModel>());
        QVERIFY(model.flopTolerance());
        QSet<QString> colours;
        for (int r = 1; r < model.rowCount(); ++r) {
            const QVariant background = model.index(r, FlopTableModel::FlopDifferenceColumn).data(Qt::BackgroundRole);
            QVERIFY(background.isValid());
            colours.insert(background.value<QColor>().name(QColor::HexRgb).toUpper());
        }
        // Half of the trials are scattered to pass, a quarter to fail: the flop follows.
        QVERIFY2(colours.contains("#00914D") && colours.contains("#FF3D35"),
                 qPrintable(QStringList(colours.values()).join(',')));
    }

    void shouldLeaveCellsEmptyWithoutTheThreeGeometries()
    {
        FlopPage p;
        p.page.standard->setToleranceSets({setWith("Flop", {flopTolerance(1.0)})});
        p.page.data->setStandard(nullptr);
        p.page.data->setStandard(p.page.standard);
        auto partial = fixtures::trial("No 110", 0.2, {"45as15", "45as45", "45as75"});
        p.page.data->addTrial(partial);
        const int row = p.model->rowOf(partial);
        QCOMPARE(row, 4);
        QCOMPARE(p.model->index(row, 0).data().toString(), QStringLiteral("No 110"));
        QVERIFY(!p.model->index(row, FlopTableModel::FlopDifferenceColumn).data().isValid());
        QVERIFY(!p.model->index(row, FlopTableModel::FlopColumn).data().isValid());
        QVERIFY(!p.model->index(row, FlopTableModel::FlopDifferenceColumn).data(Qt::BackgroundRole).isValid());
        double flop = 0.0;
        QVERIFY(!p.model->didGetFlop(partial->appearanceValues(), flop));
        QVERIFY(!p.model->didGetFlop(nullptr, flop));
        QVERIFY(!p.model->didGetdFlop(partial, flop));
        // The others still have theirs.
        QVERIFY(p.model->index(1, FlopTableModel::FlopDifferenceColumn).data(Qt::BackgroundRole).isValid());

        // A standard without 45as110: no differences anywhere, the trials' own indices stay.
        p.page.data->setStandard(fixtures::standard("STD 2", 0.2, {"45as15", "45as45"}));
        QVERIFY(!p.model->index(0, FlopTableModel::FlopColumn).data().isValid());
        QVERIFY(!p.model->index(1, FlopTableModel::FlopDifferenceColumn).data().isValid());
        QVERIFY(p.model->index(1, FlopTableModel::FlopColumn).data().isValid());
    }

    void shouldShowTheSelectedTrialAloneWithTheFlag()
    {
        FlopPage p;
        p.page.selection->setSelectedTrial(p.page.trials[2]);
        QSignalSpy reset(p.model.get(), &QAbstractItemModel::modelReset);
        p.model->setSelectedTrialOnly(true);
        QCOMPARE(reset.count(), 1);
        QCOMPARE(p.model->rowCount(), 2);
        QCOMPARE(p.model->index(1, 0).data().toString(), QStringLiteral("T3"));
        QCOMPARE(p.model->rowOf(p.page.trials[2]), 1);
        QCOMPARE(p.model->rowOf(p.page.trials[0]), -1);

        // Another selection changes row 1 only.
        QSignalSpy changed(p.model.get(), &QAbstractItemModel::dataChanged);
        const double before = number(*p.model, 1, FlopTableModel::FlopColumn);
        p.page.selection->setSelectedTrial(p.page.trials[0]);
        QCOMPARE(reset.count(), 1);
        QCOMPARE(changed.count(), 1);
        QCOMPARE(changed.at(0).at(0).toModelIndex(), p.model->index(1, 0));
        QCOMPARE(changed.at(0).at(1).toModelIndex(), p.model->index(1, 2));
        QCOMPARE(p.model->index(1, 0).data().toString(), QStringLiteral("T1"));
        QVERIFY(number(*p.model, 1, FlopTableModel::FlopColumn) != before);

        // No selection: the standard alone; a selection again brings row 1 back.
        QSignalSpy removed(p.model.get(), &QAbstractItemModel::rowsRemoved);
        QSignalSpy inserted(p.model.get(), &QAbstractItemModel::rowsInserted);
        p.page.selection->setSelectedTrial(nullptr);
        QCOMPARE(removed.count(), 1);
        QCOMPARE(p.model->rowCount(), 1);
        p.page.selection->setSelectedTrial(p.page.trials[1]);
        QCOMPARE(inserted.count(), 1);
        QCOMPARE(p.model->index(1, 0).data().toString(), QStringLiteral("T2"));
    }

    // Without the flag a selection is the view's business: the model does not change.
    void shouldIgnoreTheSelectionWithoutTheFlag()
    {
        FlopPage p;
        QSignalSpy reset(p.model.get(), &QAbstractItemModel::modelReset);
        QSignalSpy changed(p.model.get(), &QAbstractItemModel::dataChanged);
        QSignalSpy layout(p.model.get(), &QAbstractItemModel::layoutChanged);
        p.page.selection->setSelectedTrial(p.page.trials[1]);
        p.page.selection->setSelectedColorGeometry(Geometry("45as110"));
        p.page.selection->setActiveTrials({p.page.trials[0]});
        QCOMPARE(reset.count() + changed.count() + layout.count(), 0);
        QCOMPARE(p.model->rowCount(), 4);
    }

    // The flop tolerance of the current set wins; without one, the first among the sets in
    // force; without any, no colour.
    void shouldPickTheFlopTolerance_data()
    {
        QTest::addColumn<QString>("layout"); // the sets: name:tolerances
        QTest::addColumn<QString>("current");
        QTest::addColumn<QString>("expected"); // the tolerance's owner set, empty for none
        QTest::newRow("current set holds one") << "A:flop,B:flop" << "B" << "B";
        QTest::newRow("current set holds none") << "A:dE,B:flop,C:flop" << "A" << "B";
        QTest::newRow("no current set (two in force)") << "A:flop,B:flop" << "" << "A";
        QTest::newRow("none at all") << "A:dE,B:dE" << "A" << "";
    }

    void shouldPickTheFlopTolerance()
    {
        QFETCH(QString, layout);
        QFETCH(QString, current);
        QFETCH(QString, expected);
        FlopPage p;
        QMap<QString, std::shared_ptr<Tolerance>> flops;
        QMap<QString, std::shared_ptr<ToleranceSet>> sets;
        std::vector<std::shared_ptr<ToleranceSet>> inForce;
        for (const QString &entry : layout.split(',')) {
            const QString name = entry.section(':', 0, 0);
            std::vector<std::shared_ptr<Tolerance>> tolerances
                = tablefixtures::deltaESet(name, fixtures::threeAngles())->tolerances();
            if (entry.endsWith("flop")) {
                flops[name] = flopTolerance(1.0);
                tolerances.push_back(flops[name]);
            }
            sets[name] = setWith(name, tolerances);
            inForce.push_back(sets[name]);
        }
        p.page.standard->setToleranceSets(inForce);
        p.page.data->setStandard(nullptr);
        p.page.data->setStandard(p.page.standard);
        p.page.data->setCurrentToleranceSet(sets.value(current));
        QCOMPARE(p.model->flopTolerance(), flops.value(expected));
        const QVariant background = p.model->index(1, FlopTableModel::FlopDifferenceColumn).data(Qt::BackgroundRole);
        QCOMPARE(background.isValid(), !expected.isEmpty());
    }

    void shouldColourTheFlopDifferenceByTheVerdict()
    {
        FlopPage p;
        // Limits so that the near trial passes and the far one fails.
        double nearDelta = 0.0, farDelta = 0.0;
        QVERIFY(p.model->didGetdFlop(p.page.trials[0], nearDelta));
        QVERIFY(p.model->didGetdFlop(p.page.trials[2], farDelta));
        QVERIFY(std::fabs(farDelta) > 4 * std::fabs(nearDelta));
        const auto tolerance = flopTolerance((std::fabs(farDelta) + std::fabs(nearDelta)) / 2.0);
        p.page.standard->setToleranceSets({setWith("Flop", {tolerance})});
        QSignalSpy reset(p.model.get(), &QAbstractItemModel::modelReset);
        QSignalSpy changed(p.model.get(), &QAbstractItemModel::dataChanged);
        p.page.data->setCurrentToleranceSet(p.page.standard->toleranceSets().front());
        QCOMPARE(reset.count(), 0);
        QCOMPARE(changed.count(), 1);
        QCOMPARE(changed.at(0).at(0).toModelIndex(), p.model->index(0, FlopTableModel::FlopDifferenceColumn));
        QCOMPARE(changed.at(0).at(2).value<QVector<int>>(), QVector<int>{Qt::BackgroundRole});

        const ColorimetricCondition condition = p.model->flopCondition();
        for (int r = 1; r < p.model->rowCount(); ++r) {
            const int status = tolerance->status(*p.model->trialAt(r)->appearanceValues(),
                                                 *p.page.standard->appearanceValues(), condition);
            QCOMPARE(p.model->index(r, FlopTableModel::FlopDifferenceColumn).data(Qt::BackgroundRole),
                     ColumnDefinitionToleranceSet::colorOfStatus(status));
            // No other cell is coloured.
            QVERIFY(!p.model->index(r, FlopTableModel::NameColumn).data(Qt::BackgroundRole).isValid());
            QVERIFY(!p.model->index(r, FlopTableModel::FlopColumn).data(Qt::BackgroundRole).isValid());
        }
        QCOMPARE(p.model->index(1, 1).data(Qt::BackgroundRole).value<QColor>(), QColor("#00914d"));
        QCOMPARE(p.model->index(3, 1).data(Qt::BackgroundRole).value<QColor>(), QColor("#FF3D35"));
        QVERIFY(!p.model->index(0, 1).data(Qt::BackgroundRole).isValid());
    }

    void shouldAnswerOnlyItsThreeRoles_data()
    {
        QTest::addColumn<int>("role");
        QTest::newRow("tool tip") << int(Qt::ToolTipRole);
        QTest::newRow("font") << int(Qt::FontRole);
        QTest::newRow("foreground") << int(Qt::ForegroundRole);
        QTest::newRow("user") << int(Qt::UserRole);
        QTest::newRow("edit") << int(Qt::EditRole);
        QTest::newRow("export value") << int(Qt::UserRole + 20);
    }

    void shouldAnswerOnlyItsThreeRoles()
    {
        QFETCH(int, role);
        FlopPage p;
        for (int c = 0; c < 3; ++c)
            QVERIFY(!p.model->index(1, c).data(role).isValid());
        QCOMPARE(p.model->index(1, 0).data(Qt::TextAlignmentRole).toInt(), int(Qt::AlignLeft | Qt::AlignVCenter));
        QCOMPARE(p.model->index(1, 1).data(Qt::TextAlignmentRole).toInt(), int(Qt::AlignCenter));
        QCOMPARE(p.model->index(1, 2).data(Qt::TextAlignmentRole).toInt(), int(Qt::AlignCenter));
        QCOMPARE(p.model->index(1, 2).data().userType(), int(QMetaType::Double));
    }

    void shouldRecomputeWhenTheIlluminantChanges()
    {
        FlopPage p;
        const double d65 = number(*p.model, 1, FlopTableModel::FlopColumn);
        QSignalSpy changed(p.model.get(), &QAbstractItemModel::dataChanged);
        QVERIFY(p.general->setColorimetricCondition("D65/2")); // the observer is not used
        QCOMPARE(changed.count(), 0);
        QVERIFY(p.general->setColorimetricCondition("A/10"));
        QCOMPARE(changed.count(), 1);
        QCOMPARE(p.model->flopCondition().toString(), QStringLiteral("A/10"));
        const double a = number(*p.model, 1, FlopTableModel::FlopColumn);
        QVERIFY(a != d65);
        QVERIFY(std::fabs(a - independentFlop(p.page.trials[0]->appearanceValues(), ColorimetricCondition("A", "10")))
                < 1e-9);
    }
};

QTEST_MAIN(TestFlopTableModel)
#include "tst_floptablemodel.moc"
