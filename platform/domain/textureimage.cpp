#include "textureimage.h"

#include "membertraits.h"

namespace vexa {

const MemberList &TextureImage::staticMembers()
{
    static const MemberList list{
        member("data", &TextureImage::data, &TextureImage::setData),
        member("format", &TextureImage::format, &TextureImage::setFormat),
        member("width", &TextureImage::width, &TextureImage::setWidth),
        member("height", &TextureImage::height, &TextureImage::setHeight),
    };
    return list;
}

} // namespace vexa
