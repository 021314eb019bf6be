#include "folder.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Folder::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
