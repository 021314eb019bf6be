#include "texturephysicalcondition.h"

#include "membertraits.h"

namespace vexa {

const MemberList &TexturePhysicalCondition::staticMembers()
{
    static const MemberList list{
        member("geometry", &TexturePhysicalCondition::geometry, &TexturePhysicalCondition::setGeometry),
    };
    return list;
}

} // namespace vexa
