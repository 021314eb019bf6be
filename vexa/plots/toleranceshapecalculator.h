#pragma once

#include <vexa/vexa_export.h>

#include <QPointF>
#include <QPolygonF>

#include <atomic>
#include <memory>

namespace vexa {

class AppearanceValues;
class LabValue;
class Tolerance;

// Finds the boundary of a tolerance in the a*b* plane of the standard's lightness by
// probing it: a probe colour is built, judged against the standard, and the radius along a
// ray from the standard is bisected between inside and outside.
//
// A probe is inside when the tolerance passes it (status 1) or answers the accepted status:
// with the accepted status at pass the boundary is the inner (pass) one, with it at warning
// (status 2) the outer one that encloses the warning band as well.
//
// Judging is pure, so a calculator may be run on any thread; the objects it holds must not
// be modified while it runs. Every probe of the bisection is counted (evaluationCount()).
class VEXA_EXPORT ToleranceShapeCalculator
{
public:
    // Bisection schedule along one ray: the first probe, the first step and the step at which
    // it stops. 16 probes are made; the radii reached lie between 0 and 200.
    static constexpr double InitialRadius = 100.0;
    static constexpr double InitialStep = 50.0;
    static constexpr double MinimumStep = 0.001;
    static constexpr int PassStatus = 1;
    static constexpr int WarningStatus = 2;

    // standardValues: the standard's measurement; standardLab: its L*a*b* at the plotted
    // geometry (its physical condition names that geometry, its colorimetric condition is the
    // one the tolerance judges under).
    ToleranceShapeCalculator(std::shared_ptr<const AppearanceValues> standardValues,
                             std::shared_ptr<const LabValue> standardLab, std::shared_ptr<const Tolerance> tolerance,
                             int acceptedStatus);
    virtual ~ToleranceShapeCalculator();
    ToleranceShapeCalculator(const ToleranceShapeCalculator &) = delete;
    ToleranceShapeCalculator &operator=(const ToleranceShapeCalculator &) = delete;

    // The boundary as (a*, b*) points in ascending hue angle about the standard. Empty when
    // the calculator lacks data or was cancelled. May throw when a refinement task failed.
    virtual QPolygonF calculateShape() = 0;

    // A flag another thread sets to abandon the calculation; probes stop at once and
    // calculateShape() returns an empty polygon.
    void setCancelFlag(std::shared_ptr<const std::atomic_bool> flag) { m_cancel = std::move(flag); }
    bool isCancelled() const { return m_cancel && m_cancel->load(std::memory_order_relaxed); }

    // Whether the calculator can probe at all (standard, its L*a*b* and the tolerance present,
    // coordinates finite).
    bool isValid() const;

    // The boundary point at one hue angle (degrees, counter-clockwise from +a*), as (a*, b*):
    // the last probe of the bisection.
    QPointF boundaryPoint(double angleDegrees) const;
    // The boundary along the lightness axis through the standard: direction +1 up, -1 down.
    // Returns the L* difference of the last probe (signed by the direction).
    double lightnessBoundary(int direction) const;

    // Judges one colour at the standard's geometry against the standard (0 no verdict).
    int judge(double l, double a, double b) const;
    bool isInside(int status) const { return status == PassStatus || status == m_acceptedStatus; }

    int acceptedStatus() const { return m_acceptedStatus; }
    const std::shared_ptr<const LabValue> &standardLab() const { return m_standardLab; }
    int evaluationCount() const { return m_evaluations.load(std::memory_order_relaxed); }

    // Direction of the chord between two points in radians, 0 ... pi: the sign of the b*
    // difference is not taken into account. NaN for coincident points.
    static double chordDirection(const QPointF &p, const QPointF &q);

protected:
    // One bisection; returns the radius of the last probe.
    template <typename ProbeAt> double bisect(ProbeAt probeAt) const;

private:
    std::shared_ptr<const AppearanceValues> m_standardValues;
    std::shared_ptr<const LabValue> m_standardLab;
    std::shared_ptr<const Tolerance> m_tolerance;
    int m_acceptedStatus;
    std::shared_ptr<const std::atomic_bool> m_cancel;
    mutable std::atomic_int m_evaluations{0};
};

} // namespace vexa
