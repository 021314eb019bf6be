#include "propertylibrary.h"

#include "membertraits.h"

namespace vexa {

const MemberList &PropertyLibrary::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
