#include "texturevalues.h"

#include "membertraits.h"

namespace vexa {

const MemberList &TextureValues::staticMembers()
{
    static const MemberList list{
        member("textureImage", &TextureValues::textureImage, &TextureValues::setTextureImage),
        member("texturePhysicalConditions", &TextureValues::physicalConditionValue, &TextureValues::setTexturePhysicalConditions),
        member("textureScaleValues", &TextureValues::textureScaleValues, &TextureValues::setTextureScaleValues),
    };
    return list;
}

} // namespace vexa
