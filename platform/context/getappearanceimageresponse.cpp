#include <context/getappearanceimageresponse.h>

namespace vexa {

GetAppearanceImageResponse::~GetAppearanceImageResponse() = default;

} // namespace vexa
