// The boundary search of the colour plots, checked against tolerances whose regions are
// known in closed form.

#include "plotfixtures.h"

#include <vexa/plots/angledifferencetoleranceshapecalculator.h>
#include <vexa/plots/dividingtoleranceshapecalculator.h>

#include <QtTest>

#include <cmath>

using namespace vexa;

namespace {

const Geometry kGeometry("45as45");
constexpr double kPi = 3.14159265358979323846;

struct Setup
{
    std::shared_ptr<const AppearanceValues> standardValues;
    std::shared_ptr<const LabValue> standardLab;
};

Setup setupAt(double l, double a, double b)
{
    Setup s;
    s.standardValues = plotfixtures::labAppearance(l, a, b);
    auto lab = std::make_shared<LabValue>(l, a, b, plotfixtures::condition());
    lab->setGeometry(kGeometry);
    s.standardLab = lab;
    return s;
}

std::unique_ptr<ToleranceShapeCalculator> makeCalculator(const QString &kind, const Setup &s,
                                                         const std::shared_ptr<Tolerance> &tolerance, int accepted)
{
    if (kind == QLatin1String("angle"))
        return std::make_unique<AngleDifferenceToleranceShapeCalculator>(s.standardValues, s.standardLab, tolerance,
                                                                         accepted);
    return std::make_unique<DividingToleranceShapeCalculator>(s.standardValues, s.standardLab, tolerance, accepted);
}

double distance(const QPointF &p, const LabValue &standard)
{
    return std::hypot(p.x() - standard.a(), p.y() - standard.b());
}

double hueOf(const QPointF &p, const LabValue &standard)
{
    double h = std::atan2(p.y() - standard.b(), p.x() - standard.a()) * 180.0 / kPi;
    return h < -1e-9 ? h + 360.0 : h;
}

} // namespace

class tst_ToleranceShapeCalculator : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();

    void boundaryPointUsesSixteenProbesAndKeepsTheLast_data();
    void boundaryPointUsesSixteenProbesAndKeepsTheLast();
    void passEverythingGivesRingAt200_data();
    void passEverythingGivesRingAt200();
    void failEverythingCollapsesOntoStandard_data();
    void failEverythingCollapsesOntoStandard();
    void acceptedStatusChoosesInnerOrOuterBoundary_data();
    void acceptedStatusChoosesInnerOrOuterBoundary();
    void straightSectorGetsExactlyOneExtraVertex_data();
    void straightSectorGetsExactlyOneExtraVertex();
    void circularDeltaEabToleranceGivesItsRadius_data();
    void circularDeltaEabToleranceGivesItsRadius();
    void shapeIsOrderedByAscendingHue_data();
    void shapeIsOrderedByAscendingHue();
    void boxToleranceKeepsItsCorners_data();
    void boxToleranceKeepsItsCorners();
    void lightnessBoundaryOfDeltaEab_data();
    void lightnessBoundaryOfDeltaEab();
    void missingDataGivesNoShape_data();
    void missingDataGivesNoShape();
    void cancellingStopsProbing_data();
    void cancellingStopsProbing();
    void chordDirectionIgnoresSignOfB();
};

void tst_ToleranceShapeCalculator::initTestCase()
{
    QVERIFY(ToleranceFactory::toleranceFactory());
    plotfixtures::registerRule(QStringLiteral("Test pass all"), [](double, double, double) { return 1; });
    plotfixtures::registerRule(QStringLiteral("Test fail all"), [](double, double, double) { return 3; });
    plotfixtures::registerRule(QStringLiteral("Test warn all"), [](double, double, double) { return 2; });
    plotfixtures::registerRule(QStringLiteral("Test no verdict"), [](double, double, double) { return 0; });
    // Passes left of the vertical line da = 1.
    plotfixtures::registerRule(QStringLiteral("Test half plane"),
                               [](double, double da, double) { return da <= 1.0 ? 1 : 3; });
}

