#include "copycontext.h"

namespace vexa {

std::shared_ptr<Reflectable> CopyContext::copyOf(const Reflectable *original) const
{
    const auto it = m_copies.find(original);
    return it == m_copies.end() ? nullptr : it->second;
}

void CopyContext::remember(const Reflectable *original, const std::shared_ptr<Reflectable> &copy)
{
    m_copies[original] = copy;
}

} // namespace vexa
