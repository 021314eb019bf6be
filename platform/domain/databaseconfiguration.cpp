#include "databaseconfiguration.h"

#include "membertraits.h"

namespace vexa {

const MemberList &DatabaseConfiguration::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
