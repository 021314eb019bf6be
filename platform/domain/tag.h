#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A tag as a stored object of its own.
class VEXA_DOMAIN_EXPORT Tag : public NamedObject
{
    VEXA_REFLECTABLE(Tag)
};

} // namespace vexa
