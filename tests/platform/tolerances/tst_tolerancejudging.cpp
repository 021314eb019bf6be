#include <tolerances/boxlimit.h>
#include <tolerances/effectcolorrule.h>
#include <tolerances/tolerancefactory.h>

#include <domain/appearancevalues.h>
#include <domain/labvalue.h>
#include <domain/tolerance.h>
#include <domain/toleranceparameter.h>
#include <domain/toleranceset.h>
#include <domain/tolerancesetparameters.h>
#include <domain/tolerancevalue.h>

#include <colorimetry/colordifferenceformulas.h>

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
    void swappedBoxLimitsJudgeLikeOrderedOnes_data();
    void swappedBoxLimitsJudgeLikeOrderedOnes();
    void unusableLimitsGiveNoVerdictAndSayWhy_data();
    void unusableLimitsGiveNoVerdictAndSayWhy();
    void cie94FactorsFollowTheApplication_data();
    void cie94FactorsFollowTheApplication();
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
    // A pair typed the wrong way round is the same box.
    QTest::newRow("swapped limits inside") << 0.5 << 1.0 << -1.0 << 0.5;
    QTest::newRow("swapped limits below") << -2.0 << 1.0 << -1.0 << 2.0;
    QTest::newRow("swapped offset box") << 2.0 << 2.0 << 1.0 << 1.0;
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
    // A broken limit (NaN) judges nothing, and says why.
    tolerance->toleranceValue("dE")->setValue(qQNaN());
    const ToleranceJudgement broken = tolerance->judge(trial, standard, kCondition);
    QCOMPARE(broken.status, 0);
    QVERIFY2(broken.error.contains(QStringLiteral("not a number")), qPrintable(broken.error));
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

void tst_ToleranceJudging::swappedBoxLimitsJudgeLikeOrderedOnes_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QString>("axis");
    QTest::addColumn<double>("shift"); // of the whole sample
    QTest::addColumn<int>("status");
    // The metallic sample shifted by s moves L* at 45as45 by s/2 and a* by s/5.
    QTest::newRow("Lab inside") << "CIELab(+/-)" << "dL" << 0.6 << 1;
    QTest::newRow("Lab at the reference") << "CIELab(+/-)" << "dL" << 0.0 << 1;
    QTest::newRow("Lab outside") << "CIELab(+/-)" << "dL" << 3.0 << 3;
    QTest::newRow("Lab outside below") << "CIELab(+/-)" << "dL" << -3.0 << 3;
    QTest::newRow("LCh inside") << "CIELCh(+/-)" << "dL" << 0.6 << 1;
    QTest::newRow("LCh outside") << "CIELCh(+/-)" << "dL" << 3.0 << 3;
    QTest::newRow("flop inside") << "Flop Index(+/-)" << "dFI" << 0.1 << 1;
    QTest::newRow("flop outside") << "Flop Index(+/-)" << "dFI" << 8.0 << 3;
}

void tst_ToleranceJudging::swappedBoxLimitsJudgeLikeOrderedOnes()
{
    QFETCH(QString, type);
    QFETCH(QString, axis);
    QFETCH(double, shift);
    QFETCH(int, status);
    ToleranceFactory *factory = ToleranceFactory::toleranceFactory();
    const Geometry geometry = factory->supportedGeometries(type).isEmpty() ? Geometry() : Geometry("45as45");
    const auto ordered = factory->createTolerance(type, geometry);
    const auto swapped = factory->createTolerance(type, geometry);
    // As users type them: "dL-" 1, "dL+" -1.
    swapped->toleranceValue(axis + "-")->setValue(1.0);
    swapped->toleranceValue(axis + "+")->setValue(-1.0);
    const AppearanceValues standard = metallic(0.0);
    const ToleranceJudgement expected = ordered->judge(metallic(shift), standard, kCondition);
    const ToleranceJudgement actual = swapped->judge(metallic(shift), standard, kCondition);
    QCOMPARE(expected.status, status);
    QCOMPARE(actual.status, status);
    QCOMPARE(actual.normalizedDifference, expected.normalizedDifference);
    QVERIFY(swapped->validationError().isEmpty());

    // The editor's recompute stores the pair the right way round.
    auto set = std::make_shared<ToleranceSet>();
    set->setTolerances({swapped});
    factory->recomputeToleranceSet(*set);
    QCOMPARE(swapped->toleranceValue(axis + "-")->valueAsDouble(), -1.0);
    QCOMPARE(swapped->toleranceValue(axis + "+")->valueAsDouble(), 1.0);
}

void tst_ToleranceJudging::unusableLimitsGiveNoVerdictAndSayWhy_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QString>("limit"); // empty: the thresholds are broken instead
    QTest::addColumn<double>("value");
    QTest::addColumn<double>("pass");
    QTest::addColumn<double>("check");
    QTest::addColumn<QString>("message");
    for (const char *type : {"CIELab dE*ab", "CIE94", "CMC(l:c)", "CIEDE2000", "DIN99", "DIN99o", "DIN 6175-2", "Audi2000"})
        QTest::newRow(qPrintable(QStringLiteral("negative dE, %1").arg(type)))
            << type << "dE" << -1.0 << 1.0 << 0.8 << QStringLiteral("the limit dE is negative (-1)");
    QTest::newRow("NaN box limit") << "CIELab(+/-)" << "db+" << qQNaN() << 1.0 << 0.8
                                   << QStringLiteral("the limit db+ is not a number");
    QTest::newRow("infinite dE") << "CIEDE2000" << "dE" << qInf() << 1.0 << 0.8
                                 << QStringLiteral("the limit dE is not a number");
    QTest::newRow("check above pass") << "CIEDE2000" << "" << 0.0 << 1.0 << 1.2
                                      << QStringLiteral("the check threshold (1.2) is above the pass threshold (1)");
    QTest::newRow("pass threshold 0") << "CMC(l:c)" << "" << 0.0 << 0.0 << 0.0
                                      << QStringLiteral("the pass threshold (0) must be a number above 0");
    QTest::newRow("NaN check threshold") << "CIELCh(+/-)" << "" << 0.0 << 1.0 << qQNaN()
                                         << QStringLiteral("the check threshold (nan) must be a number of 0 or more");
}

