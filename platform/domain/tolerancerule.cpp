#include "tolerancerule.h"

namespace vexa {

ToleranceRule::~ToleranceRule() = default;

} // namespace vexa
