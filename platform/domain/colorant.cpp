#include "colorant.h"

#include "membertraits.h"

namespace vexa {

const MemberList &Colorant::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("type", &Colorant::type, &Colorant::setType),
        member("density", &Colorant::density, &Colorant::setDensity),
        member("displayRGB", &Colorant::displayRGBValue, &Colorant::setDisplayRGB),
    });
    return list;
}

} // namespace vexa
