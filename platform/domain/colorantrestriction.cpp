#include "colorantrestriction.h"

#include "colorant.h"
#include "membertraits.h"

namespace vexa {

ColorantRestriction::ColorantRestriction() = default;
ColorantRestriction::~ColorantRestriction() = default;

const MemberList &ColorantRestriction::staticMembers()
{
    using C = ColorantRestriction;
    static const MemberList list{
        member("restrictionType", &C::restrictionType, &C::setRestrictionType),
        reference("colorant", &C::colorant, &C::setColorant),
        reference("anchorColorant", &C::anchorColorant, &C::setAnchorColorant),
        member("value", &C::value, &C::setValue),
    };
    return list;
}

void ColorantRestriction::setColorant(const std::shared_ptr<Colorant> &colorant)
{
    m_colorant = colorant;
}

void ColorantRestriction::setAnchorColorant(const std::shared_ptr<Colorant> &colorant)
{
    m_anchorColorant = colorant;
}

} // namespace vexa
