#include "tolerancevalue.h"

#include "membertraits.h"

namespace vexa {

const MemberList &ToleranceValue::staticMembers()
{
    static const MemberList list(ToleranceParameter::staticMembers(), {});
    return list;
}

} // namespace vexa
