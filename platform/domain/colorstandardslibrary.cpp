#include "colorstandardslibrary.h"

#include "membertraits.h"
#include "standard.h"

namespace vexa {

const MemberList &ColorStandardsLibrary::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        reference("standards", &ColorStandardsLibrary::standards, &ColorStandardsLibrary::setStandards),
    });
    return list;
}

void ColorStandardsLibrary::setStandards(const std::vector<std::shared_ptr<Standard>> &standards)
{
    m_standards = standards;
}

} // namespace vexa
