#pragma once

#include <context/context_export.h>

#include <QPointer>

#include <string>

namespace vexa {

class ProgressModel;

// Reports a task's progress (0..1) into a task of the progress model.
class VEXA_CONTEXT_EXPORT ProgressListener
{
public:
    ProgressListener(ProgressModel *model, const std::string &taskId);
    virtual ~ProgressListener();

    virtual void setProgress(double value);
    // Ends the model's task.
    virtual void finish();

    double lastValue() const { return m_lastValue; }

protected:
    ProgressListener() = default;
    double m_lastValue = 0.0;

private:
    QPointer<ProgressModel> m_model;
    std::string m_taskId;
};

} // namespace vexa
