#include <context/getappearanceimage.h>

namespace vexa {

GetAppearanceImage::GetAppearanceImage() = default;
GetAppearanceImage::~GetAppearanceImage() = default;

QString GetAppearanceImage::typeName() const
{
    return typeId();
}

} // namespace vexa
