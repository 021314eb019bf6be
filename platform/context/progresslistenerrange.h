#pragma once

#include <context/context_export.h>
#include <context/progresslistener.h>

#include <memory>

namespace vexa {

// A sub-task: its progress 0..1 is mapped onto [from, to] of the parent's scale.
class VEXA_CONTEXT_EXPORT ProgressListenerRange : public ProgressListener
{
public:
    ProgressListenerRange(std::shared_ptr<ProgressListener> parent, double from, double to);

    void setProgress(double value) override;
    // Sets the parent to the end of the range; the parent's task stays open.
    void finish() override;

    double from() const { return m_from; }
    double to() const { return m_to; }

private:
    std::shared_ptr<ProgressListener> m_parent;
    double m_from;
    double m_to;
};

} // namespace vexa
