#pragma once

#include <domain/toleranceparameter.h>

namespace vexa {

// The parameters that apply to every tolerance of a set.
class VEXA_DOMAIN_EXPORT ToleranceSetParameters : public Reflectable
{
    VEXA_REFLECTABLE(ToleranceSetParameters)
public:
    const std::vector<std::shared_ptr<ToleranceParameter>> &toleranceParameters() const { return m_parameters; }
    void setToleranceParameters(const std::vector<std::shared_ptr<ToleranceParameter>> &parameters) { m_parameters = parameters; }
    // The parameter with the given name; null when absent.
    std::shared_ptr<ToleranceParameter> parameter(const QString &name) const;

private:
    std::vector<std::shared_ptr<ToleranceParameter>> m_parameters;
};

} // namespace vexa
