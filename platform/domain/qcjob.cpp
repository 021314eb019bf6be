#include "qcjob.h"

#include "membertraits.h"
#include "qcjobtemplate.h"
#include "standard.h"
#include "trial.h"

namespace vexa {

const MemberList &QCJob::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("qcJobTemplateName", &QCJob::qcJobTemplateName, &QCJob::setQcJobTemplateName),
        reference("qcJobTemplate", &QCJob::qcJobTemplate, &QCJob::setQcJobTemplate),
        reference("standard", &QCJob::standard, &QCJob::setStandard),
        reference("trials", &QCJob::trials, &QCJob::setTrials),
    });
    return list;
}

void QCJob::setQcJobTemplate(const std::shared_ptr<QCJobTemplate> &jobTemplate)
{
    m_qcJobTemplate = jobTemplate;
}

void QCJob::setStandard(const std::shared_ptr<Standard> &standard)
{
    m_standard = standard;
}

void QCJob::setTrials(const std::vector<std::shared_ptr<Trial>> &trials)
{
    m_trials = trials;
}

} // namespace vexa
