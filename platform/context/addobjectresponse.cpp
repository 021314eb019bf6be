#include <context/addobjectresponse.h>

namespace vexa {

AddObjectResponse::~AddObjectResponse() = default;

} // namespace vexa
