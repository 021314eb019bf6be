#include <vexa/plots/toleranceshapecalculator.h>

#include <domain/appearancevalues.h>
#include <domain/labvalue.h>
#include <domain/tolerance.h>
#include <utilities/mathhelper.h>

#include <cmath>

namespace vexa {

ToleranceShapeCalculator::ToleranceShapeCalculator(std::shared_ptr<const AppearanceValues> standardValues,
                                                   std::shared_ptr<const LabValue> standardLab,
                                                   std::shared_ptr<const Tolerance> tolerance, int acceptedStatus)
    : m_standardValues(std::move(standardValues))
    , m_standardLab(std::move(standardLab))
    , m_tolerance(std::move(tolerance))
    , m_acceptedStatus(acceptedStatus)
{
}

ToleranceShapeCalculator::~ToleranceShapeCalculator() = default;

bool ToleranceShapeCalculator::isValid() const
{
    return m_standardValues && m_standardLab && m_tolerance && m_standardLab->isValid();
}

int ToleranceShapeCalculator::judge(double l, double a, double b) const
{
    m_evaluations.fetch_add(1, std::memory_order_relaxed);
    if (!isValid())
        return 0;
    auto probe = std::make_shared<LabValue>(l, a, b, m_standardLab->colorimetricCondition());
    probe->setPhysicalCondition(m_standardLab->physicalCondition());
    AppearanceValues values;
    values.setColorValues({probe});
    return m_tolerance->status(values, *m_standardValues, m_standardLab->colorimetricCondition());
}

template <typename ProbeAt> double ToleranceShapeCalculator::bisect(ProbeAt probeAt) const
{
    double radius = InitialRadius;
    double step = InitialStep;
    double lastProbe = radius;
    do {
        if (isCancelled())
            break;
        lastProbe = radius;
        // The point kept is this probe: the update below is not applied after the last one.
        radius += isInside(probeAt(radius)) ? step : -step;
        step *= 0.5;
    } while (step > MinimumStep);
    return lastProbe;
}

QPointF ToleranceShapeCalculator::boundaryPoint(double angleDegrees) const
{
    if (!isValid())
        return QPointF();
    const double l = m_standardLab->l();
    const double a = m_standardLab->a();
    const double b = m_standardLab->b();
    const double radius = bisect([&](double r) {
        const QPointF offset = MathHelper::toCarthesianDeg(r, angleDegrees);
        return judge(l, a + offset.x(), b + offset.y());
    });
    const QPointF offset = MathHelper::toCarthesianDeg(radius, angleDegrees);
    return QPointF(a + offset.x(), b + offset.y());
}

double ToleranceShapeCalculator::lightnessBoundary(int direction) const
{
    if (!isValid())
        return 0.0;
    const double sign = direction < 0 ? -1.0 : 1.0;
    const double l = m_standardLab->l();
    const double a = m_standardLab->a();
    const double b = m_standardLab->b();
    return sign * bisect([&](double r) { return judge(l + sign * r, a, b); });
}

double ToleranceShapeCalculator::chordDirection(const QPointF &p, const QPointF &q)
{
    const double da = p.x() - q.x();
    const double db = p.y() - q.y();
    return std::acos(da / std::sqrt(da * da + db * db));
}

} // namespace vexa
