#include "texturescalevalues.h"

#include "membertraits.h"

namespace vexa {

TextureScaleValues::~TextureScaleValues() = default;

const MemberList &TextureScaleValues::staticMembers()
{
    static const MemberList list;
    return list;
}

} // namespace vexa