void tst_ToleranceShapeCalculator::boundaryPointUsesSixteenProbesAndKeepsTheLast_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<double>("angle");
    QTest::addColumn<double>("expectedRadius");
    // Always inside: 100 + 50 + ... + 50/2^14; the step 50/2^15 after the last probe is not applied.
    QTest::newRow("pass all at 0") << "Test pass all" << 0.0 << 200.0 - 50.0 / 16384.0;
    QTest::newRow("pass all at 137") << "Test pass all" << 137.0 << 200.0 - 50.0 / 16384.0;
    // Always outside: 100 - 50 - ... - 50/2^14.
    QTest::newRow("fail all at 0") << "Test fail all" << 0.0 << 50.0 / 16384.0;
    QTest::newRow("fail all at 250") << "Test fail all" << 250.0 << 50.0 / 16384.0;
}

void tst_ToleranceShapeCalculator::boundaryPointUsesSixteenProbesAndKeepsTheLast()
{
    QFETCH(QString, type);
    QFETCH(double, angle);
    QFETCH(double, expectedRadius);
    const Setup s = setupAt(60, 3, -4);
    DividingToleranceShapeCalculator calculator(s.standardValues, s.standardLab,
                                                plotfixtures::ruleTolerance(type, kGeometry), 1);
    const QPointF p = calculator.boundaryPoint(angle);
    QCOMPARE(calculator.evaluationCount(), 16);
    QVERIFY2(std::abs(distance(p, *s.standardLab) - expectedRadius) < 1e-9,
             qPrintable(QString::number(distance(p, *s.standardLab), 'g', 12)));
    QVERIFY(std::abs(hueOf(p, *s.standardLab) - angle) < 1e-6);
}

void tst_ToleranceShapeCalculator::passEverythingGivesRingAt200_data()
{
    QTest::addColumn<QString>("calculator");
    QTest::addColumn<int>("expectedVertices");
    // 30° chords turn by 15° at a sector's middle, 15° ones by 7.5° (0.13 rad), 7.5° ones by
    // 3.75° (0.065 rad): every sector ends at 3.75° spacing.
    QTest::newRow("dividing") << "dividing" << 96;
    QTest::newRow("angle difference") << "angle" << -1;
}

void tst_ToleranceShapeCalculator::passEverythingGivesRingAt200()
{
    QFETCH(QString, calculator);
    QFETCH(int, expectedVertices);
    const Setup s = setupAt(50, -10, 20);
    auto c = makeCalculator(calculator, s, plotfixtures::ruleTolerance(QStringLiteral("Test pass all"), kGeometry), 1);
    const QPolygonF shape = c->calculateShape();
    QVERIFY(shape.size() >= 12);
    for (const QPointF &p : shape)
        QVERIFY(std::abs(distance(p, *s.standardLab) - 200.0) < 0.01);
    if (expectedVertices > 0) {
        QCOMPARE(shape.size(), expectedVertices);
        for (int i = 0; i < shape.size(); ++i)
            QVERIFY(std::abs(hueOf(shape.at(i), *s.standardLab) - 3.75 * i) < 1e-6);
        QCOMPARE(c->evaluationCount(), 96 * 16);
    }
}

void tst_ToleranceShapeCalculator::failEverythingCollapsesOntoStandard_data()
{
    QTest::addColumn<QString>("calculator");
    QTest::newRow("dividing") << "dividing";
    QTest::newRow("angle difference") << "angle";
}

void tst_ToleranceShapeCalculator::failEverythingCollapsesOntoStandard()
{
    QFETCH(QString, calculator);
    const Setup s = setupAt(70, 1.5, 2.5);
    auto c = makeCalculator(calculator, s, plotfixtures::ruleTolerance(QStringLiteral("Test fail all"), kGeometry), 1);
    const QPolygonF shape = c->calculateShape();
    QVERIFY(shape.size() >= 12);
    for (const QPointF &p : shape)
        QVERIFY(distance(p, *s.standardLab) < 0.01);
}

void tst_ToleranceShapeCalculator::acceptedStatusChoosesInnerOrOuterBoundary_data()
{
    QTest::addColumn<int>("accepted");
    QTest::addColumn<double>("expectedRadius");
    QTest::newRow("inner: warning is outside") << 1 << 0.0;
    QTest::newRow("outer: warning is inside") << 2 << 200.0;
}

