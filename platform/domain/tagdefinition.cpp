#include "tagdefinition.h"

#include "membertraits.h"
#include "tagvalue.h"

namespace vexa {

const MemberList &TagDefinition::staticMembers()
{
    static const MemberList list(NamedObject::staticMembers(), {
        member("values", &TagDefinition::values, &TagDefinition::setValues),
        member("defaultValue", &TagDefinition::defaultValue, &TagDefinition::setDefaultValue),
        member("selectionType", &TagDefinition::selectionType, &TagDefinition::setSelectionType),
    });
    return list;
}

std::shared_ptr<TagValue> TagDefinition::newOrDefaultValue() const
{
    auto value = std::make_shared<TagValue>();
    value->setTagDefinitionId(id());
    value->setValue(m_defaultValue);
    return value;
}

} // namespace vexa
