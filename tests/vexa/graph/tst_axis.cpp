#include <vexa/graph/axis.h>

#include <QtTest>

#include <cmath>
#include <limits>
#include <stdexcept>

// Ranges, ticks and tick labels of a line graph axis, including the rules whose
// arithmetic is easy to get wrong: headroom on top only, the 1.25 / 3.01 step
// thresholds with the 1e-10 end tolerance, and labels cut by characters.
class tst_Axis : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void constructors_data();
    void constructors();
    void calculateRange_data();
    void calculateRange();
    void rangeNotCalculated_data();
    void rangeNotCalculated();
    void ticks_data();
    void ticks();
    void degenerateRangesTerminate_data();
    void degenerateRangesTerminate();
    void tickLabel_data();
    void tickLabel();
};

namespace {

constexpr double NaN = std::numeric_limits<double>::quiet_NaN();
constexpr double Inf = std::numeric_limits<double>::infinity();

Axis makeAxis(const QString &kind)
{
    if (kind == "fixed")
        return Axis(0.0, 1.0, "R");
    if (kind == "min")
        return Axis(0.0, Axis::Automatic, "R");
    if (kind == "max")
        return Axis(Axis::Automatic, 1.0, "R");
    return Axis(Axis::Automatic, Axis::Automatic, "R");
}

} // namespace

void tst_Axis::constructors_data()
{
    QTest::addColumn<QString>("kind");
    QTest::addColumn<bool>("fixedMin");
    QTest::addColumn<bool>("fixedMax");
    QTest::newRow("both fixed") << "fixed" << true << true;
    QTest::newRow("fixed minimum") << "min" << true << false;
    QTest::newRow("fixed maximum") << "max" << false << true;
    QTest::newRow("automatic") << "auto" << false << false;
}

void tst_Axis::constructors()
{
    QFETCH(QString, kind);
    QFETCH(bool, fixedMin);
    QFETCH(bool, fixedMax);
    Axis axis = makeAxis(kind);
    QCOMPARE(axis.name(), std::string("R"));
    QCOMPARE(bool(axis.fixedMin()), fixedMin);
    QCOMPARE(bool(axis.fixedMax()), fixedMax);
    if (fixedMin)
        QCOMPARE(*axis.fixedMin(), 0.0);
    if (fixedMax)
        QCOMPARE(*axis.fixedMax(), 1.0);
    QVERIFY(!axis.hasRange());
    axis.setName("nm");
    QCOMPARE(axis.name(), std::string("nm"));
}

void tst_Axis::calculateRange_data()
{
    QTest::addColumn<QString>("kind");
    QTest::addColumn<double>("smallest");
    QTest::addColumn<double>("largest");
    QTest::addColumn<bool>("found");
    QTest::addColumn<double>("min");
    QTest::addColumn<double>("max");
    // Headroom of 5 % of the data's span, on top only.
    QTest::newRow("400-700 automatic") << "auto" << 400.0 << 700.0 << true << 400.0 << 715.0;
    QTest::newRow("negative data") << "auto" << -2.0 << 2.0 << true << -2.0 << 2.2;
    QTest::newRow("one value") << "auto" << 3.0 << 3.0 << true << 3.0 << 3.0;
    // The headroom comes from the data, not from the fixed minimum.
    QTest::newRow("fixed minimum") << "min" << 0.2 << 0.8 << true << 0.0 << 0.83;
    QTest::newRow("fixed maximum") << "max" << 0.2 << 0.8 << true << 0.2 << 1.0;
    QTest::newRow("fixed range ignores data") << "fixed" << -5.0 << 5.0 << true << 0.0 << 1.0;
    QTest::newRow("no data") << "auto" << 1e10 << -1e10 << false << 0.0 << 0.0;
    QTest::newRow("no data, fixed minimum") << "min" << 1e10 << -1e10 << false << 0.0 << 0.0;
    QTest::newRow("no data, fixed maximum") << "max" << 1e10 << -1e10 << false << 0.0 << 1.0;
}

void tst_Axis::calculateRange()
{
    QFETCH(QString, kind);
    QFETCH(double, smallest);
    QFETCH(double, largest);
    QFETCH(bool, found);
    QFETCH(double, min);
    QFETCH(double, max);
    Axis axis = makeAxis(kind);
    axis.calculateRange(smallest, largest, found);
    QVERIFY(axis.hasRange());
    QCOMPARE(axis.min(), min);
    QVERIFY2(std::fabs(axis.max() - max) < 1e-12, qPrintable(QString::number(axis.max(), 'g', 17)));
    axis.clearRange();
    QVERIFY(!axis.hasRange());
}

void tst_Axis::rangeNotCalculated_data()
{
    QTest::addColumn<int>("call");
    QTest::newRow("min") << 0;
    QTest::newRow("max") << 1;
    QTest::newRow("ticks") << 2;
    QTest::newRow("tick step") << 3;
    QTest::newRow("tick label") << 4;
}

void tst_Axis::rangeNotCalculated()
{
    QFETCH(int, call);
    const Axis axis(0.0, 1.0, "R"); // fixed, yet no range until calculated
    try {
        switch (call) {
        case 0: axis.min(); break;
        case 1: axis.max(); break;
        case 2: axis.ticks(); break;
        case 3: axis.tickStep(); break;
        default: axis.tickLabel(0.5); break;
        }
        QFAIL("no exception");
    } catch (const std::logic_error &e) {
        QCOMPARE(QString::fromLatin1(e.what()), QStringLiteral("Axis range not calculated"));
    }
}

