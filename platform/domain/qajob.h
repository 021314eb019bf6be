#pragma once

#include <domain/namedobject.h>

namespace vexa {

// A quality assurance job.
class VEXA_DOMAIN_EXPORT QAJob : public NamedObject
{
    VEXA_REFLECTABLE(QAJob)
};

} // namespace vexa
