#include <vexa/plots/workerthread.h>

#include <vexa/plots/angledifferencetoleranceshapecalculator.h>
#include <vexa/plots/dividingtoleranceshapecalculator.h>

#include <domain/appearancevalues.h>
#include <domain/labvalue.h>
#include <domain/tolerance.h>
#include <utilities/logger.h>

#include <cmath>
#include <exception>

namespace vexa {

namespace {

QPolygonF lightnessRectangle(double lowL, double highL)
{
    return QPolygonF(QRectF(QPointF(-1.0, lowL), QPointF(1.0, highL)));
}

std::unique_ptr<ToleranceShapeCalculator> makeCalculator(const ToleranceShapeRequest &request, int acceptedStatus,
                                                         const std::shared_ptr<const std::atomic_bool> &cancel)
{
    std::unique_ptr<ToleranceShapeCalculator> calculator;
    if (request.useAngleDifference && request.kind == ToleranceShapeRequest::Kind::Plane)
        calculator = std::make_unique<AngleDifferenceToleranceShapeCalculator>(
            request.standardValues, request.standardLab, request.tolerance, acceptedStatus);
    else
        calculator = std::make_unique<DividingToleranceShapeCalculator>(request.standardValues, request.standardLab,
                                                                          request.tolerance, acceptedStatus);
    calculator->setCancelFlag(cancel);
    return calculator;
}

} // namespace

WorkerThread::WorkerThread(QObject *parent)
    : QThread(parent)
{
    qRegisterMetaType<vexa::ToleranceShape>("vexa::ToleranceShape");
}

WorkerThread::~WorkerThread()
{
    stop();
}

void WorkerThread::calculate(const ToleranceShapeRequest &request)
{
    {
        std::lock_guard<std::mutex> lock(m_mutex);
        if (m_stopping)
            return;
        m_pending = std::make_unique<ToleranceShapeRequest>(request);
        if (m_runningCancel)
            m_runningCancel->store(true);
    }
    m_wake.notify_one();
    if (!isRunning())
        start(QThread::LowPriority);
}

void WorkerThread::cancel()
{
    std::lock_guard<std::mutex> lock(m_mutex);
    m_pending.reset();
    if (m_runningCancel)
        m_runningCancel->store(true);
}

void WorkerThread::stop()
{
    {
        std::lock_guard<std::mutex> lock(m_mutex);
        m_stopping = true;
        m_pending.reset();
        if (m_runningCancel)
            m_runningCancel->store(true);
    }
    m_wake.notify_all();
    wait();
    // QThread::wait() joins through Qt's own primitives, which race detectors may not see; the
    // thread's last step was releasing m_mutex, so taking it here orders everything after the join.
    std::lock_guard<std::mutex> lock(m_mutex);
}

void WorkerThread::run()
{
    for (;;) {
        ToleranceShapeRequest request;
        std::shared_ptr<std::atomic_bool> cancel;
        {
            std::unique_lock<std::mutex> lock(m_mutex);
            m_wake.wait(lock, [this] { return m_stopping || m_pending; });
            if (m_stopping)
                return;
            request = *m_pending;
            m_pending.reset();
            cancel = std::make_shared<std::atomic_bool>(false);
            m_runningCancel = cancel;
        }
        m_started.fetch_add(1);
        ToleranceShape shape;
        try {
            shape = computeShape(request, cancel);
        } catch (const std::exception &e) {
            Logger::instance().error(LogCategory::General,
                                     QStringLiteral("WorkerThread::run: %1").arg(QString::fromLocal8Bit(e.what())));
            shape = ToleranceShape();
            shape.generation = request.generation;
            shape.kind = request.kind;
        } catch (...) {
            Logger::instance().error(LogCategory::General, QStringLiteral("WorkerThread::run: unknown failure"));
            shape = ToleranceShape();
            shape.generation = request.generation;
            shape.kind = request.kind;
        }
        {
            std::lock_guard<std::mutex> lock(m_mutex);
            m_runningCancel.reset();
        }
        if (!cancel->load())
            Q_EMIT sgShapeCalculated(shape);
    }
}

ToleranceShape WorkerThread::computeShape(const ToleranceShapeRequest &request,
                                          const std::shared_ptr<const std::atomic_bool> &cancel)
{
    ToleranceShape shape;
    shape.generation = request.generation;
    shape.kind = request.kind;
    if (!request.standardValues || !request.standardLab || !request.tolerance || !request.standardLab->isValid())
        return shape;

    const auto inner = makeCalculator(request, ToleranceShapeCalculator::PassStatus, cancel);
    const auto outer = makeCalculator(request, ToleranceShapeCalculator::WarningStatus, cancel);
    // A tolerance that cannot judge here (no rule, values it cannot use) has no region.
    const LabValue &standard = *request.standardLab;
    if (inner->judge(standard.l(), standard.a(), standard.b()) == 0)
        return shape;

    if (request.kind == ToleranceShapeRequest::Kind::Lightness) {
        shape.passLow = inner->lightnessBoundary(-1);
        shape.passHigh = inner->lightnessBoundary(+1);
        shape.warningLow = outer->lightnessBoundary(-1);
        shape.warningHigh = outer->lightnessBoundary(+1);
        if (inner->isCancelled())
            return shape;
        const double l = standard.l();
        shape.inner = lightnessRectangle(l + shape.passLow, l + shape.passHigh);
        shape.outer = lightnessRectangle(l + std::min(shape.warningLow, shape.passLow),
                                         l + std::max(shape.warningHigh, shape.passHigh));
    } else {
        shape.outer = outer->calculateShape();
        shape.inner = inner->calculateShape();
        if (inner->isCancelled() || shape.inner.isEmpty() || shape.outer.isEmpty())
            return shape;
    }
    QPainterPath outerPath;
    outerPath.addPolygon(shape.outer);
    outerPath.closeSubpath();
    QPainterPath innerPath;
    innerPath.addPolygon(shape.inner);
    innerPath.closeSubpath();
    shape.band = outerPath.subtracted(innerPath);
    shape.valid = true;
    return shape;
}

} // namespace vexa
