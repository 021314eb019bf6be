#pragma once

// Not installed: a helper of the shared view models.

#include <memory>
#include <vector>

namespace vexa {

// True when both lists hold the very same objects in the same order (identity, not content).
template<typename T>
bool sameObjects(const std::vector<std::shared_ptr<T>> &a, const std::vector<std::shared_ptr<T>> &b)
{
    if (a.size() != b.size())
        return false;
    for (size_t i = 0; i < a.size(); ++i) {
        if (a[i].get() != b[i].get())
            return false;
    }
    return true;
}

} // namespace vexa
