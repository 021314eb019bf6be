#include "rgbvalue.h"

#include "membertraits.h"

namespace vexa {

const MemberList &RGBValue::staticMembers()
{
    static const MemberList list{
        member("R", &RGBValue::R, &RGBValue::setR),
        member("G", &RGBValue::G, &RGBValue::setG),
        member("B", &RGBValue::B, &RGBValue::setB),
    };
    return list;
}

} // namespace vexa
