#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A folder of the store; its entries are listed through DirEntry objects.
class VEXA_DOMAIN_EXPORT Folder : public NamedObject
{
    VEXA_REFLECTABLE(Folder)
};

} // namespace vexa
