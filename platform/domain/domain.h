#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A business domain (a set of products and their rules).
class VEXA_DOMAIN_EXPORT Domain : public NamedObject
{
    VEXA_REFLECTABLE(Domain)
};

} // namespace vexa
