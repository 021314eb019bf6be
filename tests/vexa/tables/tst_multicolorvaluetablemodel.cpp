// The colour table model: rows per trial and geometry, columns from the settings,
// headers, roles, verdict colours, refreshes and clones.

#include "tablefixtures.h"

#include <vexa/models/geometryprovider.h>
#include <vexa/tables/columndefinition.h>
#include <vexa/tables/multicolorvaluetablemodel.h>
#include <vexa/tolerance/toleranceselector.h>

#include <domain/appearancevalues.h>
#include <domain/labchvalue.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>

#include <QAbstractItemModelTester>
#include <QApplication>
#include <QComboBox>
#include <QFontMetrics>
#include <QLocale>
#include <QSignalSpy>
#include <QtTest>

#include <cmath>

using namespace vexa;
using tablefixtures::Page;

namespace {

constexpr int ExportValueRole = Qt::UserRole + 20;
constexpr int NumberFormatRole = Qt::UserRole + 21;

std::shared_ptr<MultiColorValueTableModel> makeModel(const Page &page,
                                                     std::shared_ptr<ColorCompareSettings> settings = nullptr)
{
    if (!settings)
        settings = tablefixtures::colorSettings();
    auto model = std::make_shared<MultiColorValueTableModel>(settings, std::make_shared<GeneralSettings>());
    model->setModels(page.data, page.selection);
    return model;
}

// "name@geometry" of every row, in order.
QStringList rowKeys(const MultiColorValueTableModel &model)
{
    QStringList keys;
    for (int r = 0; r < model.rowCount(); ++r) {
        const auto row = model.rowAt(r);
        keys << QStringLiteral("%1@%2").arg(QString::fromStdString(row->displayName()), row->geometry().toString());
    }
    return keys;
}

QStringList headers(const QAbstractItemModel &model)
{
    QStringList list;
    for (int c = 0; c < model.columnCount(); ++c)
        list << model.headerData(c, Qt::Horizontal).toString();
    return list;
}

int columnOf(const QAbstractItemModel &model, const QString &header)
{
    return headers(model).indexOf(header);
}

// A column that reports a fixed text, for explicit layouts.
class FixedColumn : public ColumnDefinition
{
public:
    explicit FixedColumn(QString text) : m_text(std::move(text)) {}
    QString headerText() const override { return m_text; }
    QVariant value(const AppearanceViewTableModelRow &) const override { return m_text; }

private:
    QString m_text;
};

} // namespace

