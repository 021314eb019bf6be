#include <vexa/plots/angledifferencetoleranceshapecalculator.h>

#include <cmath>
#include <set>
#include <vector>

namespace vexa {

namespace {

constexpr double kPi = 3.14159265358979323846;

double signedDirection(const QPointF &from, const QPointF &to)
{
    return std::atan2(to.y() - from.y(), to.x() - from.x());
}

double turnAt(const QPointF &previous, const QPointF &vertex, const QPointF &next)
{
    double turn = signedDirection(vertex, next) - signedDirection(previous, vertex);
    while (turn > kPi)
        turn -= 2.0 * kPi;
    while (turn <= -kPi)
        turn += 2.0 * kPi;
    return turn;
}

double chordLength(const QPointF &p, const QPointF &q)
{
    return std::hypot(p.x() - q.x(), p.y() - q.y());
}

// Distance of vertex from the line through its neighbours.
double deviation(const QPointF &previous, const QPointF &vertex, const QPointF &next)
{
    const QPointF chord = next - previous;
    const double length = std::hypot(chord.x(), chord.y());
    const QPointF offset = vertex - previous;
    if (length <= 0.0)
        return std::hypot(offset.x(), offset.y());
    return std::abs(chord.x() * offset.y() - chord.y() * offset.x()) / length;
}

} // namespace

QPolygonF AngleDifferenceToleranceShapeCalculator::calculateShape()
{
    m_angleMap.clear();
    if (!isValid())
        return QPolygonF();
    for (double angle = 0.0; angle < 359.99999999; angle += CoarseStep)
        m_angleMap[angle] = boundaryPoint(angle);

    for (;;) {
        if (isCancelled())
            return QPolygonF();
        std::vector<std::pair<double, QPointF>> vertices(m_angleMap.begin(), m_angleMap.end());
        const std::size_t n = vertices.size();
        // Gaps to split, keyed by the angle of their low end (the gap after the last vertex
        // closes on the first one, 360° further).
        std::set<std::size_t> gaps;
        for (std::size_t i = 0; i < n; ++i) {
            const QPointF &previous = vertices[(i + n - 1) % n].second;
            const QPointF &vertex = vertices[i].second;
            const QPointF &next = vertices[(i + 1) % n].second;
            if (std::abs(turnAt(previous, vertex, next)) <= TurnThreshold
                || deviation(previous, vertex, next) <= MinimumDeviation)
                continue;
            gaps.insert((i + n - 1) % n);
            gaps.insert(i);
        }
        bool added = false;
        for (std::size_t gap : gaps) {
            if (m_angleMap.size() >= static_cast<std::size_t>(MaximumPoints))
                break;
            const double low = vertices[gap].first;
            double high = vertices[(gap + 1) % n].first;
            if (gap + 1 == n)
                high += 360.0;
            if (high - low < MinimumGap
                || chordLength(vertices[gap].second, vertices[(gap + 1) % n].second) < MinimumChord)
                continue;
            double mid = (low + high) * 0.5;
            if (mid >= 360.0)
                mid -= 360.0;
            m_angleMap[mid] = boundaryPoint(mid);
            added = true;
        }
        if (!added)
            break;
    }
    if (isCancelled())
        return QPolygonF();
    QPolygonF shape;
    shape.reserve(static_cast<int>(m_angleMap.size()));
    for (const auto &entry : m_angleMap)
        shape.append(entry.second);
    return shape;
}

} // namespace vexa
