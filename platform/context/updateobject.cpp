#include <context/updateobject.h>

namespace vexa {

UpdateObject::UpdateObject() = default;
UpdateObject::~UpdateObject() = default;

QString UpdateObject::typeName() const
{
    return typeId();
}

} // namespace vexa
