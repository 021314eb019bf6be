#pragma once

#include <context/context_export.h>

#include <QMetaType>

#include <memory>
#include <string>

namespace vexa {

// Progress of a running command: a fraction from 0 to 1.
class VEXA_CONTEXT_EXPORT Progress
{
public:
    Progress() = default;
    explicit Progress(double progress, const std::string &commandId = std::string());

    double progress() const { return m_progress; }
    void setProgress(double progress);
    const std::string &commandId() const { return m_commandId; }
    void setCommandId(const std::string &id) { m_commandId = id; }

private:
    double m_progress = 0.0;
    std::string m_commandId;
};

} // namespace vexa

Q_DECLARE_METATYPE(vexa::Progress)
Q_DECLARE_METATYPE(std::shared_ptr<vexa::Progress>)
