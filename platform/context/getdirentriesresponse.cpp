#include <context/getdirentriesresponse.h>

namespace vexa {

GetDirEntriesResponse::~GetDirEntriesResponse() = default;

} // namespace vexa
