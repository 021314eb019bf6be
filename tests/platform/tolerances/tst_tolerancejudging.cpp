#include <tolerances/boxlimit.h>
#include <tolerances/effectcolorrule.h>
#include <tolerances/tolerancefactory.h>

#include <domain/appearancevalues.h>
#include <domain/labvalue.h>
#include <domain/tolerance.h>
#include <domain/tolerancevalue.h>

#include <QtTest>

#include <cmath>
#include <functional>
#include <thread>

using namespace vexa;

namespace {

const ColorimetricCondition kCondition(QStringLiteral("D65"), QStringLiteral("10"));

struct Sample
{
    const char *geometry;
    double L, a, b;
};

AppearanceValues appearance(std::initializer_list<Sample> samples)
{
    AppearanceValues values;
    for (const Sample &s : samples) {
        auto lab = std::make_shared<LabValue>(s.L, s.a, s.b, kCondition);
        lab->setGeometry(Geometry(s.geometry));
        values.addColorValues(lab);
    }
    return values;
}

// A metallic standard at the effect angles.
AppearanceValues metallic(double shift)
{
    return appearance({{"45as15", 118.0 + 2.0 * shift, -0.9 + 0.2 * shift, 1.6},
                       {"45as25", 95.0 + shift, -0.8 + 0.2 * shift, 1.4},
                       {"45as45", 62.0 + 0.5 * shift, -0.6 + 0.2 * shift, 0.9},
                       {"45as75", 40.0 + 0.3 * shift, -0.4, 0.5 + 0.1 * shift},
                       {"45as110", 28.0 + 0.2 * shift, -0.3, 0.2 + 0.1 * shift},
                       {"45as-15", 130.0 + shift, -1.0, 2.0},
                       {"15as15", 100.0 + shift, -0.5, 1.0},
                       {"diffuse", 55.0 + shift, -0.5 + 0.2 * shift, 1.0 + 0.1 * shift}});
}

} // namespace

class tst_ToleranceJudging : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void boxLimit_data();
    void boxLimit();
    void everyTypePassWarnFail_data();
    void everyTypePassWarnFail();
    void thresholdsAndLimitsMoveTheBoundary();
    void boxWithOffsetLimits();
    void missingDataGivesNoVerdict();
    void effectKernelReferenceValues_data();
    void effectKernelReferenceValues();
    void effectTypesRejectNonEffectGeometry();
    void flopIndexDifferences();
    void concurrentJudgingIsDeterministic();
};

void tst_ToleranceJudging::initTestCase()
{
    QVERIFY(ToleranceFactory::toleranceFactory());
}

void tst_ToleranceJudging::boxLimit_data()
{
    QTest::addColumn<double>("delta");
    QTest::addColumn<double>("lower");
    QTest::addColumn<double>("upper");
    QTest::addColumn<double>("expected");
    QTest::newRow("inside upper") << 0.5 << -1.0 << 2.0 << 0.25;
    QTest::newRow("inside lower") << -0.5 << -1.0 << 2.0 << 0.5;
    QTest::newRow("offset box centre") << 1.5 << 1.0 << 2.0 << 0.0;
    QTest::newRow("offset box edge") << 2.0 << 1.0 << 2.0 << 1.0;
    QTest::newRow("offset box below") << 0.0 << 1.0 << 2.0 << 3.0;
    QTest::newRow("disabled axis") << 5.0 << 0.0 << 0.0 << 0.0;
    QTest::newRow("zero-width side") << -0.1 << 0.0 << 1.0 << qInf();
    QTest::newRow("swapped limits") << 0.5 << 1.0 << -1.0 << qInf();
}

void tst_ToleranceJudging::boxLimit()
{
    QFETCH(double, delta);
    QFETCH(double, lower);
    QFETCH(double, upper);
    QFETCH(double, expected);
    const double n = BoxLimit::normalized(delta, lower, upper);
    if (std::isinf(expected))
        QVERIFY(std::isinf(n));
    else
        QVERIFY2(std::fabs(n - expected) < 1e-12, qPrintable(QString::number(n)));
}

