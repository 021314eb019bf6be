#include <context/copyobject.h>

namespace vexa {

CopyObject::CopyObject() = default;
CopyObject::~CopyObject() = default;

QString CopyObject::typeName() const
{
    return typeId();
}

} // namespace vexa