class TestMultiColorValueTableModel : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase()
    {
        ToleranceFactory::toleranceFactory(); // registers the judging rules
    }

    void shouldListRowsPerShownTrialAndGeometry_data()
    {
        QTest::addColumn<QStringList>("activeTrials");
        QTest::addColumn<QStringList>("filter");
        QTest::addColumn<bool>("showStandard");
        QTest::addColumn<QStringList>("expected");

        const QStringList all = {"STD@45as15", "STD@45as45", "STD@45as110", "T1@45as15", "T1@45as45", "T1@45as110",
                                 "T2@45as15", "T2@45as45", "T2@45as110", "T3@45as15", "T3@45as45", "T3@45as110"};
        QTest::newRow("nothing active shows every trial at the data's geometries")
            << QStringList() << QStringList() << true << all;
        QTest::newRow("active trials in their order")
            << QStringList{"T3", "T1"} << QStringList{"45as45"} << true
            << QStringList{"STD@45as45", "T3@45as45", "T1@45as45"};
        QTest::newRow("filter in geometry order, standard hidden")
            << QStringList{"T2"} << QStringList{"45as110", "45as15"} << false
            << QStringList{"T2@45as15", "T2@45as110"};
    }

    void shouldListRowsPerShownTrialAndGeometry()
    {
        QFETCH(QStringList, activeTrials);
        QFETCH(QStringList, filter);
        QFETCH(bool, showStandard);
        QFETCH(QStringList, expected);

        Page page = Page::make();
        std::vector<std::shared_ptr<Trial>> active;
        for (const QString &name : activeTrials) {
            for (const auto &trial : page.trials)
                if (trial->name() == name)
                    active.push_back(trial);
        }
        page.selection->setActiveTrials(active);
        std::set<Geometry> geometries;
        for (const QString &g : filter)
            geometries.insert(Geometry(g));
        page.selection->setColorGeometryFilter(geometries);
        auto model = makeModel(page);
        model->setShowStandard(showStandard);

        QCOMPARE(rowKeys(*model), expected);
    }

    void shouldTakeGeometriesFromAnExplicitProvider()
    {
        Page page = Page::make();
        auto model = makeModel(page);
        model->setGeometryProvider(std::make_shared<ToleranceGeometryProvider>(*page.data));
        QCOMPARE(model->shownGeometries().size(), size_t(3));
        page.standard->setToleranceSets({tablefixtures::deltaESet("Only 45", {"45as45"})});
        page.data->setStandard(nullptr);
        page.data->setStandard(page.standard);
        QCOMPARE(model->shownGeometries(), std::vector<Geometry>{Geometry("45as45")});
        QCOMPARE(model->rowCount(), 4);
    }

    void shouldBuildColumnsFromTheSettings_data()
    {
        QTest::addColumn<QString>("coordinates");
        QTest::addColumn<QString>("standardCoordinates");
        QTest::addColumn<QStringList>("metrics");
        QTest::addColumn<QStringList>("expected");

        QTest::newRow("defaults: Lab and the verdict")
            << "CIELab" << "None" << QStringList{"Tolerances"}
            << QStringList{"Name", "Geometry", "Date/Time", "L\n(D65/10)", "a\n(D65/10)", "b\n(D65/10)", "dE Set"};
        QTest::newRow("LCh, standard Lab, a metric, no tolerances")
            << "CIELCh" << "CIELab" << QStringList{"dE2000"}
            << QStringList{"Name", "Geometry", "Date/Time", "L\n(D65/10)", "C\n(D65/10)", "h\n(D65/10)",
                           "Std_L*\n(D65/10)", "Std_a*\n(D65/10)", "Std_b*\n(D65/10)",
                           colorSpaceDeltaDisplayName(EColorSpaceDelta::dE2000)};
        QTest::newRow("no coordinates, two metrics and the verdict")
            << "None" << "None" << QStringList{"Tolerances", "dL", "dECIELab"}
            << QStringList{"Name", "Geometry", "Date/Time", colorSpaceDeltaDisplayName(EColorSpaceDelta::dECIELab),
                           colorSpaceDeltaDisplayName(EColorSpaceDelta::dL), "dE Set"};
        QTest::newRow("tolerances off removes the verdict columns")
            << "CIELabCh" << "None" << QStringList()
            << QStringList{"Name", "Geometry", "Date/Time", "L\n(D65/10)", "a\n(D65/10)", "b\n(D65/10)",
                           "C\n(D65/10)", "h\n(D65/10)"};
    }

    void shouldBuildColumnsFromTheSettings()
    {
        QFETCH(QString, coordinates);
        QFETCH(QString, standardCoordinates);
        QFETCH(QStringList, metrics);
        QFETCH(QStringList, expected);

        Page page = Page::make();
        auto settings = tablefixtures::colorSettings(coordinates, standardCoordinates, metrics);
        auto model = makeModel(page, settings);
        QCOMPARE(headers(*model), expected);
        QCOMPARE(model->columnCount(),
                 int(model->displayedGeneralColumns().size() + settings->enabledTableColorSpaceCoordinates().size()
                     + settings->enabledTableStandardColorSpaceCoordinates().size()
                     + settings->enabledTableDEMetrics().size()
                     + (settings->tableTolerancesEnabled() ? page.data->toleranceSets().size() : 0)));
    }

    void shouldUseOneVerdictColumnPerSetInForce()
    {
        Page page = Page::make();
        page.standard->setToleranceSets({page.toleranceSet, tablefixtures::deltaESet("Second", {"45as15"})});
        page.data->setStandard(nullptr);
        page.data->setStandard(page.standard);
        auto model = makeModel(page);
        QCOMPARE(headers(*model).mid(6), (QStringList{"dE Set", "Second"}));
    }

    void shouldLetExplicitColumnsIgnoreTheSettings()
    {
        Page page = Page::make();
        auto settings = tablefixtures::colorSettings("CIELabCh", "CIELab", {"Tolerances", "dE2000"});
        auto model = makeModel(page, settings);
        model->setColumns({std::make_shared<FixedColumn>("X"), std::make_shared<ColumnDefinitionGeometry>()});
        QCOMPARE(model->columnCount(), 2);
        settings->tableColorSpaceCoordinatesSetting()->setSelectedValue("CIELab");
        QCOMPARE(model->columnCount(), 2);
        QCOMPARE(headers(*model), (QStringList{"X", "Geometry"}));
        QCOMPARE(model->index(1, 1).data().toString(), QStringLiteral("45as45"));
    }

    void shouldLeaveAnUnknownCoordinateEmpty()
    {
        Page page = Page::make();
        auto model = makeModel(page);
        ColumnDefinitionLabCh unknown(ColumnDefinitionLabCh::Column(7), *model);
        QCOMPARE(unknown.headerText(), QStringLiteral("\n(D65/10)"));
        QVERIFY(!unknown.value(*model->rowAt(3)).isValid());
        ColumnDefinitionLabCh h(ColumnDefinitionLabCh::h, *model);
        QVERIFY(h.value(*model->rowAt(3)).isValid());
    }

    void shouldShowCoordinatesWithTheirRoles()
    {
        Page page = Page::make();
        auto model = makeModel(page);
        const auto row = model->rowAt(4); // T1 at 45as45
        QVERIFY(row->labChValue());
        const int lColumn = columnOf(*model, "L\n(D65/10)");
        const QModelIndex index = model->index(4, lColumn);
        QCOMPARE(index.data(ExportValueRole).userType(), int(QMetaType::Double));
        QCOMPARE(index.data(ExportValueRole).toDouble(), row->labChValue()->l());
        QCOMPARE(index.data(NumberFormatRole).toString(), QStringLiteral("0.00"));
        QCOMPARE(index.data().toString(), QLocale().toString(row->labChValue()->l(), 'f', 2));
        QCOMPARE(index.data(Qt::TextAlignmentRole).toInt(), int(Qt::AlignCenter));

        model->setDecimals(3);
        QCOMPARE(index.data(NumberFormatRole).toString(), QStringLiteral("0.000"));
        QCOMPARE(index.data().toString(), QLocale().toString(row->labChValue()->l(), 'f', 3));

        // Texts have no number format and are left-aligned.
        const QModelIndex name = model->index(4, 0);
        QCOMPARE(name.data().toString(), QStringLiteral("T1"));
        QVERIFY(!name.data(NumberFormatRole).isValid());
        QCOMPARE(name.data(Qt::TextAlignmentRole).toInt(), int(Qt::AlignLeft | Qt::AlignVCenter));
        QVERIFY(!model->index(4, 0).data(Qt::BackgroundRole).isValid());
    }

    void shouldShowDateAndInstrument()
    {
        Page page = Page::make();
        auto model = makeModel(page);
        model->setGeneralColumns({MultiColorValueTableModel::GeneralColumn::Name,
                                  MultiColorValueTableModel::GeneralColumn::DateTime,
                                  MultiColorValueTableModel::GeneralColumn::InstrumentInfo});
        QCOMPARE(headers(*model).mid(0, 3), (QStringList{"Name", "Date/Time", "Instrument"}));
        const QVariant stamp = model->index(6, 1).data(ExportValueRole); // T2
        QCOMPARE(stamp.toDateTime(), QDateTime(QDate(2024, 3, 2), QTime(10, 30), Qt::UTC));
        QCOMPARE(model->index(6, 1).data().toString(),
                 stamp.toDateTime().toLocalTime().toString("yyyy-MM-dd HH:mm:ss"));
        QCOMPARE(model->index(6, 2).data().toString(), QStringLiteral("MA-T12 SN2"));
        // The standard was never stamped: empty, not a 1970 date.
        QVERIFY(!model->index(0, 1).data().isValid());
        QVERIFY(!model->index(0, 2).data().isValid());
    }

    void shouldColourVerdictsAsTheToleranceJudges()
    {
        Page page = Page::make();
        auto model = makeModel(page);
        const int column = columnOf(*model, "dE Set");
        QSet<int> statuses;
        for (int r = 3; r < model->rowCount(); ++r) {
            const auto row = model->rowAt(r);
            const auto tolerance = page.toleranceSet->toleranceWithGeometry(row->geometry());
            const ToleranceJudgement judgement = tolerance->judge(*row->appearanceValues(),
                                                                  *page.standard->appearanceValues(),
                                                                  ColorimetricCondition());
            statuses.insert(judgement.status);
            const QModelIndex index = model->index(r, column);
            QCOMPARE(index.data(Qt::BackgroundRole), ColumnDefinitionToleranceSet::colorOfStatus(judgement.status));
            QCOMPARE(index.data(ExportValueRole).toDouble(), judgement.colorDifferences.first());
        }
        QCOMPARE(statuses, (QSet<int>{1, 2, 3}));
        // The standard's own rows carry no verdict.
        QVERIFY(!model->index(0, column).data().isValid());
        QVERIFY(!model->index(0, column).data(Qt::BackgroundRole).isValid());
    }

    void shouldMapStatusesToTheVerdictColours_data()
    {
        QTest::addColumn<int>("status");
        QTest::addColumn<QString>("color");
        QTest::newRow("pass") << 1 << "#00914d";
        QTest::newRow("warning") << 2 << "#f2e000";
        QTest::newRow("fail") << 3 << "#ff3d35";
        QTest::newRow("no verdict") << 0 << "";
        QTest::newRow("unknown") << 4 << "";
    }

    void shouldMapStatusesToTheVerdictColours()
    {
        QFETCH(int, status);
        QFETCH(QString, color);
        const QVariant value = ColumnDefinitionToleranceSet::colorOfStatus(status);
        QCOMPARE(value.isValid() ? value.value<QColor>().name() : QString(), color);
    }

    void shouldLeaveAGeometryWithoutToleranceEmpty()
    {
        Page page = Page::make(false);
        auto partial = tablefixtures::deltaESet("Partial", {"45as15"});
        page.standard->setToleranceSets({partial});
        page.data->setStandard(nullptr);
        page.data->setStandard(page.standard);
        auto model = makeModel(page);
        const int column = columnOf(*model, "Partial");
        QVERIFY(column >= 0);
        QVERIFY(model->index(3, column).data().isValid()); // T1 at 45as15
        const QModelIndex without = model->index(4, column); // T1 at 45as45
        QVERIFY(!without.data().isValid());
        QVERIFY(!without.data(ExportValueRole).isValid());
        QVERIFY(!without.data(Qt::BackgroundRole).isValid());
    }

    void shouldLeaveCellsEmptyWithoutStandardOrValues()
    {
        Page page = Page::make();
        auto empty = std::make_shared<Trial>();
        empty->setName("Empty");
        empty->setAppearanceValues(std::make_shared<AppearanceValues>());
        auto none = std::make_shared<Trial>();
        none->setName("None");
        page.data->setTrials({empty, none});
        page.data->setStandard(nullptr);
        page.data->setDefaultTolerances({page.toleranceSet});
        page.selection->setColorGeometryFilter({Geometry("45as45")});
        auto model = makeModel(page, tablefixtures::colorSettings("CIELabCh", "CIELab", {"Tolerances", "dE2000"}));
        QCOMPARE(rowKeys(*model), (QStringList{"Empty@45as45", "None@45as45"}));
        for (int r = 0; r < model->rowCount(); ++r) {
            for (int c = 2; c < model->columnCount(); ++c) {
                QVERIFY2(!model->index(r, c).data().isValid(), qPrintable(headers(*model).at(c)));
                QVERIFY(!model->index(r, c).data(Qt::BackgroundRole).isValid());
            }
        }
    }

    void shouldLeaveMetricsEmptyWithoutAStandard()
    {
        Page page = Page::make();
        auto model = makeModel(page, tablefixtures::colorSettings("CIELab", "CIELab", {"dE2000"}));
        const int metric = model->columnCount() - 1;
        QVERIFY(model->index(3, metric).data().isValid());
        page.data->setStandard(nullptr);
        QCOMPARE(model->rowCount(), 9);
        QVERIFY(!model->index(0, metric).data().isValid());
        QVERIFY(model->index(0, 3).data().isValid()); // the trial's own L*
    }

    void shouldAnswerNothingWithoutModels()
    {
        MultiColorValueTableModel model(nullptr, nullptr);
        new QAbstractItemModelTester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest, &model);
        QCOMPARE(model.rowCount(), 0);
        QCOMPARE(model.columnCount(), 3); // the general columns
        QVERIFY(!model.data(QModelIndex()).isValid());
        QVERIFY(!model.data(model.index(5, 5)).isValid());
        QCOMPARE(model.rowOf(nullptr, Geometry("45as45")), -1);
        QCOMPARE(model.standardRowOf(Geometry("45as45")), -1);
        model.setModels(nullptr, nullptr);
        QCOMPARE(model.rowCount(), 0);
    }

    void shouldGiveHeaderFontAndSizeHint_data()
    {
        QTest::addColumn<QString>("coordinates");
        QTest::addColumn<QStringList>("metrics");
        QTest::addColumn<bool>("tolerances");
        QTest::addColumn<int>("margin");
        QTest::newRow("coordinates") << "CIELab" << QStringList() << false << 24;
        QTest::newRow("metrics") << "None" << QStringList{"dE2000"} << false << 24;
        QTest::newRow("tolerance sets in force") << "None" << QStringList() << true << 24;
        QTest::newRow("nothing") << "None" << QStringList() << false << 8;
    }

    void shouldGiveHeaderFontAndSizeHint()
    {
        QFETCH(QString, coordinates);
        QFETCH(QStringList, metrics);
        QFETCH(bool, tolerances);
        QFETCH(int, margin);
        Page page = Page::make(tolerances);
        auto model = makeModel(page, tablefixtures::colorSettings(coordinates, "None", metrics));

        const QFont font = model->headerData(0, Qt::Horizontal, Qt::FontRole).value<QFont>();
        QCOMPARE(font.weight(), 75);
        QCOMPARE(font.pixelSize(), 14);
        const QFontMetrics metricsOfFont(font);
        for (int c = 0; c < model->columnCount(); ++c) {
            const QString text = model->headerData(c, Qt::Horizontal).toString();
            int width = 0;
            for (const QString &line : text.split('\n'))
                width = std::max(width, metricsOfFont.horizontalAdvance(line));
            const QSize hint = model->headerData(c, Qt::Horizontal, Qt::SizeHintRole).toSize();
            QCOMPARE(hint.width(), width + 10);
            QCOMPARE(hint.height(), margin + metricsOfFont.height());
        }
        QVERIFY(!model->headerData(0, Qt::Vertical, Qt::FontRole).isValid());
    }

    void shouldStayConsistentWhileEverythingChanges()
    {
        Page page = Page::make();
        auto settings = tablefixtures::colorSettings();
        auto model = makeModel(page, settings);
        new QAbstractItemModelTester(model.get(), QAbstractItemModelTester::FailureReportingMode::QtTest,
                                     model.get());
        QSignalSpy resets(model.get(), &QAbstractItemModel::modelReset);
        QVERIFY(resets.isValid());

        page.data->setTrials({page.trials[0]});
        QCOMPARE(resets.count(), 1);
        QCOMPARE(model->rowCount(), 6);

        page.data->addTrial(page.trials[2]);
        page.selection->setActiveTrials({page.trials[2]});
        QCOMPARE(rowKeys(*model).last(), QStringLiteral("T3@45as110"));

        page.selection->setColorGeometryFilter({Geometry("45as15")});
        QCOMPARE(model->rowCount(), 2);

        const int before = resets.count();
        settings->tableColorSpaceCoordinatesSetting()->setSelectedValue("CIELabCh");
        QVERIFY(resets.count() > before);
        QCOMPARE(model->columnCount(), 3 + 5 + 1);

        settings->tableDEMetricsSetting()->setSelectedValues({});
        QCOMPARE(model->columnCount(), 3 + 5);

        page.data->setColorimetricCondition(ColorimetricCondition("A", "2"));
        QCOMPARE(model->headerData(3, Qt::Horizontal).toString(), QStringLiteral("L\n(A/2)"));

        page.data->setStandard(nullptr);
        QCOMPARE(model->rowCount(), 1);
        page.data->clearTrials();
        page.selection->setActiveTrials({});
        QCOMPARE(model->rowCount(), 0);

        // Selecting a trial or geometry moves no row.
        const int resetsBefore = resets.count();
        page.selection->setSelectedTrial(page.trials[0]);
        page.selection->setSelectedColorGeometry(Geometry("45as45"));
        QCOMPARE(resets.count(), resetsBefore);
    }

    void shouldForgetReplacedModels()
    {
        Page first = Page::make();
        Page second = Page::make();
        auto model = makeModel(first);
        model->setModels(second.data, second.selection);
        QSignalSpy resets(model.get(), &QAbstractItemModel::modelReset);
        first.data->clearTrials();
        first.selection->setColorGeometryFilter({Geometry("45as15")});
        QCOMPARE(resets.count(), 0);
        QCOMPARE(model->rowCount(), 12);
    }

    void shouldFindRowsOfTrialsAndStandard()
    {
        Page page = Page::make();
        auto model = makeModel(page);
        QCOMPARE(model->standardRowOf(Geometry("45as110")), 2);
        QCOMPARE(model->rowOf(page.trials[1], Geometry("45as45")), 7);
        QCOMPARE(model->rowOf(page.trials[1], Geometry("15as15")), -1);
        QVERIFY(model->rowAt(0)->isStandard());
        QCOMPARE(model->rowAt(7)->trial(), page.trials[1]);
        QVERIFY(!model->rowAt(12));
        QCOMPARE(model->index(0, 0).data(MultiColorValueTableModel::StandardRowRole).toBool(), true);
        QCOMPARE(model->index(3, 0).data(MultiColorValueTableModel::StandardRowRole).toBool(), false);
    }

    void shouldUseTheNameFormat()
    {
        Page page = Page::make();
        page.trials[0]->setTimeStamp(Timestamp(2024, 3, 5, 7, 0, 0));
        page.data->setNameFormat("<Name> <Day>.<Month>.");
        auto model = makeModel(page);
        QCOMPARE(model->index(3, 0).data().toString(), QStringLiteral("T1 5.3."));
        QCOMPARE(model->index(0, 0).data().toString(), QStringLiteral("STD"));
    }

    void shouldCloneLayoutAndData()
    {
        Page page = Page::make();
        auto model = makeModel(page);
        model->setShowStandard(false);
        model->setDecimals(4);
        model->setGeneralColumns({MultiColorValueTableModel::GeneralColumn::Geometry});
        const auto copy = model->clone();
        QVERIFY(copy != model);
        QCOMPARE(copy->rowCount(), model->rowCount());
        QCOMPARE(copy->columnCount(), model->columnCount());
        QCOMPARE(copy->appearanceViewDataModel(), page.data);
        QCOMPARE(copy->trialSelectionModel(), page.selection);
        for (int r = 0; r < model->rowCount(); ++r)
            for (int c = 0; c < model->columnCount(); ++c)
                QCOMPARE(copy->index(r, c).data(), model->index(r, c).data());
        // The clone follows the shared models on its own.
        page.data->setTrials({page.trials[0]});
        QCOMPARE(copy->rowCount(), 3);
    }

    void shouldFlagNothingEditable()
    {
        Page page = Page::make();
        auto model = makeModel(page);
        QCOMPARE(model->flags(model->index(0, 0)), Qt::ItemIsSelectable | Qt::ItemIsEnabled | Qt::ItemNeverHasChildren);
        QCOMPARE(model->flags(QModelIndex()), Qt::NoItemFlags);
    }

    void toleranceSelectorShouldDriveTheCurrentSet()
    {
        Page page = Page::make();
        auto second = tablefixtures::deltaESet("Second", {"45as15"});
        auto model = makeModel(page);
        ToleranceSelector *selector = model->toleranceSelector();
        QSignalSpy changed(selector, &ToleranceSelector::sgToleranceSetsChanged);
        QWidget parent;
        QComboBox *combo = selector->createComboBox(&parent);
        QCOMPARE(combo->count(), 1);
        QCOMPARE(selector->currentIndex(), 0);

        page.standard->setToleranceSets({page.toleranceSet, second});
        page.data->setStandard(nullptr);
        page.data->setStandard(page.standard);
        QVERIFY(changed.count() > 0);
        QCOMPARE(selector->toleranceSetNames(), (QStringList{"dE Set", "Second"}));
        QCOMPARE(selector->currentIndex(), -1); // several sets clear the choice
        QCOMPARE(combo->count(), 2);

        QVERIFY(selector->setCurrentIndex(1));
        QCOMPARE(page.data->currentToleranceSet(), second);
        QCOMPARE(combo->currentIndex(), 1);
        QVERIFY(!selector->setCurrentIndex(2));
        QVERIFY(!selector->setCurrentToleranceSet(tablefixtures::deltaESet("Foreign", {})));
        QCOMPARE(page.data->currentToleranceSet(), second);

        Q_EMIT combo->activated(0);
        QCOMPARE(page.data->currentToleranceSet(), page.toleranceSet);

        ToleranceSelector detached;
        QCOMPARE(detached.currentIndex(), -1);
        QVERIFY(!detached.setCurrentIndex(0));
        QVERIFY(detached.toleranceSets().empty());
    }
};

QTEST_MAIN(TestMultiColorValueTableModel)
#include "tst_multicolorvaluetablemodel.moc"
