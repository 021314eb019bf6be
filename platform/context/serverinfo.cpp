#include <context/serverinfo.h>

namespace vexa {

ServerInfo::ServerInfo() = default;
ServerInfo::~ServerInfo() = default;

QString ServerInfo::typeName() const
{
    return typeId();
}

} // namespace vexa
