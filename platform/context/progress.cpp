#include <context/progress.h>

#include <algorithm>
#include <cmath>

namespace vexa {

Progress::Progress(double progress, const std::string &commandId)
    : m_commandId(commandId)
{
    setProgress(progress);
}

void Progress::setProgress(double progress)
{
    m_progress = std::isfinite(progress) ? std::clamp(progress, 0.0, 1.0) : 0.0;
}

} // namespace vexa
