#include <context/getcorvidobjectsresponse.h>

namespace vexa {

GetCorvidObjectsResponse::~GetCorvidObjectsResponse() = default;

} // namespace vexa