void tst_ToleranceJudging::unusableLimitsGiveNoVerdictAndSayWhy()
{
    QFETCH(QString, type);
    QFETCH(QString, limit);
    QFETCH(double, value);
    QFETCH(double, pass);
    QFETCH(double, check);
    QFETCH(QString, message);
    ToleranceFactory *factory = ToleranceFactory::toleranceFactory();
    const auto tolerance = factory->createTolerance(type, Geometry("45as45"));
    QVERIFY(tolerance);
    if (!limit.isEmpty())
        tolerance->toleranceValue(limit)->setValue(value);
    tolerance->setPassThreshold(pass);
    tolerance->setCheckThreshold(check);
    const AppearanceValues standard = metallic(0.0);
    // Far outside any sensible limit and right on the standard: neither may pass.
    for (double shift : {0.0, 20.0}) {
        const ToleranceJudgement j = tolerance->judge(metallic(shift), standard, kCondition);
        QCOMPARE(j.status, 0);
        QVERIFY2(j.error.contains(message), qPrintable(j.error));
        QVERIFY2(j.error.contains(QStringLiteral("\"%1\" at 45as45").arg(type)), qPrintable(j.error));
    }
    QCOMPARE(tolerance->validationError(), tolerance->judge(standard, standard, kCondition).error);
    auto set = std::make_shared<ToleranceSet>();
    set->setName(QStringLiteral("Broken"));
    set->setTolerances({tolerance});
    QCOMPARE(factory->validationErrors(*set), QStringList{tolerance->validationError()});
}

void tst_ToleranceJudging::cie94FactorsFollowTheApplication_data()
{
    QTest::addColumn<QString>("path");
    QTest::addColumn<bool>("setWide"); // the application is a parameter of the set, not of the tolerance
    for (const char *path : {"as built", "recomputed", "deep copy", "read back", "copied tolerance"}) {
        QTest::newRow(qPrintable(QStringLiteral("%1, set-wide").arg(path))) << path << true;
        QTest::newRow(qPrintable(QStringLiteral("%1, own").arg(path))) << path << false;
    }
}

void tst_ToleranceJudging::cie94FactorsFollowTheApplication()
{
    QFETCH(QString, path);
    QFETCH(bool, setWide);
    ToleranceFactory *factory = ToleranceFactory::toleranceFactory();
    auto set = factory->createToleranceSet("CIE94", "Textile", {Geometry("45as45")});
    if (setWide) {
        // The tolerance's own "Application" still says "Graphic arts": the set's rules.
        auto application = std::make_shared<ToleranceParameter>(
            QStringLiteral("Application"), QStringLiteral("Application"), ToleranceParameter::ParameterType::Choice,
            QStringLiteral("Textiles"));
        set->toleranceSetParameters()->setToleranceParameters({application});
    } else {
        set->tolerances().front()->toleranceParameter("Application")->setValue(QStringLiteral("Textiles"));
    }
    if (path == "recomputed") {
        factory->recomputeToleranceSet(*set);
    } else if (path == "deep copy") {
        set = std::dynamic_pointer_cast<ToleranceSet>(set->deepCopy());
    } else if (path == "read back") {
        auto read = std::make_shared<ToleranceSet>();
        QString error;
        QVERIFY2(read->deserialize(set->serialize(), &error), qPrintable(error));
        set = read;
    }
    std::shared_ptr<Tolerance> tolerance = set->tolerances().front();
    if (path == "copied tolerance") {
        // A tolerance copied out of its set keeps the parameters it was judged with.
        tolerance = std::dynamic_pointer_cast<Tolerance>(tolerance->deepCopy());
    }
    QVERIFY(tolerance);

    const CieLab s{50.0, 20.0, 10.0};
    const CieLab t{52.0, 21.0, 11.5};
    const AppearanceValues standard = appearance({{"45as45", s.L, s.a, s.b}});
    const AppearanceValues trial = appearance({{"45as45", t.L, t.a, t.b}});
    const double textiles = ColorDifferenceFormulas::cie94(s, t, 2.0, 1.0, 1.0, 0.048, 0.014).dE;
    const double graphicArts = ColorDifferenceFormulas::cie94(s, t, 1.0, 1.0, 1.0, 0.045, 0.015).dE;
    QVERIFY(std::fabs(textiles - graphicArts) > 0.1);
    const ToleranceJudgement j = tolerance->judge(trial, standard, kCondition);
    QVERIFY2(std::fabs(j.colorDifferences.first() - textiles) < 1e-12,
             qPrintable(QStringLiteral("dE94 %1, textiles %2, graphic arts %3")
                            .arg(j.colorDifferences.first()).arg(textiles).arg(graphicArts)));
    // A stale kL typed into the tolerance does not change the verdict either.
    tolerance->toleranceParameter("kL")->setValue(1.0);
    QCOMPARE(tolerance->judge(trial, standard, kCondition).colorDifferences.first(), j.colorDifferences.first());
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
