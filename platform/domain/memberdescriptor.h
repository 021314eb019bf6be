#pragma once

#include <domain/domain_export.h>

#include <QJsonValue>
#include <QString>
#include <QVariant>

#include <functional>
#include <memory>
#include <vector>

namespace vexa {

class BaseObject;
class CopyContext;
class ReadContext;
class Reflectable;
class SampleContext;

// What a member holds; decides how it is stored, copied, compared and shown.
enum class MemberKind {
    Bool,
    Int,
    Double,
    String,
    StringList,
    DoubleVector,
    ByteArray,
    Timestamp,
    Geometry,
    ColorimetricCondition,
    Uuid,
    Variant,
    Enum,
    Byte,
    ValueObject,     // a nested object held by value (Header, ColorPhysicalCondition ...)
    OwnedObject,     // a nested object held by shared pointer, possibly of a derived kind
    OwnedObjectList, // a list of those
    Reference,       // another stored object, stored as {"$ref": id, "$type": type}
    ReferenceList,
};

VEXA_DOMAIN_EXPORT QString memberKindName(MemberKind kind);

// One member of a class: its name, its kind and how to get and set it. Every
// generic operation (serialization, deep copy, equality, reflection, sample
// filling in tests) walks a class's list of these.
class VEXA_DOMAIN_EXPORT MemberDescriptor
{
public:
    MemberDescriptor(const QString &name, MemberKind kind, const QString &innerType);
    virtual ~MemberDescriptor();

    QString name() const { return m_name; }
    MemberKind kind() const { return m_kind; }
    // The class name of nested and referenced objects; the C++ type otherwise.
    QString innerType() const { return m_innerType; }

    virtual QJsonValue write(const Reflectable &object) const = 0;
    // Reads the member; on failure records an error in the context and returns false.
    virtual bool read(Reflectable &object, const QJsonValue &value, ReadContext &context) const = 0;
    virtual void copy(const Reflectable &from, Reflectable &to, CopyContext &context) const = 0;
    // On a difference, describes it relative to this member (": 1 != 2", ".l: ..." ...).
    virtual bool equal(const Reflectable &a, const Reflectable &b, QString *difference) const = 0;
    // The value for display: plain values as they are, geometry and timestamps as text,
    // objects as std::shared_ptr<vexa::Reflectable> (lists as QVariantList of those).
    virtual QVariant value(const Reflectable &object) const = 0;
    virtual void fillSample(Reflectable &object, SampleContext &context) const = 0;
    virtual void collectReferences(const Reflectable &object,
                                   std::vector<std::shared_ptr<BaseObject>> &references) const = 0;
    virtual void forEachOwned(const Reflectable &object,
                              const std::function<void(const Reflectable &)> &function) const = 0;

private:
    QString m_name;
    MemberKind m_kind;
    QString m_innerType;
};

using MemberDescriptorPtr = std::shared_ptr<const MemberDescriptor>;

// The members of a class, the base class's first.
class VEXA_DOMAIN_EXPORT MemberList
{
public:
    MemberList() = default;
    MemberList(std::initializer_list<MemberDescriptorPtr> members);
    MemberList(const MemberList &base, std::initializer_list<MemberDescriptorPtr> members);

    int size() const { return int(m_members.size()); }
    const MemberDescriptor &at(int index) const { return *m_members.at(size_t(index)); }
    const MemberDescriptor *find(const QString &name) const;
    std::vector<MemberDescriptorPtr>::const_iterator begin() const { return m_members.begin(); }
    std::vector<MemberDescriptorPtr>::const_iterator end() const { return m_members.end(); }

private:
    std::vector<MemberDescriptorPtr> m_members;
};

} // namespace vexa
