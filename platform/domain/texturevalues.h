#pragma once

#include <domain/textureimage.h>
#include <domain/texturephysicalcondition.h>
#include <domain/texturescalevalues.h>

#include <memory>

namespace vexa {

// One texture measurement at one geometry: the image and the scalar results.
class VEXA_DOMAIN_EXPORT TextureValues : public Reflectable
{
    VEXA_REFLECTABLE(TextureValues)
public:
    std::shared_ptr<TextureImage> textureImage() const { return m_textureImage; }
    void setTextureImage(const std::shared_ptr<TextureImage> &image) { m_textureImage = image; }
    const TexturePhysicalCondition &texturePhysicalConditions() const { return m_physicalCondition; }
    void setTexturePhysicalConditions(const TexturePhysicalCondition &condition) { m_physicalCondition = condition; }
    Geometry geometry() const { return m_physicalCondition.geometryValue(); }
    std::shared_ptr<TextureScaleValues> textureScaleValues() const { return m_scaleValues; }
    void setTextureScaleValues(const std::shared_ptr<TextureScaleValues> &values) { m_scaleValues = values; }

private:
    TexturePhysicalCondition physicalConditionValue() const { return m_physicalCondition; }

    std::shared_ptr<TextureImage> m_textureImage;
    TexturePhysicalCondition m_physicalCondition;
    std::shared_ptr<TextureScaleValues> m_scaleValues;
};

} // namespace vexa
