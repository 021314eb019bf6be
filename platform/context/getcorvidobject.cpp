#include <context/getcorvidobject.h>

namespace vexa {

GetCorvidObject::GetCorvidObject() = default;
GetCorvidObject::~GetCorvidObject() = default;

QString GetCorvidObject::typeName() const
{
    return typeId();
}

} // namespace vexa