void tst_ToleranceShapeCalculator::acceptedStatusChoosesInnerOrOuterBoundary()
{
    QFETCH(int, accepted);
    QFETCH(double, expectedRadius);
    const Setup s = setupAt(40, 0, 0);
    DividingToleranceShapeCalculator c(s.standardValues, s.standardLab,
                                       plotfixtures::ruleTolerance(QStringLiteral("Test warn all"), kGeometry), accepted);
    const QPolygonF shape = c.calculateShape();
    QVERIFY(!shape.isEmpty());
    for (const QPointF &p : shape)
        QVERIFY(std::abs(distance(p, *s.standardLab) - expectedRadius) < 0.01);
}

void tst_ToleranceShapeCalculator::straightSectorGetsExactlyOneExtraVertex_data()
{
    QTest::addColumn<double>("low");
    // The line da = 1 crosses the rays from -60° to 60°: the sectors within are straight.
    QTest::newRow("0..30") << 0.0;
    QTest::newRow("30..60") << 30.0;
    QTest::newRow("300..330") << 300.0;
    QTest::newRow("330..360") << 330.0;
}

void tst_ToleranceShapeCalculator::straightSectorGetsExactlyOneExtraVertex()
{
    QFETCH(double, low);
    const Setup s = setupAt(55, -2, 7);
    DividingToleranceShapeCalculator c(s.standardValues, s.standardLab,
                                       plotfixtures::ruleTolerance(QStringLiteral("Test half plane"), kGeometry), 1);
    const QPolygonF shape = c.calculateShape();
    QVERIFY(!shape.isEmpty());
    const auto map = c.angleMap();
    QList<double> inside;
    for (const auto &entry : map) {
        if (entry.first > low + 1e-9 && entry.first < low + 30.0 - 1e-9)
            inside.append(entry.first);
    }
    QCOMPARE(inside, QList<double>{low + 15.0});
    // And it lies on the line.
    QVERIFY(std::abs(map.at(low + 15.0).x() - (s.standardLab->a() + 1.0)) < 0.01);
}

void tst_ToleranceShapeCalculator::circularDeltaEabToleranceGivesItsRadius_data()
{
    QTest::addColumn<QString>("calculator");
    QTest::addColumn<double>("radius");
    QTest::addColumn<double>("a");
    QTest::addColumn<double>("b");
    for (const char *kind : {"dividing", "angle"}) {
        QTest::addRow("%s r=0.5 neutral", kind) << kind << 0.5 << 0.0 << 0.0;
        QTest::addRow("%s r=1 silver", kind) << kind << 1.0 << -0.6 << -1.9;
        QTest::addRow("%s r=2.5 blue", kind) << kind << 2.5 << -4.0 << -32.0;
        QTest::addRow("%s r=10 red", kind) << kind << 10.0 << 48.0 << 30.0;
    }
}

void tst_ToleranceShapeCalculator::circularDeltaEabToleranceGivesItsRadius()
{
    QFETCH(QString, calculator);
    QFETCH(double, radius);
    QFETCH(double, a);
    QFETCH(double, b);
    const Setup s = setupAt(50, a, b);
    // Pass up to radius, warn up to 1.5 radius.
    const auto tolerance = plotfixtures::tolerance(QStringLiteral("CIELab dE*ab"), kGeometry, radius, 1.0, 1.5);
    auto inner = makeCalculator(calculator, s, tolerance, 1);
    auto outer = makeCalculator(calculator, s, tolerance, 2);
    const QPolygonF innerShape = inner->calculateShape();
    const QPolygonF outerShape = outer->calculateShape();
    QVERIFY(innerShape.size() >= 12);
    QVERIFY(outerShape.size() >= 12);
    for (const QPointF &p : innerShape)
        QVERIFY2(std::abs(distance(p, *s.standardLab) - radius) < 0.01,
                 qPrintable(QStringLiteral("%1 at %2").arg(distance(p, *s.standardLab)).arg(hueOf(p, *s.standardLab))));
    for (const QPointF &p : outerShape)
        QVERIFY(std::abs(distance(p, *s.standardLab) - 1.5 * radius) < 0.01);
}

