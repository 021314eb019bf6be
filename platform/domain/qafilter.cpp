#include "qafilter.h"

#include "membertraits.h"

namespace vexa {

const MemberList &QAFilter::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
