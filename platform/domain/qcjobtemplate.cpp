#include "qcjobtemplate.h"

#include "membertraits.h"
#include "toleranceset.h"

namespace vexa {

const MemberList &QCJobTemplate::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        reference("toleranceSets", &QCJobTemplate::toleranceSets, &QCJobTemplate::setToleranceSets),
    });
    return list;
}

void QCJobTemplate::setToleranceSets(const std::vector<std::shared_ptr<ToleranceSet>> &sets)
{
    m_toleranceSets = sets;
}

} // namespace vexa
