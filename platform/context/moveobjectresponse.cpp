#include <context/moveobjectresponse.h>

namespace vexa {

MoveObjectResponse::~MoveObjectResponse() = default;

} // namespace vexa
