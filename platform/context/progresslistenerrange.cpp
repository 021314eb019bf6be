#include <context/progresslistenerrange.h>

#include <algorithm>
#include <cmath>

namespace vexa {

ProgressListenerRange::ProgressListenerRange(std::shared_ptr<ProgressListener> parent, double from, double to)
    : m_parent(std::move(parent))
    , m_from(from)
    , m_to(to)
{
}

void ProgressListenerRange::setProgress(double value)
{
    const double v = std::isfinite(value) ? std::clamp(value, 0.0, 1.0) : 0.0;
    m_lastValue = v;
    if (m_parent)
        m_parent->setProgress(m_from + v * (m_to - m_from));
}

void ProgressListenerRange::finish()
{
    setProgress(1.0);
}

} // namespace vexa
