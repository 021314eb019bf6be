#include <context/addobject.h>

namespace vexa {

AddObject::AddObject() = default;
AddObject::~AddObject() = default;

QString AddObject::typeName() const
{
    return typeId();
}

} // namespace vexa