void tst_ToleranceShapeCalculator::shapeIsOrderedByAscendingHue_data()
{
    QTest::addColumn<QString>("calculator");
    QTest::addColumn<QString>("type");
    for (const char *kind : {"dividing", "angle"}) {
        for (const char *type : {"CIEDE2000", "CMC(l:c)", "CIE94", "CIELab(+/-)", "CIELCh(+/-)"})
            QTest::addRow("%s %s", kind, type) << kind << type;
    }
}

void tst_ToleranceShapeCalculator::shapeIsOrderedByAscendingHue()
{
    QFETCH(QString, calculator);
    QFETCH(QString, type);
    const Setup s = setupAt(45, 12, -20);
    auto c = makeCalculator(calculator, s, plotfixtures::tolerance(type, kGeometry), 1);
    const QPolygonF shape = c->calculateShape();
    QVERIFY(shape.size() >= 12);
    double previous = -1.0;
    for (const QPointF &p : shape) {
        const double h = hueOf(p, *s.standardLab);
        QVERIFY2(h > previous, qPrintable(QStringLiteral("%1 after %2").arg(h).arg(previous)));
        previous = h;
        QVERIFY(distance(p, *s.standardLab) > 0.05);
        QVERIFY(distance(p, *s.standardLab) < 20.0);
    }
}

void tst_ToleranceShapeCalculator::boxToleranceKeepsItsCorners_data()
{
    QTest::addColumn<QString>("calculator");
    QTest::newRow("dividing") << "dividing";
    QTest::newRow("angle difference") << "angle";
}

void tst_ToleranceShapeCalculator::boxToleranceKeepsItsCorners()
{
    QFETCH(QString, calculator);
    // da within -1 ... +1 and db within -1 ... +1 pass (check threshold 1): a square.
    const Setup s = setupAt(50, 5, 5);
    auto c = makeCalculator(calculator, s, plotfixtures::tolerance(QStringLiteral("CIELab(+/-)"), kGeometry, 1.0, 1.0, 1.2),
                            1);
    const QPolygonF shape = c->calculateShape();
    for (const QPointF &p : shape) {
        const double da = p.x() - 5.0;
        const double db = p.y() - 5.0;
        QVERIFY(std::max(std::abs(da), std::abs(db)) < 1.01);
        QVERIFY(std::max(std::abs(da), std::abs(db)) > 0.99);
    }
    // Some vertex lies near each corner.
    for (const QPointF corner : {QPointF(1, 1), QPointF(-1, 1), QPointF(-1, -1), QPointF(1, -1)}) {
        double nearest = 1e9;
        for (const QPointF &p : shape)
            nearest = std::min(nearest, std::hypot(p.x() - 5.0 - corner.x(), p.y() - 5.0 - corner.y()));
        QVERIFY2(nearest < 0.05, qPrintable(QString::number(nearest)));
    }
}

void tst_ToleranceShapeCalculator::lightnessBoundaryOfDeltaEab_data()
{
    QTest::addColumn<double>("radius");
    QTest::newRow("0.8") << 0.8;
    QTest::newRow("2") << 2.0;
    QTest::newRow("5") << 5.0;
}

void tst_ToleranceShapeCalculator::lightnessBoundaryOfDeltaEab()
{
    QFETCH(double, radius);
    const Setup s = setupAt(62, -0.6, -1.9);
    DividingToleranceShapeCalculator c(s.standardValues, s.standardLab,
                                       plotfixtures::tolerance(QStringLiteral("CIELab dE*ab"), kGeometry, radius, 1.0, 1.5),
                                       1);
    QVERIFY(std::abs(c.lightnessBoundary(+1) - radius) < 0.01);
    QVERIFY(std::abs(c.lightnessBoundary(-1) + radius) < 0.01);
    QCOMPARE(c.evaluationCount(), 32);
}

void tst_ToleranceShapeCalculator::missingDataGivesNoShape_data()
{
    QTest::addColumn<bool>("withValues");
    QTest::addColumn<bool>("withLab");
    QTest::addColumn<bool>("withTolerance");
    QTest::addColumn<bool>("nanLab");
    QTest::newRow("no standard values") << false << true << true << false;
    QTest::newRow("no standard L*a*b*") << true << false << true << false;
    QTest::newRow("no tolerance") << true << true << false << false;
    QTest::newRow("NaN L*a*b*") << true << true << true << true;
}

