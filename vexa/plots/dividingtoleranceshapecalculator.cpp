#include <vexa/plots/dividingtoleranceshapecalculator.h>

#include <vexa/plots/sanitizerannotations_p.h>

#include <cmath>
#include <future>
#include <vector>

namespace vexa {

std::map<double, QPointF> DividingToleranceShapeCalculator::angleMap() const
{
    AnnotatedMutexLocker locker(&m_mutex);
    return m_angleMap;
}

QPointF DividingToleranceShapeCalculator::storeBoundaryPoint(double angle)
{
    const QPointF point = boundaryPoint(angle);
    AnnotatedMutexLocker locker(&m_mutex);
    m_angleMap[angle] = point;
    return point;
}

void DividingToleranceShapeCalculator::refineSector(double lowAngle, QPointF lowPoint, QPointF highPoint,
                                                    double highAngle)
{
    if (isCancelled() || highAngle - lowAngle < MinimumSectorWidth)
        return;
    const double midAngle = (lowAngle + highAngle) * 0.5;
    const QPointF midPoint = storeBoundaryPoint(midAngle);
    const double turn = std::abs(chordDirection(lowPoint, midPoint) - chordDirection(midPoint, highPoint));
    if (turn > RefinementThreshold) {
        refineSector(lowAngle, lowPoint, midPoint, midAngle);
        refineSector(midAngle, midPoint, highPoint, highAngle);
    }
}

QPolygonF DividingToleranceShapeCalculator::calculateShape()
{
    {
        AnnotatedMutexLocker locker(&m_mutex);
        m_angleMap.clear();
    }
    if (!isValid())
        return QPolygonF();

    std::vector<QPointF> ring;
    for (double angle = 0.0; angle < 359.99999999; angle += CoarseStep)
        ring.push_back(storeBoundaryPoint(angle));

    std::vector<std::future<void>> tasks;
    tasks.reserve(ring.size());
    for (std::size_t i = 0; i < ring.size(); ++i) {
        const double low = CoarseStep * static_cast<double>(i);
        const QPointF lowPoint = ring[i];
        const QPointF highPoint = ring[(i + 1) % ring.size()];
        tasks.push_back(std::async(std::launch::async | std::launch::deferred, [this, low, lowPoint, highPoint] {
            refineSector(low, lowPoint, highPoint, low + CoarseStep);
        }));
    }
    // Every task has finished before the first failure is rethrown: none may outlive the map.
    for (auto &task : tasks) {
        if (task.valid())
            task.wait();
    }
    for (auto &task : tasks)
        task.get();

    if (isCancelled())
        return QPolygonF();
    QPolygonF shape;
    AnnotatedMutexLocker locker(&m_mutex);
    shape.reserve(static_cast<int>(m_angleMap.size()));
    for (const auto &entry : m_angleMap)
        shape.append(entry.second);
    return shape;
}

} // namespace vexa
