// The plot's worker: shapes computed off the GUI thread, newest request wins, safe teardown.

#include "plotfixtures.h"

#include <vexa/plots/workerthread.h>

#include <QSignalSpy>
#include <QtTest>

#include <cmath>

using namespace vexa;

namespace {

const Geometry kGeometry("45as45");

ToleranceShapeRequest request(double a, double b, const std::shared_ptr<Tolerance> &tolerance, quint64 generation,
                              ToleranceShapeRequest::Kind kind = ToleranceShapeRequest::Kind::Plane)
{
    ToleranceShapeRequest r;
    r.kind = kind;
    r.generation = generation;
    r.standardValues = plotfixtures::labAppearance(60, a, b);
    auto lab = std::make_shared<LabValue>(60, a, b, plotfixtures::condition());
    lab->setGeometry(kGeometry);
    r.standardLab = lab;
    r.tolerance = tolerance;
    return r;
}

// Collects the worker's answers on the GUI thread. (A QSignalSpy would record them on the
// worker's thread, racing with the test reading it.)
class Answers : public QObject
{
public:
    explicit Answers(WorkerThread &worker)
    {
        connect(&worker, &WorkerThread::sgShapeCalculated, this,
                [this](const ToleranceShape &shape) { shapes.append(shape); }, Qt::QueuedConnection);
    }
    QList<ToleranceShape> shapes;
};

QPointF centroid(const QPolygonF &polygon)
{
    QPointF sum;
    for (const QPointF &p : polygon)
        sum += p;
    return polygon.isEmpty() ? sum : sum / polygon.size();
}

} // namespace

class tst_WorkerThread : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void computeShapeOfCircle_data();
    void computeShapeOfCircle();
    void computeShapeOfLightness();
    void invalidRequestGivesNoShape_data();
    void invalidRequestGivesNoShape();
    void deliversShapeBySignal();
    void newestRequestWins();
    void cancelDropsTheRunningRequest();
    void destroyWhileCalculating();
};

void tst_WorkerThread::initTestCase()
{
    QVERIFY(ToleranceFactory::toleranceFactory());
    plotfixtures::registerRule(QStringLiteral("Test no verdict"), [](double, double, double) { return 0; });
    plotfixtures::registerRule(QStringLiteral("Test slow circle"), [](double, double da, double db) {
        return plotfixtures::slowly(std::hypot(da, db) <= 1.0 ? 1 : (std::hypot(da, db) <= 1.5 ? 2 : 3));
    });
}

void tst_WorkerThread::computeShapeOfCircle_data()
{
    QTest::addColumn<bool>("angleDifference");
    QTest::newRow("dividing") << false;
    QTest::newRow("angle difference") << true;
}

void tst_WorkerThread::computeShapeOfCircle()
{
    QFETCH(bool, angleDifference);
    auto r = request(2, 3, plotfixtures::tolerance(QStringLiteral("CIELab dE*ab"), kGeometry, 1.0, 1.0, 2.0), 7);
    r.useAngleDifference = angleDifference;
    const ToleranceShape shape = WorkerThread::computeShape(r);
    QVERIFY(shape.valid);
    QCOMPARE(shape.generation, quint64(7));
    for (const QPointF &p : shape.inner)
        QVERIFY(std::abs(std::hypot(p.x() - 2, p.y() - 3) - 1.0) < 0.01);
    for (const QPointF &p : shape.outer)
        QVERIFY(std::abs(std::hypot(p.x() - 2, p.y() - 3) - 2.0) < 0.01);
    // The band is the ring between: it holds points between the radii, not inside or beyond.
    QVERIFY(shape.band.contains(QPointF(2 + 1.5, 3)));
    QVERIFY(shape.band.contains(QPointF(2, 3 - 1.5)));
    QVERIFY(!shape.band.contains(QPointF(2.2, 3.1)));
    QVERIFY(!shape.band.contains(QPointF(2 + 2.3, 3)));
}

void tst_WorkerThread::computeShapeOfLightness()
{
    const auto r = request(-0.6, -1.9, plotfixtures::tolerance(QStringLiteral("CIELab dE*ab"), kGeometry, 0.8, 1.0, 1.5), 3,
                           ToleranceShapeRequest::Kind::Lightness);
    const ToleranceShape shape = WorkerThread::computeShape(r);
    QVERIFY(shape.valid);
    QVERIFY(std::abs(shape.passLow + 0.8) < 0.01);
    QVERIFY(std::abs(shape.passHigh - 0.8) < 0.01);
    QVERIFY(std::abs(shape.warningLow + 1.2) < 0.01);
    QVERIFY(std::abs(shape.warningHigh - 1.2) < 0.01);
    QVERIFY(std::abs(shape.inner.boundingRect().top() - (60 - 0.8)) < 0.01);
    QVERIFY(std::abs(shape.inner.boundingRect().bottom() - (60 + 0.8)) < 0.01);
    QVERIFY(shape.band.contains(QPointF(0, 61.0)));
    QVERIFY(shape.band.contains(QPointF(0, 59.0)));
    QVERIFY(!shape.band.contains(QPointF(0, 60.2)));
}

