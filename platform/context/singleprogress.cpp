#include <context/singleprogress.h>

#include <algorithm>
#include <cmath>

namespace vexa {

SingleProgress::SingleProgress(const std::string &id, const QString &progressTitle, double value)
    : m_id(id)
    , m_progressTitle(progressTitle)
{
    setValue(value);
}

void SingleProgress::setValue(double value)
{
    m_value = std::isfinite(value) ? std::clamp(value, 0.0, 1.0) : 0.0;
}

} // namespace vexa
