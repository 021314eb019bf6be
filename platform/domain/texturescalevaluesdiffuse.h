#pragma once

#include <domain/texturescalevalues.h>

#include <QtNumeric>

namespace vexa {

class VEXA_DOMAIN_EXPORT TextureScaleValuesDiffuse : public TextureScaleValues
{
    VEXA_REFLECTABLE(TextureScaleValuesDiffuse)
public:
    double coarseness() const { return m_coarseness; }
    void setCoarseness(double coarseness) { m_coarseness = coarseness; }

private:
    double m_coarseness = qQNaN();
};

} // namespace vexa