void tst_ToleranceJudging::everyTypePassWarnFail_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QString>("geometry");
    for (const QString &type : ToleranceFactory::toleranceFactory()->allToleranceTypes()) {
        const QVector<Geometry> geometries = ToleranceFactory::toleranceFactory()->supportedGeometries(type);
        QTest::newRow(qPrintable(type)) << type << (geometries.isEmpty() ? QString() : geometries.at(1).toString());
    }
}

void tst_ToleranceJudging::everyTypePassWarnFail()
{
    QFETCH(QString, type);
    QFETCH(QString, geometry);
    const auto tolerance = ToleranceFactory::toleranceFactory()->createTolerance(type, Geometry(geometry));
    QVERIFY(tolerance);
    const AppearanceValues standard = metallic(0.0);
    QCOMPARE(tolerance->judge(standard, standard, kCondition).status, 1);

    // Bisection along a shift of the whole sample for the shift that reaches a given normalised difference.
    auto normalized = [&](double shift) { return tolerance->judge(metallic(shift), standard, kCondition).normalizedDifference; };
    auto shiftFor = [&](double target) {
        double lo = 0.0;
        double hi = 50.0;
        for (int i = 0; i < 60; ++i) {
            const double mid = 0.5 * (lo + hi);
            (normalized(mid) < target ? lo : hi) = mid;
        }
        return 0.5 * (lo + hi);
    };
    const struct { double n; int status; } cases[] = {{0.5, 1}, {0.9, 2}, {1.5, 3}};
    for (const auto &c : cases) {
        const double shift = shiftFor(c.n);
        const ToleranceJudgement j = tolerance->judge(metallic(shift), standard, kCondition);
        QVERIFY2(std::fabs(j.normalizedDifference - c.n) < 1e-6,
                 qPrintable(QStringLiteral("n %1 for target %2").arg(j.normalizedDifference).arg(c.n)));
        QCOMPARE(j.status, c.status);
        QVERIFY(!j.colorDifferences.isEmpty());
        QCOMPARE(j.colorDifferences.size(), j.differenceNames.size());
        QVERIFY(std::isfinite(j.colorDifferences.first()));
    }
}

void tst_ToleranceJudging::thresholdsAndLimitsMoveTheBoundary()
{
    const auto tolerance = ToleranceFactory::toleranceFactory()->createTolerance("CIEDE2000", Geometry("45as45"));
    const AppearanceValues standard = appearance({{"45as45", 50.0, 10.0, 10.0}});
    const AppearanceValues trial = appearance({{"45as45", 50.9, 10.0, 10.0}});
    const ToleranceJudgement first = tolerance->judge(trial, standard, kCondition);
    QVERIFY(first.normalizedDifference > 0.8 && first.normalizedDifference < 1.0);
    QCOMPARE(first.status, 2);
    tolerance->setCheckThreshold(0.95);
    QCOMPARE(tolerance->status(trial, standard, kCondition), 1);
    tolerance->setCheckThreshold(0.5);
    tolerance->setPassThreshold(0.6);
    QCOMPARE(tolerance->status(trial, standard, kCondition), 3);
    tolerance->setCheckThreshold(0.8);
    tolerance->setPassThreshold(1.0);
    tolerance->toleranceValue("dE")->setValue(2.0);
    const ToleranceJudgement wider = tolerance->judge(trial, standard, kCondition);
    QVERIFY(std::fabs(wider.normalizedDifference - first.normalizedDifference / 2.0) < 1e-12);
    QCOMPARE(wider.status, 1);
    // The main figure is the formula's difference, not the normalised one.
    QCOMPARE(wider.colorDifferences.first(), first.colorDifferences.first());
    // A broken limit (NaN) fails instead of passing silently.
    tolerance->toleranceValue("dE")->setValue(qQNaN());
    QCOMPARE(tolerance->status(trial, standard, kCondition), 3);
}

