#include "standard.h"

#include "membertraits.h"
#include "toleranceset.h"

namespace vexa {

const MemberList &Standard::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("appearanceValues", &Standard::appearanceValuesList, &Standard::setAppearanceValuesList),
        reference("toleranceSets", &Standard::toleranceSets, &Standard::setToleranceSets),
        member("sampleParts", &Standard::sampleParts, &Standard::setSampleParts),
    });
    return list;
}

std::shared_ptr<AppearanceValues> Standard::appearanceValues(int index) const
{
    return (index >= 0 && size_t(index) < m_appearanceValues.size()) ? m_appearanceValues[size_t(index)] : nullptr;
}

void Standard::setAppearanceValues(const std::shared_ptr<AppearanceValues> &values)
{
    m_appearanceValues.clear();
    if (values)
        m_appearanceValues.push_back(values);
}

void Standard::setToleranceSets(const std::vector<std::shared_ptr<ToleranceSet>> &sets)
{
    m_toleranceSets = sets;
}

} // namespace vexa
