#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A filter that selects the objects of a quality assurance job.
class VEXA_DOMAIN_EXPORT QAFilter : public NamedObject
{
    VEXA_REFLECTABLE(QAFilter)
};

} // namespace vexa
