#include <context/getdatabases.h>

namespace vexa {

GetDatabases::GetDatabases() = default;
GetDatabases::~GetDatabases() = default;

QString GetDatabases::typeName() const
{
    return typeId();
}

} // namespace vexa
