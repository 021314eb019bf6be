#include "instrumentinfo.h"

#include "membertraits.h"

namespace vexa {

const MemberList &InstrumentInfo::staticMembers()
{
    static const MemberList list{
        member("serialNumber", &InstrumentInfo::serialNumber, &InstrumentInfo::setSerialNumber),
        member("type", &InstrumentInfo::type, &InstrumentInfo::setType),
    };
    return list;
}

} // namespace vexa
