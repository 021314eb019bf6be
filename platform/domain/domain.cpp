#include "domain.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Domain::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
