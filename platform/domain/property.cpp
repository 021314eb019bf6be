#include "property.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Property::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
