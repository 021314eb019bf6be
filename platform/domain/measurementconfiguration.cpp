#include "measurementconfiguration.h"

#include "membertraits.h"

namespace vexa {

const MemberList &MeasurementConfiguration::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {});
    return list;
}

} // namespace vexa
