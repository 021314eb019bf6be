#include "graphfixtures.h"

#include <vexa/graph/metamerismview.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <colorimetry/colorconverter.h>
#include <colorimetry/colordifferencecalculator.h>
#include <colorimetry/colorindicescalculator.h>

#include <QLabel>
#include <QTableWidget>
#include <QtTest>

#include <cmath>

using namespace vexa;

// The metamerism readout of the selected trial: the columns per illuminant, the numbers
// the colorimetry library gives for each geometry, and the states without a selection.
class tst_MetamerismView : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void columnsPerCondition_data();
    void columnsPerCondition();
    void valuesPerGeometry();
    void followsSelectionAndFilter();
    void formula();
    void withoutSelection();

private:
    graphfixtures::Page m_page;
};

namespace {

QStringList headers(const QTableWidget *table)
{
    QStringList result;
    for (int c = 0; c < table->columnCount(); ++c)
        result << table->horizontalHeaderItem(c)->text();
    return result;
}

QStringList rows(const QTableWidget *table)
{
    QStringList result;
    for (int r = 0; r < table->rowCount(); ++r)
        result << table->verticalHeaderItem(r)->text();
    return result;
}

} // namespace

void tst_MetamerismView::init()
{
    m_page.reset({fixtures::trial(QStringLiteral("T1"), 0.22, fixtures::threeAngles(), 575),
                  fixtures::trial(QStringLiteral("T2"), 0.18, {QStringLiteral("45as45")})});
}

void tst_MetamerismView::columnsPerCondition_data()
{
    QTest::addColumn<QString>("page");
    QTest::addColumn<QStringList>("tests");
    QTest::addColumn<QStringList>("headers");
    QTest::addColumn<QString>("observer");
    QTest::newRow("D65 against A and F11") << "D65/10" << QStringList{"A", "F11"}
                                           << QStringList{"ΔE D65", "ΔE A", "ΔE F11", "MI A", "MI F11"} << "10";
    QTest::newRow("the page under A") << "A/2" << QStringList{"A", "F11"} << QStringList{"ΔE A", "ΔE F11", "MI F11"}
                                      << "2";
    QTest::newRow("unknown test illuminant") << "D65/10" << QStringList{"X", "D50"}
                                             << QStringList{"ΔE D65", "ΔE D50", "MI D50"} << "10";
    QTest::newRow("no tests") << "D65/10" << QStringList() << QStringList{"ΔE D65"} << "10";
}

void tst_MetamerismView::columnsPerCondition()
{
    QFETCH(QString, page);
    QFETCH(QStringList, tests);
    QFETCH(QStringList, headers);
    QFETCH(QString, observer);
    m_page.data->setColorimetricCondition(ColorimetricCondition::fromString(page));
    MetamerismView view;
    view.setModels(m_page.data, m_page.selection);
    view.setTestIlluminants(tests);
    QCOMPARE(::headers(view.table()), headers);
    QVERIFY(view.titleLabel()->text().endsWith(QStringLiteral(", %1° observer)").arg(observer)));
    for (const ColorimetricCondition &condition : view.conditions())
        QCOMPARE(condition.observer(), observer);
    QCOMPARE(view.table()->rowCount(), 3);
}

void tst_MetamerismView::valuesPerGeometry()
{
    MetamerismView view;
    view.setModels(m_page.data, m_page.selection);
    QCOMPARE(rows(view.table()), QStringList({"45as15", "45as45", "45as110"}));
    const QVector<ColorimetricCondition> conditions = view.conditions();
    QCOMPARE(conditions.size(), 3);
    for (int r = 0; r < 3; ++r) {
        const Geometry g(view.table()->verticalHeaderItem(r)->text());
        const auto s = m_page.standard->appearanceValues()->reflectanceAt(g);
        const auto t = m_page.trials[0]->appearanceValues()->reflectanceAt(g);
        for (int c = 0; c < 3; ++c) {
            const double dE = ColorDifferenceCalculator::Default_DE(QStringLiteral("CIE2000"),
                                                                    ColorConverter::toLab(*s, conditions[c]),
                                                                    ColorConverter::toLab(*t, conditions[c]));
            QCOMPARE(view.valueAt(r, c), dE);
            QCOMPARE(view.table()->item(r, c)->text(), QString::number(dE, 'f', 2));
        }
        for (int c = 1; c < 3; ++c) {
            const double mi = ColorIndicesCalculator::MetamerismIndex(*s, *t, conditions[0], conditions[c],
                                                                      QStringLiteral("CIE2000"));
            QCOMPARE(view.valueAt(r, 2 + c), mi);
            // The trial is lighter and shifted: the correction leaves less than the plain difference.
            QVERIFY(mi < view.valueAt(r, c));
        }
        // The selected geometry (45as45) is bold.
        QCOMPARE(view.table()->item(r, 0)->font().bold(), g == Geometry("45as45"));
    }
    QVERIFY(view.titleLabel()->text().contains(QStringLiteral("T1 against STD")));
}

void tst_MetamerismView::followsSelectionAndFilter()
{
    MetamerismView view;
    view.setModels(m_page.data, m_page.selection);
    m_page.selection->setSelectedTrial(m_page.trials[1]);
    QCOMPARE(rows(view.table()), QStringList({"45as45"}));
    m_page.selection->setSelectedTrial(m_page.trials[0]);
    m_page.selection->setColorGeometryFilter({Geometry("45as15"), Geometry("45as110")});
    QCOMPARE(rows(view.table()), QStringList({"45as15", "45as110"}));
    const double before = view.valueAt(0, 0);
    m_page.data->setColorimetricCondition(ColorimetricCondition(QStringLiteral("D50"), QStringLiteral("2")));
    QCOMPARE(view.table()->horizontalHeaderItem(0)->text(), QStringLiteral("ΔE D50"));
    QCOMPARE(view.conditions().front().toString(), QStringLiteral("D50/2"));
    QVERIFY(view.valueAt(0, 0) != before);
}

void tst_MetamerismView::formula()
{
    MetamerismView view;
    view.setModels(m_page.data, m_page.selection);
    const double de2000 = view.valueAt(1, 0);
    QVERIFY(view.setDeltaEFormula(QStringLiteral("CIELab")));
    QCOMPARE(view.deltaEFormula(), QStringLiteral("CIELab"));
    QVERIFY(view.valueAt(1, 0) != de2000);
    QVERIFY(!view.setDeltaEFormula(QStringLiteral("nonsense")));
    QCOMPARE(view.deltaEFormula(), QStringLiteral("CIELab"));
}

void tst_MetamerismView::withoutSelection()
{
    MetamerismView view;
    QCOMPARE(view.table()->rowCount(), 0);
    view.setModels(m_page.data, m_page.selection);
    m_page.selection->setActiveTrials({});
    QCOMPARE(view.table()->rowCount(), 0);
    QCOMPARE(view.titleLabel()->text(), QStringLiteral("Metamerism: select a trial"));
    QVERIFY(std::isnan(view.valueAt(0, 0)));
    m_page.selection->setSelectedTrial(m_page.trials[0]);
    m_page.data->setStandard(nullptr);
    QCOMPARE(view.table()->rowCount(), 0);
    QCOMPARE(view.titleLabel()->text(), QStringLiteral("Metamerism: no standard"));
}

QTEST_MAIN(tst_MetamerismView)
#include "tst_metamerismview.moc"