void tst_ToleranceShapeCalculator::missingDataGivesNoShape()
{
    QFETCH(bool, withValues);
    QFETCH(bool, withLab);
    QFETCH(bool, withTolerance);
    QFETCH(bool, nanLab);
    const Setup s = setupAt(50, 1, 1);
    auto lab = std::make_shared<LabValue>(50, nanLab ? qQNaN() : 1.0, 1.0, plotfixtures::condition());
    DividingToleranceShapeCalculator dividing(withValues ? s.standardValues : nullptr, withLab ? lab : nullptr,
                                              withTolerance ? plotfixtures::tolerance(QStringLiteral("CIEDE2000"), kGeometry)
                                                            : nullptr,
                                              1);
    AngleDifferenceToleranceShapeCalculator angle(
        withValues ? s.standardValues : nullptr, withLab ? lab : nullptr,
        withTolerance ? plotfixtures::tolerance(QStringLiteral("CIEDE2000"), kGeometry) : nullptr, 1);
    QVERIFY(!dividing.isValid());
    QVERIFY(dividing.calculateShape().isEmpty());
    QVERIFY(angle.calculateShape().isEmpty());
    QCOMPARE(dividing.evaluationCount(), 0);
}

void tst_ToleranceShapeCalculator::cancellingStopsProbing_data()
{
    QTest::addColumn<QString>("calculator");
    QTest::addColumn<int>("cancelAfter");
    QTest::newRow("dividing, before start") << "dividing" << 0;
    QTest::newRow("dividing, during the ring") << "dividing" << 40;
    QTest::newRow("dividing, during refinement") << "dividing" << 300;
    QTest::newRow("angle, during the ring") << "angle" << 40;
    QTest::newRow("angle, during refinement") << "angle" << 300;
}

void tst_ToleranceShapeCalculator::cancellingStopsProbing()
{
    QFETCH(QString, calculator);
    QFETCH(int, cancelAfter);
    auto flag = std::make_shared<std::atomic_bool>(cancelAfter == 0);
    auto calls = std::make_shared<std::atomic_int>(0);
    plotfixtures::registerRule(QStringLiteral("Test cancelling"), [flag, calls, cancelAfter](double, double da, double db) {
        if (calls->fetch_add(1) + 1 >= cancelAfter)
            flag->store(true);
        return std::hypot(da, db) <= 1.0 ? 1 : 3;
    });
    const Setup s = setupAt(50, 0, 0);
    auto c = makeCalculator(calculator, s, plotfixtures::ruleTolerance(QStringLiteral("Test cancelling"), kGeometry), 1);
    c->setCancelFlag(flag);
    QVERIFY(c->calculateShape().isEmpty());
    QVERIFY(c->isCancelled());
    // Probing stops at once: the twelve sector tasks may each finish the probe they are in.
    QVERIFY2(c->evaluationCount() <= std::max(cancelAfter, 0) + 12, qPrintable(QString::number(c->evaluationCount())));
}

void tst_ToleranceShapeCalculator::chordDirectionIgnoresSignOfB()
{
    QCOMPARE(ToleranceShapeCalculator::chordDirection(QPointF(1, 0), QPointF(0, 0)), 0.0);
    QVERIFY(std::abs(ToleranceShapeCalculator::chordDirection(QPointF(0, 1), QPointF(0, 0)) - kPi / 2) < 1e-12);
    QCOMPARE(ToleranceShapeCalculator::chordDirection(QPointF(1, 1), QPointF(0, 0)),
             ToleranceShapeCalculator::chordDirection(QPointF(1, -1), QPointF(0, 0)));
    QVERIFY(std::isnan(ToleranceShapeCalculator::chordDirection(QPointF(2, 2), QPointF(2, 2))));
}

QTEST_GUILESS_MAIN(tst_ToleranceShapeCalculator)
#include "tst_toleranceshapecalculator.moc"
