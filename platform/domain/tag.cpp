#include "tag.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Tag::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
