#include <context/moveobject.h>

namespace vexa {

MoveObject::MoveObject() = default;
MoveObject::~MoveObject() = default;

QString MoveObject::typeName() const
{
    return typeId();
}

} // namespace vexa
