#pragma once

#include <vexa/plots/toleranceshapecalculator.h>

#include <QMutex>

#include <map>

namespace vexa {

// The tolerance boundary by bisection along rays: a coarse ring of twelve points 30° apart
// is found first, then each 30° sector is refined by an asynchronous task that halves it
// wherever the boundary bends (the chord directions on both sides of the sector's middle
// point differ by more than RefinementThreshold radians). All points meet in one map keyed by
// hue angle, guarded by a mutex; the shape is read from it in ascending angle.
class VEXA_EXPORT DividingToleranceShapeCalculator : public ToleranceShapeCalculator
{
public:
    static constexpr double CoarseStep = 30.0;
    static constexpr double RefinementThreshold = 0.1;
    // A sector narrower than this is not halved again, whatever its chords do: the bisection
    // places points only to about 0.0015, so on very short chords the directions are noise.
    static constexpr double MinimumSectorWidth = CoarseStep / 64.0;

    using ToleranceShapeCalculator::ToleranceShapeCalculator;

    QPolygonF calculateShape() override;

    // The points found so far, by hue angle.
    std::map<double, QPointF> angleMap() const;

private:
    QPointF storeBoundaryPoint(double angle);
    void refineSector(double lowAngle, QPointF lowPoint, QPointF highPoint, double highAngle);

    mutable QMutex m_mutex;
    std::map<double, QPointF> m_angleMap;
};

} // namespace vexa
