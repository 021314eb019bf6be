#include "reflectancespectrum.h"

#include "membertraits.h"

namespace vexa {

const MemberList &ReflectanceSpectrum::staticMembers()
{
    static const MemberList list(SpectralValues::staticMembers(), {});
    return list;
}

} // namespace vexa
