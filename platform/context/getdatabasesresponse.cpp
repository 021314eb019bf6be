#include <context/getdatabasesresponse.h>

namespace vexa {

GetDatabasesResponse::~GetDatabasesResponse() = default;

} // namespace vexa
