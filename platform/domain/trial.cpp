#include "trial.h"

#include "membertraits.h"
#include "standard.h"

namespace vexa {

const MemberList &Trial::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("appearanceValues", &Trial::appearanceValues, &Trial::setAppearanceValues),
        reference("standard", &Trial::standard, &Trial::setStandard),
    });
    return list;
}

} // namespace vexa
