#pragma once

#include <domain/namedobject.h>

namespace vexa {

class QCJobTemplate;
class Standard;
class Trial;

// A quality-control job: one standard and the trials judged against it, set up
// from a job template. Standard, trials and template are references: they are
// stored objects of their own.
class VEXA_DOMAIN_EXPORT QCJob : public NamedObject
{
    VEXA_REFLECTABLE(QCJob)
public:
    QString qcJobTemplateName() const { return m_qcJobTemplateName; }
    void setQcJobTemplateName(const QString &name) { m_qcJobTemplateName = name; }
    std::shared_ptr<QCJobTemplate> qcJobTemplate() const { return m_qcJobTemplate; }
    void setQcJobTemplate(const std::shared_ptr<QCJobTemplate> &jobTemplate);
    std::shared_ptr<Standard> standard() const { return m_standard; }
    void setStandard(const std::shared_ptr<Standard> &standard);
    const std::vector<std::shared_ptr<Trial>> &trials() const { return m_trials; }
    void setTrials(const std::vector<std::shared_ptr<Trial>> &trials);

private:
    QString m_qcJobTemplateName;
    std::shared_ptr<QCJobTemplate> m_qcJobTemplate;
    std::shared_ptr<Standard> m_standard;
    std::vector<std::shared_ptr<Trial>> m_trials;
};

} // namespace vexa
