#pragma once

#include <domain/toleranceparameter.h>

namespace vexa {

// A limit of a tolerance (e.g. "dL" = 1.0): a parameter the judgement compares against.
class VEXA_DOMAIN_EXPORT ToleranceValue : public ToleranceParameter
{
    VEXA_REFLECTABLE(ToleranceValue)
public:
    ToleranceValue() = default;
    ToleranceValue(const QString &name, const QString &displayName, double value)
        : ToleranceParameter(name, displayName, ParameterType::Double, value)
    {
    }
};

} // namespace vexa
