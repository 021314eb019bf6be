#include "substrate.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Substrate::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
