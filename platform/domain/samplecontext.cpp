#include "samplecontext.h"

namespace vexa {

SampleContext::SampleContext(int seed, int maxDepth)
    : m_counter(seed), m_maxDepth(maxDepth)
{
}

} // namespace vexa
