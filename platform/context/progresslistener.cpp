#include <context/progresslistener.h>

#include <context/progressmodel.h>

namespace vexa {

ProgressListener::ProgressListener(ProgressModel *model, const std::string &taskId)
    : m_model(model)
    , m_taskId(taskId)
{
}

ProgressListener::~ProgressListener() = default;

void ProgressListener::setProgress(double value)
{
    m_lastValue = value;
    if (m_model)
        m_model->setProgress(m_taskId, value);
}

void ProgressListener::finish()
{
    if (m_model)
        m_model->endProgress(m_taskId);
}

} // namespace vexa
