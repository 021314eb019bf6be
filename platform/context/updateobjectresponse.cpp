#include <context/updateobjectresponse.h>

namespace vexa {

UpdateObjectResponse::~UpdateObjectResponse() = default;

} // namespace vexa
