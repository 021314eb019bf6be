#pragma once

#include <vexa/vexa_export.h>

#include <QMetaType>
#include <QPainterPath>
#include <QPolygonF>
#include <QThread>
#include <QtNumeric>

#include <atomic>
#include <condition_variable>
#include <memory>
#include <mutex>

namespace vexa {

class AppearanceValues;
class LabValue;
class Tolerance;

// What a plot asks its worker to compute.
struct VEXA_EXPORT ToleranceShapeRequest
{
    enum class Kind {
        Plane,     // the region in the a*b* plane at the standard's L*
        Lightness, // the interval on the L* axis at the standard's a*, b*
    };
    Kind kind = Kind::Plane;
    // Counts the plot's requests; the answer carries it back so that the plot can drop
    // answers to requests it has superseded.
    quint64 generation = 0;
    std::shared_ptr<const AppearanceValues> standardValues;
    std::shared_ptr<const LabValue> standardLab;
    std::shared_ptr<const Tolerance> tolerance;
    // Plane only: refine by signed turning angle (AngleDifferenceToleranceShapeCalculator)
    // instead of dividing sectors asynchronously.
    bool useAngleDifference = false;
};

// The answer: the pass region and the warning band around it.
// Plane: polygons in absolute (a*, b*). Lightness: rectangles spanning x = -1 ... 1 and the
// L* interval in absolute L*, together with the interval ends as L* differences.
struct VEXA_EXPORT ToleranceShape
{
    quint64 generation = 0;
    ToleranceShapeRequest::Kind kind = ToleranceShapeRequest::Kind::Plane;
    bool valid = false;
    QPolygonF inner;
    QPolygonF outer;
    // The warning band: outer minus inner.
    QPainterPath band;
    double passLow = qQNaN();
    double passHigh = qQNaN();
    double warningLow = qQNaN();
    double warningHigh = qQNaN();
};

// The worker of one colour plot: computes tolerance shapes off the GUI thread, one request at
// a time, and delivers them by sgShapeCalculated (connect it queued). A newer request
// supersedes an older one: the pending one is replaced and the running one is cancelled, so
// only the newest request is answered (an answer already on its way may still arrive; the
// generation tells). The worker never touches its plot; destroying it stops and joins it.
class VEXA_EXPORT WorkerThread : public QThread
{
    Q_OBJECT
public:
    explicit WorkerThread(QObject *parent = nullptr);
    ~WorkerThread() override;

    // GUI thread. Starts the thread on first use.
    void calculate(const ToleranceShapeRequest &request);
    // Drops the pending request and cancels the running one.
    void cancel();
    // Cancels everything and waits for the thread to end. The worker accepts no more requests.
    void stop();

    // Requests taken up by the thread so far (for tests and diagnostics).
    int startedCalculations() const { return m_started.load(); }

    // The shape of one request, computed on the calling thread; invalid when the request lacks
    // data, the tolerance gives no verdict at the standard, or the flag was set meanwhile.
    static ToleranceShape computeShape(const ToleranceShapeRequest &request,
                                       const std::shared_ptr<const std::atomic_bool> &cancel = nullptr);

Q_SIGNALS:
    void sgShapeCalculated(const vexa::ToleranceShape &shape);

protected:
    void run() override;

private:
    std::mutex m_mutex;
    std::condition_variable m_wake;
    std::unique_ptr<ToleranceShapeRequest> m_pending; // guarded by m_mutex
    std::shared_ptr<std::atomic_bool> m_runningCancel; // guarded by m_mutex
    bool m_stopping = false;                           // guarded by m_mutex
    std::atomic_int m_started{0};
};

} // namespace vexa

Q_DECLARE_METATYPE(vexa::ToleranceShape)
