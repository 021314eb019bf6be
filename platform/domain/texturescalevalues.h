#pragma once

#include <domain/reflectable.h>

namespace vexa {

// The scalar results of a texture measurement; the kind depends on the geometry:
// TextureScaleValuesDiffuse (coarseness) or TextureScaleValuesDirectional (sparkle).
class VEXA_DOMAIN_EXPORT TextureScaleValues : public Reflectable
{
    VEXA_REFLECTABLE_ABSTRACT(TextureScaleValues)
public:
    ~TextureScaleValues() override;

protected:
    TextureScaleValues() = default;
};

} // namespace vexa
