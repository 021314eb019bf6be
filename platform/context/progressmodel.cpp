#include <context/progressmodel.h>

#include <context/command.h>

#include <algorithm>

namespace vexa {

ProgressModel::ProgressModel(QObject *parent)
    : QObject(parent)
{
}

ProgressModel::~ProgressModel() = default;

std::shared_ptr<SingleProgress> ProgressModel::startProgress(const QString &title, double value,
                                                             const std::string &id)
{
    const std::string taskId = id.empty() ? Command::newCommandId() : id;
    endProgress(taskId);
    auto task = std::make_shared<SingleProgress>(taskId, title, value);
    m_tasks.push_back(task);
    Q_EMIT sgProgressChanged();
    return task;
}

void ProgressModel::setProgress(const std::string &id, double value)
{
    if (const auto task = progress(id)) {
        task->setValue(value);
        Q_EMIT sgProgressChanged();
    }
}

void ProgressModel::endProgress(const std::string &id)
{
    const auto it = std::find_if(m_tasks.begin(), m_tasks.end(), [&](const auto &t) { return t->id() == id; });
    if (it == m_tasks.end())
        return;
    m_tasks.erase(it);
    Q_EMIT sgProgressChanged();
}

std::shared_ptr<SingleProgress> ProgressModel::progress(const std::string &id) const
{
    const auto it = std::find_if(m_tasks.begin(), m_tasks.end(), [&](const auto &t) { return t->id() == id; });
    return it == m_tasks.end() ? nullptr : *it;
}

} // namespace vexa
