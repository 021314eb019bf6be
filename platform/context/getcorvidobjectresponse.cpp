#include <context/getcorvidobjectresponse.h>

namespace vexa {

GetCorvidObjectResponse::~GetCorvidObjectResponse() = default;

} // namespace vexa
