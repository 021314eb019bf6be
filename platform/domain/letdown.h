#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A letdown series of a colorant.
class VEXA_DOMAIN_EXPORT Letdown : public NamedObject
{
    VEXA_REFLECTABLE(Letdown)
};

} // namespace vexa
