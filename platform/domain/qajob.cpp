#include "qajob.h"

#include "membertraits.h"

namespace vexa {

const MemberList &QAJob::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
