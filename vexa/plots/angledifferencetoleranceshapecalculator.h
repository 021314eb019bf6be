#pragma once

#include <vexa/plots/toleranceshapecalculator.h>

#include <map>

namespace vexa {

// The tolerance boundary refined by the turning angle at each vertex, on the calling thread.
// It starts from the same coarse ring of twelve points as the dividing calculator; then, in
// passes, every vertex where the boundary turns (signed, full-circle chord directions) by more
// than TurnThreshold radians, and stands off the chord of its neighbours by more than
// MinimumDeviation, gets the middle points of its two neighbouring gaps. The deviation test keeps
// the bisection's own scatter (about 0.0015) from passing for a bend. Gaps whose chord is shorter
// than MinimumChord or narrower than MinimumGap are not split again.
// Box tolerances ("CIELab(+/-)", "CIELCh(+/-)") have straight sides and sharp corners: the
// signed turn finds every corner, and straight sides stay at the coarse spacing.
class VEXA_EXPORT AngleDifferenceToleranceShapeCalculator : public ToleranceShapeCalculator
{
public:
    static constexpr double CoarseStep = 30.0;
    static constexpr double TurnThreshold = 0.1;
    static constexpr double MinimumGap = CoarseStep / 256.0;
    static constexpr double MinimumChord = 0.01;
    static constexpr double MinimumDeviation = 0.005;
    static constexpr int MaximumPoints = 2048;

    using ToleranceShapeCalculator::ToleranceShapeCalculator;

    QPolygonF calculateShape() override;

    const std::map<double, QPointF> &angleMap() const { return m_angleMap; }

private:
    std::map<double, QPointF> m_angleMap;
};

} // namespace vexa
