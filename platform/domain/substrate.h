#pragma once

#include <domain/namedobject.h>

namespace vexa {

// The substrate a colour is applied to.
class VEXA_DOMAIN_EXPORT Substrate : public NamedObject
{
    VEXA_REFLECTABLE(Substrate)
};

} // namespace vexa
