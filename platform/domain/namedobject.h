#pragma once

#include <domain/mainobject.h>

#include <utilities/timestamp.h>

#include <memory>
#include <vector>

namespace vexa {

class TagDefinition;
class TagValue;

// A stored object with a name (kept in its header), a time stamp and tags.
class VEXA_DOMAIN_EXPORT NamedObject : public MainObject
{
    VEXA_REFLECTABLE_ABSTRACT(NamedObject)
public:
    ~NamedObject() override;

    QString name() const { return header().name(); }
    void setName(const QString &name) { header().setName(name); }
    Timestamp timeStamp() const { return m_timeStamp; }
    void setTimeStamp(const Timestamp &timeStamp) { m_timeStamp = timeStamp; }

    // The tag definitions that apply to this object (references).
    const std::vector<std::shared_ptr<TagDefinition>> &tagDefinitions() const { return m_tagDefinitions; }
    void setTagDefinitions(const std::vector<std::shared_ptr<TagDefinition>> &definitions);
    // The object's tag values (owned).
    const std::vector<std::shared_ptr<TagValue>> &tagValues() const { return m_tagValues; }
    void setTagValues(const std::vector<std::shared_ptr<TagValue>> &values);
    // The value of the given tag (matched by the definition's id); null when absent.
    std::shared_ptr<TagValue> tagValue(const TagDefinition &definition) const;
    std::shared_ptr<TagValue> tagValue(const std::shared_ptr<TagDefinition> &definition) const;

protected:
    NamedObject();
    NamedObject(const NamedObject &) = default;

private:
    Timestamp m_timeStamp;
    std::vector<std::shared_ptr<TagDefinition>> m_tagDefinitions;
    std::vector<std::shared_ptr<TagValue>> m_tagValues;
};

} // namespace vexa
