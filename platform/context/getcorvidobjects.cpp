#include <context/getcorvidobjects.h>

namespace vexa {

GetCorvidObjects::GetCorvidObjects() = default;
GetCorvidObjects::~GetCorvidObjects() = default;

QString GetCorvidObjects::typeName() const
{
    return typeId();
}

} // namespace vexa