void tst_WorkerThread::invalidRequestGivesNoShape_data()
{
    QTest::addColumn<int>("defect");
    QTest::newRow("no standard values") << 0;
    QTest::newRow("no standard L*a*b*") << 1;
    QTest::newRow("no tolerance") << 2;
    QTest::newRow("NaN standard") << 3;
    QTest::newRow("tolerance without verdict") << 4;
    QTest::newRow("tolerance at another geometry") << 5;
}

void tst_WorkerThread::invalidRequestGivesNoShape()
{
    QFETCH(int, defect);
    auto r = request(1, 1, plotfixtures::tolerance(QStringLiteral("CIEDE2000"), kGeometry), 1);
    switch (defect) {
    case 0: r.standardValues = nullptr; break;
    case 1: r.standardLab = nullptr; break;
    case 2: r.tolerance = nullptr; break;
    case 3: r.standardLab = std::make_shared<LabValue>(qQNaN(), 1, 1, plotfixtures::condition()); break;
    case 4: r.tolerance = plotfixtures::ruleTolerance(QStringLiteral("Test no verdict"), kGeometry); break;
    case 5: r.tolerance = plotfixtures::tolerance(QStringLiteral("CIEDE2000"), Geometry("15as15")); break;
    }
    const ToleranceShape shape = WorkerThread::computeShape(r);
    QVERIFY(!shape.valid);
    QVERIFY(shape.inner.isEmpty());
    QVERIFY(shape.band.isEmpty());
}

void tst_WorkerThread::deliversShapeBySignal()
{
    WorkerThread worker;
    Answers answers(worker);
    worker.calculate(request(0, 0, plotfixtures::tolerance(QStringLiteral("CIEDE2000"), kGeometry), 11));
    QTRY_COMPARE(answers.shapes.size(), 1);
    const ToleranceShape shape = answers.shapes.at(0);
    QCOMPARE(shape.generation, quint64(11));
    QVERIFY(shape.valid);
    QVERIFY(!shape.inner.isEmpty());
}

void tst_WorkerThread::newestRequestWins()
{
    WorkerThread worker;
    Answers answers(worker);
    const QList<ToleranceShape> &received = answers.shapes;
    const auto tolerance = plotfixtures::ruleTolerance(QStringLiteral("Test slow circle"), kGeometry);
    for (int i = 1; i <= 5; ++i)
        worker.calculate(request(10.0 * i, 0, tolerance, quint64(i)));
    QTRY_VERIFY_WITH_TIMEOUT(!received.isEmpty() && received.last().generation == 5, 30000);
    // Superseded requests were dropped or cancelled: at most the first one started early
    // enough to be answered, and answers arrive in request order.
    QVERIFY(received.size() <= 2);
    QVERIFY(worker.startedCalculations() <= 5);
    const ToleranceShape last = received.last();
    QVERIFY(last.valid);
    const QPointF centre = centroid(last.inner);
    QVERIFY2(std::abs(centre.x() - 50.0) < 0.05 && std::abs(centre.y()) < 0.05,
             qPrintable(QStringLiteral("%1 %2").arg(centre.x()).arg(centre.y())));
}

void tst_WorkerThread::cancelDropsTheRunningRequest()
{
    WorkerThread worker;
    Answers answers(worker);
    worker.calculate(request(0, 0, plotfixtures::ruleTolerance(QStringLiteral("Test slow circle"), kGeometry), 1));
    QTRY_COMPARE(worker.startedCalculations(), 1);
    worker.cancel();
    // A later request is still answered, and the cancelled one never is.
    worker.calculate(request(0, 0, plotfixtures::tolerance(QStringLiteral("CIEDE2000"), kGeometry), 2));
    QTRY_VERIFY(!answers.shapes.isEmpty());
    QTRY_COMPARE(worker.startedCalculations(), 2);
    QTRY_COMPARE(answers.shapes.last().generation, quint64(2));
    for (const ToleranceShape &shape : qAsConst(answers.shapes))
        QVERIFY(shape.generation != 1);
}

void tst_WorkerThread::destroyWhileCalculating()
{
    auto *worker = new WorkerThread;
    auto *receiver = new QObject;
    int answers = 0;
    connect(worker, &WorkerThread::sgShapeCalculated, receiver, [&answers] { ++answers; }, Qt::QueuedConnection);
    worker->calculate(request(0, 0, plotfixtures::ruleTolerance(QStringLiteral("Test slow circle"), kGeometry), 1));
    QTRY_COMPARE(worker->startedCalculations(), 1);
    delete worker; // cancels and joins
    delete receiver;
    QCoreApplication::processEvents();
    QCOMPARE(answers, 0);
}

QTEST_GUILESS_MAIN(tst_WorkerThread)
#include "tst_workerthread.moc"
