#include "namedobject.h"

#include "membertraits.h"
#include "tagdefinition.h"
#include "tagvalue.h"

namespace vexa {

NamedObject::NamedObject() = default;
NamedObject::~NamedObject() = default;

const MemberList &NamedObject::staticMembers()
{
    static const MemberList list(MainObject::staticMembers(), {
        member("timeStamp", &NamedObject::timeStamp, &NamedObject::setTimeStamp),
        reference("tagDefinitions", &NamedObject::tagDefinitions, &NamedObject::setTagDefinitions),
        member("tagValues", &NamedObject::tagValues, &NamedObject::setTagValues),
    });
    return list;
}

void NamedObject::setTagDefinitions(const std::vector<std::shared_ptr<TagDefinition>> &definitions)
{
    m_tagDefinitions = definitions;
}

void NamedObject::setTagValues(const std::vector<std::shared_ptr<TagValue>> &values)
{
    m_tagValues = values;
}

std::shared_ptr<TagValue> NamedObject::tagValue(const TagDefinition &definition) const
{
    for (const auto &value : m_tagValues) {
        if (value && value->tagDefinitionId() == definition.id())
            return value;
    }
    return nullptr;
}

std::shared_ptr<TagValue> NamedObject::tagValue(const std::shared_ptr<TagDefinition> &definition) const
{
    return definition ? tagValue(*definition) : nullptr;
}

} // namespace vexa
