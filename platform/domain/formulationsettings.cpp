#include "formulationsettings.h"

#include "membertraits.h"

namespace vexa {

const MemberList &FormulationSettings::staticMembers()
{
    static const MemberList list{
        member("colorantRestrictions", &FormulationSettings::colorantRestrictions,
               &FormulationSettings::setColorantRestrictions),
    };
    return list;
}

} // namespace vexa
