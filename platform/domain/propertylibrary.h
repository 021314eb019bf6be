#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A collection of properties.
class VEXA_DOMAIN_EXPORT PropertyLibrary : public NamedObject
{
    VEXA_REFLECTABLE(PropertyLibrary)
};

} // namespace vexa
