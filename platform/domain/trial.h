#pragma once

#include <domain/appearancevalues.h>
#include <domain/namedobject.h>

namespace vexa {

class Standard;

// A measured sample judged against a standard.
class VEXA_DOMAIN_EXPORT Trial : public NamedObject
{
    VEXA_REFLECTABLE(Trial)
public:
    // The measurement (owned).
    std::shared_ptr<AppearanceValues> appearanceValues() const { return m_appearanceValues; }
    void setAppearanceValues(const std::shared_ptr<AppearanceValues> &values) { m_appearanceValues = values; }
    // The standard it is compared with (a reference; a stub until loaded).
    std::shared_ptr<Standard> standard() const { return m_standard; }
    void setStandard(const std::shared_ptr<Standard> &standard) { m_standard = standard; }

private:
    std::shared_ptr<AppearanceValues> m_appearanceValues;
    std::shared_ptr<Standard> m_standard;
};

} // namespace vexa