void tst_ToleranceJudging::boxWithOffsetLimits()
{
    const auto tolerance = ToleranceFactory::toleranceFactory()->createTolerance("CIELab(+/-)", Geometry("45as45"));
    tolerance->toleranceValue("dL-")->setValue(0.5);
    tolerance->toleranceValue("dL+")->setValue(1.5);
    const AppearanceValues standard = appearance({{"45as45", 50.0, 0.0, 0.0}});
    QCOMPARE(tolerance->status(appearance({{"45as45", 51.0, 0.0, 0.0}}), standard, kCondition), 1);
    QCOMPARE(tolerance->status(standard, standard, kCondition), 3); // ΔL 0 is outside [0.5, 1.5]
    // The main figure of a box is ΔE*ab, and a ΔE*ab above 1 can pass.
    const ToleranceJudgement j = tolerance->judge(appearance({{"45as45", 51.0, 0.7, 0.7}}), standard, kCondition);
    QCOMPARE(j.status, 1);
    QVERIFY(j.colorDifferences.first() > 1.0);
    // Both limits 0 switch an axis off.
    tolerance->toleranceValue("da-")->setValue(0.0);
    tolerance->toleranceValue("da+")->setValue(0.0);
    QCOMPARE(tolerance->status(appearance({{"45as45", 51.0, 30.0, 0.0}}), standard, kCondition), 1);
}

void tst_ToleranceJudging::missingDataGivesNoVerdict()
{
    for (const QString &type : ToleranceFactory::toleranceFactory()->allToleranceTypes()) {
        const QVector<Geometry> geometries = ToleranceFactory::toleranceFactory()->supportedGeometries(type);
        const auto tolerance = ToleranceFactory::toleranceFactory()->createTolerance(
            type, geometries.isEmpty() ? Geometry() : geometries.first());
        const AppearanceValues full = metallic(0.0);
        const AppearanceValues partial = appearance({{"45as45", 62.0, -0.6, 0.9}, {"45as25", 95.0, -0.8, 1.4}});
        const ToleranceJudgement j = tolerance->judge(partial, full, kCondition);
        QVERIFY2(j.status == 0, qPrintable(type));
        QCOMPARE(tolerance->status(full, AppearanceValues(), kCondition), 0);
        // A stored value of another condition cannot be used either.
        QCOMPARE(tolerance->status(full, full, ColorimetricCondition("A", "2")), 0);
    }
}

void tst_ToleranceJudging::effectKernelReferenceValues_data()
{
    QTest::addColumn<double>("gamma");
    QTest::addColumn<QVector<double>>("standard");
    QTest::addColumn<QVector<double>>("trial");
    QTest::addColumn<QVector<double>>("expected"); // SL SC SH sigma dEc dEp dEeff
    QTest::newRow("15 neutral") << 15.0 << QVector<double>{118.0, -0.9, 1.6} << QVector<double>{119.5, -0.7, 2.3}
                                << QVector<double>{3.7346, 0.7000, 0.7000, 1.0000, 1.1149, 1.1149, 1.1149};
    QTest::newRow("110 neutral") << 110.0 << QVector<double>{28.0, -0.3, 0.2} << QVector<double>{28.6, -0.1, 0.8}
                                 << QVector<double>{1.0843, 0.7000, 0.7000, 1.0000, 1.0595, 1.0595, 1.0595};
    QTest::newRow("25 chromatic") << 25.0 << QVector<double>{60.0, 48.0, 30.0} << QVector<double>{61.0, 49.5, 29.0}
                                  << QVector<double>{2.4267, 2.5811, 1.0412, 0.0000, 2.6082, 1.6477, 1.6477};
    QTest::newRow("75 chromatic") << 75.0 << QVector<double>{20.0, 5.0, -30.0} << QVector<double>{20.4, 6.0, -31.0}
                                  << QVector<double>{1.0941, 1.6590, 0.8605, 0.0000, 2.0531, 1.2259, 1.2259};
    QTest::newRow("15 blend") << 15.0 << QVector<double>{60.0, 12.0, 13.5} << QVector<double>{60.8, 13.0, 14.5}
                              << QVector<double>{3.2657, 2.1587, 1.1520, 0.3197, 2.0351, 0.7019, 1.1281};
    QTest::newRow("25 blend") << 25.0 << QVector<double>{35.0, 6.0, -9.0} << QVector<double>{35.5, 6.8, -9.9}
                              << QVector<double>{2.1506, 1.2225, 0.8252, 0.9986, 1.7359, 1.0218, 1.7349};
}

