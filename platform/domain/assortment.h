#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A named grouping of products.
class VEXA_DOMAIN_EXPORT Assortment : public NamedObject
{
    VEXA_REFLECTABLE(Assortment)
};

} // namespace vexa
