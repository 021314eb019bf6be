#pragma once

#include <domain/namedobject.h>

namespace vexa {

class Standard;

// A named collection of standards (references).
class VEXA_DOMAIN_EXPORT ColorStandardsLibrary : public NamedObject
{
    VEXA_REFLECTABLE(ColorStandardsLibrary)
public:
    const std::vector<std::shared_ptr<Standard>> &standards() const { return m_standards; }
    void setStandards(const std::vector<std::shared_ptr<Standard>> &standards);

private:
    std::vector<std::shared_ptr<Standard>> m_standards;
};

} // namespace vexa
