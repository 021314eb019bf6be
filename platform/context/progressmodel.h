#pragma once

#include <context/context_export.h>
#include <context/singleprogress.h>

#include <QObject>

#include <memory>
#include <string>
#include <vector>

namespace vexa {

// The host's list of running tasks ("Loading", "Saving" ...), each a fraction
// from 0 to 1. Used on the GUI thread.
class VEXA_CONTEXT_EXPORT ProgressModel : public QObject
{
    Q_OBJECT
public:
    explicit ProgressModel(QObject *parent = nullptr);
    ~ProgressModel() override;

    // Opens a task; with an empty id one is generated. Returns the task.
    std::shared_ptr<SingleProgress> startProgress(const QString &title, double value = 0.0,
                                                  const std::string &id = std::string());
    // Sets a running task's value; unknown ids are ignored.
    void setProgress(const std::string &id, double value);
    void endProgress(const std::string &id);
    std::shared_ptr<SingleProgress> progress(const std::string &id) const;

    // The running tasks, oldest first.
    std::vector<std::shared_ptr<SingleProgress>> progressListeners() const { return m_tasks; }

Q_SIGNALS:
    void sgProgressChanged();

private:
    std::vector<std::shared_ptr<SingleProgress>> m_tasks;
};

} // namespace vexa
