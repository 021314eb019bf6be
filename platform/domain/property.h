#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A named property that objects can be tagged with.
class VEXA_DOMAIN_EXPORT Property : public NamedObject
{
    VEXA_REFLECTABLE(Property)
};

} // namespace vexa
