#include "mainobject.h"

#include "membertraits.h"

namespace vexa {

const MemberList &MainObject::staticMembers()
{
    static const MemberList list(BaseObject::staticMembers(), {
        member("isResource", &MainObject::isResource, &MainObject::setIsResource),
    });
    return list;
}

} // namespace vexa
