#include "texturescalevaluesdirectional.h"

#include "membertraits.h"

namespace vexa {

const MemberList &TextureScaleValuesDirectional::staticMembers()
{
    using C = TextureScaleValuesDirectional;
    static const MemberList list(TextureScaleValues::staticMembers(), {
        member("sparkleGrade", &C::sparkleGrade, &C::setSparkleGrade),
        member("sparkleColorVariation", &C::sparkleColorVariation, &C::setSparkleColorVariation),
        member("sparkleIntensity", &C::sparkleIntensity, &C::setSparkleIntensity),
        member("sparkleArea", &C::sparkleArea, &C::setSparkleArea),
    });
    return list;
}

} // namespace vexa
