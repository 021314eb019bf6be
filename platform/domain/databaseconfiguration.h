#pragma once

#include <domain/namedobject.h>

namespace vexa {

// The configuration of a store database.
class VEXA_DOMAIN_EXPORT DatabaseConfiguration : public NamedObject
{
    VEXA_REFLECTABLE(DatabaseConfiguration)
};

} // namespace vexa
