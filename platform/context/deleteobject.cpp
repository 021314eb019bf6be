#include <context/deleteobject.h>

namespace vexa {

DeleteObject::DeleteObject() = default;
DeleteObject::~DeleteObject() = default;

QString DeleteObject::typeName() const
{
    return typeId();
}

} // namespace vexa
