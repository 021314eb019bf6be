#pragma once

#include <context/context_export.h>

#include <QString>

#include <string>

namespace vexa {

// One running task of the progress model.
class VEXA_CONTEXT_EXPORT SingleProgress
{
public:
    SingleProgress(const std::string &id, const QString &progressTitle, double value = 0.0);

    const std::string &id() const { return m_id; }
    QString progressTitle() const { return m_progressTitle; }
    double value() const { return m_value; }
    double progress() const { return m_value; }
    void setValue(double value);

private:
    std::string m_id;
    QString m_progressTitle;
    double m_value = 0.0;
};

} // namespace vexa
