#pragma once

#include <domain/domain_export.h>

#include <memory>
#include <unordered_map>

namespace vexa {

class Reflectable;

// Remembers the copies made during one deep copy, so that an object referred to
// twice is copied once and both referrers point at the same copy (and cycles end).
class VEXA_DOMAIN_EXPORT CopyContext
{
public:
    std::shared_ptr<Reflectable> copyOf(const Reflectable *original) const;
    void remember(const Reflectable *original, const std::shared_ptr<Reflectable> &copy);

private:
    std::unordered_map<const Reflectable *, std::shared_ptr<Reflectable>> m_copies;
};

} // namespace vexa
