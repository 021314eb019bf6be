#include "header.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Header::staticMembers()
{
    static const MemberList list{
        member("name", &Header::name, &Header::setName),
        member("description", &Header::description, &Header::setDescription),
        member("creatorId", &Header::creatorId, &Header::setCreatorId),
        member("creationTimestamp", &Header::creationTimestamp, &Header::setCreationTimestamp),
    };
    return list;
}

} // namespace vexa
