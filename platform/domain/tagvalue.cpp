#include "tagvalue.h"

#include "membertraits.h"

namespace vexa {

const MemberList &TagValue::staticMembers()
{
    static const MemberList list(BaseObject::staticMembers(), {
        member("tagDefinitionId", &TagValue::tagDefinitionId, &TagValue::setTagDefinitionId),
        member("value", &TagValue::value, &TagValue::setValue),
    });
    return list;
}

} // namespace vexa
