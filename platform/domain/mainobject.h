#pragma once

#include <domain/baseobject.h>

namespace vexa {

// A stored object that stands on its own in the store (not a part of another).
// A resource is shared read-mostly data (colorants, tolerance sets ...).
class VEXA_DOMAIN_EXPORT MainObject : public BaseObject
{
    VEXA_REFLECTABLE_ABSTRACT(MainObject)
public:
    bool isResource() const { return m_isResource; }
    void setIsResource(bool resource) { m_isResource = resource; }

protected:
    MainObject() = default;

private:
    bool m_isResource = false;
};

} // namespace vexa
