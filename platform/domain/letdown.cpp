#include "letdown.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Letdown::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
