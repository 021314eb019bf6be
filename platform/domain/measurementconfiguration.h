#pragma once

#include <domain/namedobject.h>

namespace vexa {

// The measurement settings an instrument is used with.
class VEXA_DOMAIN_EXPORT MeasurementConfiguration : public NamedObject
{
    VEXA_REFLECTABLE(MeasurementConfiguration)
};

} // namespace vexa