void tst_ToleranceJudging::effectKernelReferenceValues()
{
    QFETCH(double, gamma);
    QFETCH(QVector<double>, standard);
    QFETCH(QVector<double>, trial);
    QFETCH(QVector<double>, expected);
    const auto tolerance = ToleranceFactory::toleranceFactory()->createTolerance("DIN 6175-2");
    const auto r = EffectColorRule::evaluate(*tolerance, {standard[0], standard[1], standard[2]},
                                             {trial[0], trial[1], trial[2]}, gamma);
    const double actual[] = {r.SL, r.SC, r.SH, r.sigma, r.cartesian, r.polar, r.effective};
    for (int i = 0; i < 7; ++i)
        QVERIFY2(std::fabs(actual[i] - expected[i]) < 1e-4,
                 qPrintable(QStringLiteral("item %1: %2 vs %3").arg(i).arg(actual[i], 0, 'f', 5).arg(expected[i])));
}

void tst_ToleranceJudging::effectTypesRejectNonEffectGeometry()
{
    for (const char *type : {"DIN 6175-2", "Audi2000"}) {
        QVERIFY(!ToleranceFactory::toleranceFactory()->createTolerance(type, Geometry("45as-15")));
        auto tolerance = ToleranceFactory::toleranceFactory()->createTolerance(type, Geometry("45as15"));
        tolerance->setGeometry(QStringLiteral("45as-15"));
        QCOMPARE(tolerance->status(metallic(1.0), metallic(0.0), kCondition), 0);
    }
}

void tst_ToleranceJudging::flopIndexDifferences()
{
    const auto tolerance = ToleranceFactory::toleranceFactory()->createTolerance("Flop Index(+/-)");
    QVERIFY(tolerance->geometry().isEmpty());
    const AppearanceValues standard = appearance({{"45as15", 118.0, 0, 0}, {"45as45", 62.0, 0, 0}, {"45as110", 28.0, 0, 0}});
    const AppearanceValues trial = appearance({{"45as15", 130.0, 0, 0}, {"45as45", 60.0, 0, 0}, {"45as110", 20.0, 0, 0}});
    const ToleranceJudgement j = tolerance->judge(trial, standard, kCondition);
    QCOMPARE(j.colorDifferences.size(), 3);
    QVERIFY(std::fabs(j.colorDifferences.at(1) - 14.6720) < 1e-4);
    QVERIFY(std::fabs(j.colorDifferences.at(2) - 11.4158) < 1e-4);
    QVERIFY(std::fabs(j.colorDifferences.at(0) - (14.6720 - 11.4158)) < 2e-4);
    QCOMPARE(j.status, 3);
    // L*45 = 0: the index is undefined, so no verdict.
    const AppearanceValues black = appearance({{"45as15", 5.0, 0, 0}, {"45as45", 0.0, 0, 0}, {"45as110", 0.0, 0, 0}});
    QCOMPARE(tolerance->status(black, standard, kCondition), 0);
}

void tst_ToleranceJudging::concurrentJudgingIsDeterministic()
{
    std::vector<std::shared_ptr<Tolerance>> tolerances;
    for (const QString &type : ToleranceFactory::toleranceFactory()->allToleranceTypes()) {
        const QVector<Geometry> geometries = ToleranceFactory::toleranceFactory()->supportedGeometries(type);
        tolerances.push_back(ToleranceFactory::toleranceFactory()->createTolerance(
            type, geometries.isEmpty() ? Geometry() : geometries.first()));
    }
    const AppearanceValues standard = metallic(0.0);
    std::vector<AppearanceValues> trials;
    for (int i = 0; i < 40; ++i)
        trials.push_back(metallic(0.05 * i));
    auto run = [&]() {
        std::vector<double> out;
        for (const auto &tolerance : tolerances) {
            for (const AppearanceValues &trial : trials) {
                const ToleranceJudgement j = tolerance->judge(trial, standard, kCondition);
                out.push_back(j.status);
                out.push_back(j.normalizedDifference);
            }
        }
        return out;
    };
    const std::vector<double> reference = run();
    std::vector<std::vector<double>> results(4);
    std::vector<std::thread> threads;
    for (auto &result : results)
        threads.emplace_back([&result, &run] { result = run(); });
    for (auto &thread : threads)
        thread.join();
    for (const auto &result : results)
        QVERIFY(result == reference);
}

QTEST_GUILESS_MAIN(tst_ToleranceJudging)
#include "tst_tolerancejudging.moc"
