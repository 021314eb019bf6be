#include "texturescalevaluesdiffuse.h"

#include "membertraits.h"

namespace vexa {

const MemberList &TextureScaleValuesDiffuse::staticMembers()
{
    static const MemberList list(TextureScaleValues::staticMembers(), {
        member("coarseness", &TextureScaleValuesDiffuse::coarseness, &TextureScaleValuesDiffuse::setCoarseness),
    });
    return list;
}

} // namespace vexa
