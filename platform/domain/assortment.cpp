#include "assortment.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Assortment::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
