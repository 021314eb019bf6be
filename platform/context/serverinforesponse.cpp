#include <context/serverinforesponse.h>

namespace vexa {

ServerInfoResponse::~ServerInfoResponse() = default;

} // namespace vexa
