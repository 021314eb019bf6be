#include "user.h"

#include "membertraits.h"

namespace vexa {

const MemberList &User::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("fullName", &User::fullName, &User::setFullName),
        member("email", &User::email, &User::setEmail),
        member("isAdministrator", &User::isAdministrator, &User::setIsAdministrator),
    });
    return list;
}

} // namespace vexa
