#pragma once

#include <domain/domain_export.h>

namespace vexa {

// Drives Reflection::fillWithSamples: a running counter that makes every generated
// value differ from the defaults and from its neighbours, and a nesting limit for
// owned sub-objects (deeper owned pointers stay null, deeper lists empty).
class VEXA_DOMAIN_EXPORT SampleContext
{
public:
    explicit SampleContext(int seed = 1, int maxDepth = 3);

    int next() { return ++m_counter; }
    int depth() const { return m_depth; }
    bool canDescend() const { return m_depth < m_maxDepth; }
    void enter() { ++m_depth; }
    void leave() { --m_depth; }

private:
    int m_counter;
    int m_depth = 0;
    int m_maxDepth;
};

} // namespace vexa
