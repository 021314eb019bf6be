#include <context/copyobjectresponse.h>

namespace vexa {

CopyObjectResponse::~CopyObjectResponse() = default;

} // namespace vexa