void tst_Axis::ticks_data()
{
    QTest::addColumn<double>("min");
    QTest::addColumn<double>("max");
    QTest::addColumn<double>("step");
    QTest::addColumn<QVector<double>>("expected");
    // 315 wide: step 100, n = 3.15 keeps it.
    QTest::newRow("400-715") << 400.0 << 715.0 << 100.0 << QVector<double>{400, 500, 600, 700};
    // 300 wide: n = 3 < 3.01 halves the step.
    QTest::newRow("400-700") << 400.0 << 700.0 << 50.0 << QVector<double>{400, 450, 500, 550, 600, 650, 700};
    // n = 1 < 1.25: a fifth; the last tick survives through the 1e-10 tolerance.
    QTest::newRow("0-1") << 0.0 << 1.0 << 0.2 << QVector<double>{0, 0.2, 0.4, 0.6, 0.8, 1.0};
    QTest::newRow("0-0.83") << 0.0 << 0.83 << 0.1 << QVector<double>{0, 0.1, 0.2, 0.3, 0.4, 0.5, 0.6, 0.7, 0.8};
    // n = 1.575 < 3.01: half steps.
    QTest::newRow("0-1.575") << 0.0 << 1.575 << 0.5 << QVector<double>{0, 0.5, 1.0, 1.5};
    QTest::newRow("negative") << -2.0 << 2.2 << 1.0 << QVector<double>{-2, -1, 0, 1, 2};
    QTest::newRow("offset start") << 3.3 << 9.9 << 1.0 << QVector<double>{4, 5, 6, 7, 8, 9};
}

void tst_Axis::ticks()
{
    QFETCH(double, min);
    QFETCH(double, max);
    QFETCH(double, step);
    QFETCH(QVector<double>, expected);
    Axis axis(min, max);
    axis.calculateRange(0, 0, false);
    QVERIFY(std::fabs(axis.tickStep() - step) < 1e-12);
    const std::vector<double> ticks = axis.ticks();
    QCOMPARE(int(ticks.size()), expected.size());
    for (int i = 0; i < expected.size(); ++i)
        QVERIFY2(std::fabs(ticks[size_t(i)] - expected[i]) < 1e-9, qPrintable(QString::number(ticks[size_t(i)])));
}

void tst_Axis::degenerateRangesTerminate_data()
{
    QTest::addColumn<double>("min");
    QTest::addColumn<double>("max");
    QTest::addColumn<int>("maxTicks");
    QTest::newRow("empty 0..0") << 0.0 << 0.0 << 0;
    QTest::newRow("reversed") << 1.0 << 0.0 << 0;
    QTest::newRow("NaN minimum") << NaN << 1.0 << 0;
    QTest::newRow("NaN maximum") << 0.0 << NaN << 0;
    QTest::newRow("infinite") << -Inf << Inf << 0;
    QTest::newRow("overflowing span") << -1e308 << 1e308 << 0;
    // Steps far below the values' precision: k stops growing.
    QTest::newRow("huge offset") << 1e17 << 1e17 + 64.0 << 20;
    QTest::newRow("tiny span") << 0.0 << 1e-300 << 20;
}

void tst_Axis::degenerateRangesTerminate()
{
    QFETCH(double, min);
    QFETCH(double, max);
    QFETCH(int, maxTicks);
    const std::vector<double> ticks = Axis::ticks(min, max);
    QVERIFY(int(ticks.size()) <= maxTicks);
    for (size_t i = 1; i < ticks.size(); ++i)
        QVERIFY(ticks[i] > ticks[i - 1]);
}

void tst_Axis::tickLabel_data()
{
    QTest::addColumn<double>("value");
    QTest::addColumn<double>("step");
    QTest::addColumn<QString>("label");
    // Steps of 10 and more: the integer part, truncated toward zero.
    QTest::newRow("400 by 100") << 400.0 << 100.0 << "400";
    QTest::newRow("450.7 by 50") << 450.7 << 50.0 << "450";
    QTest::newRow("-12.7 by 10") << -12.7 << 10.0 << "-12";
    QTest::newRow("-0.5 by 10") << -0.5 << 10.0 << "0";
    // Finer steps: "%f" cut to 4 − floor(log10(step)) characters.
    QTest::newRow("0 by 0.2") << 0.0 << 0.2 << "0.000";
    QTest::newRow("0.6 by 0.2") << 0.6000000000000001 << 0.2 << "0.600";
    QTest::newRow("1 by 0.2") << 1.0 << 0.2 << "1.000";
    QTest::newRow("0.5 by 0.5") << 0.5 << 0.5 << "0.500";
    QTest::newRow("100.5 by 0.5") << 100.5 << 0.5 << "100.5";
    QTest::newRow("0.05 by 0.05") << 0.05 << 0.05 << "0.0500";
    QTest::newRow("10.05 by 0.05") << 10.05 << 0.05 << "10.050";
    QTest::newRow("100.05 by 0.05") << 100.05 << 0.05 << "100.05";
    QTest::newRow("-0.05 by 0.05") << -0.05 << 0.05 << "-0.050";
    QTest::newRow("2 by 2") << 2.0 << 2.0 << "2.00";
    QTest::newRow("12 by 2") << 12.0 << 2.0 << "12.0";
    QTest::newRow("400 by 1") << 400.0 << 1.0 << "400.";
}

void tst_Axis::tickLabel()
{
    QFETCH(double, value);
    QFETCH(double, step);
    QFETCH(QString, label);
    QCOMPARE(QString::fromStdString(Axis::tickLabel(value, step)), label);
}

QTEST_APPLESS_MAIN(tst_Axis)
#include "tst_axis.moc"
