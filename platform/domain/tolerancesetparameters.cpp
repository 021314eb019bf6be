#include "tolerancesetparameters.h"

#include "membertraits.h"

namespace vexa {

const MemberList &ToleranceSetParameters::staticMembers()
{
    static const MemberList list{
        member("toleranceParameters", &ToleranceSetParameters::toleranceParameters,
               &ToleranceSetParameters::setToleranceParameters),
    };
    return list;
}

std::shared_ptr<ToleranceParameter> ToleranceSetParameters::parameter(const QString &name) const
{
    for (const auto &p : m_parameters) {
        if (p && p->name() == name)
            return p;
    }
    return nullptr;
}

} // namespace vexa
