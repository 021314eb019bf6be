#pragma once

#include <domain/domain_export.h>
#include <domain/memberdescriptor.h>

#include <QMetaType>
#include <QString>

#include <functional>
#include <memory>

namespace vexa {

class ClassInformation;

// Anything whose members are described once (a MemberList): stored objects and
// the value objects nested in them. Serialization, deep copy, equality and
// reflection all work from that description.
class VEXA_DOMAIN_EXPORT Reflectable
{
public:
    virtual ~Reflectable();

    virtual QString typeName() const = 0;
    virtual const MemberList &members() const = 0;
    // A default-constructed object of the same dynamic type.
    virtual std::shared_ptr<Reflectable> createInstance() const = 0;

    // A copy that shares nothing mutable with this one (see Reflection::deepCopy).
    std::shared_ptr<Reflectable> clone() const;
    // The class name and every member with its current value.
    std::shared_ptr<ClassInformation> classInformationObject() const;
    // Calls function on this object and then on every owned sub-object held by pointer
    // (value members such as the header are part of their owner), depth first.
    void visit(const std::function<void(const Reflectable &)> &function) const;
    // Calls function for every member of this object with its display value.
    void visitMembers(const std::function<void(const MemberDescriptor &, const QVariant &)> &function) const;
    // Member-wise equality; on a difference, difference names the member path.
    bool isEqualTo(const Reflectable &other, QString *difference = nullptr) const;

protected:
    Reflectable() = default;
    Reflectable(const Reflectable &) = default;
    Reflectable &operator=(const Reflectable &) = default;
};

} // namespace vexa

Q_DECLARE_METATYPE(std::shared_ptr<vexa::Reflectable>)

// Declares the type name and the member list of a class. The member list is
// defined once in the class's source file:
//   const MemberList &Trial::staticMembers()
//   { static const MemberList list(NamedObject::staticMembers(), { member(...), ... }); return list; }
#define VEXA_REFLECTABLE_ABSTRACT(Class)                                                           \
public:                                                                                            \
    static QString typeId() { return QStringLiteral(#Class); }                                     \
    static const ::vexa::MemberList &staticMembers();                                              \
    const ::vexa::MemberList &members() const override { return staticMembers(); }                 \
                                                                                                   \
private:

#define VEXA_REFLECTABLE(Class)                                                                    \
public:                                                                                            \
    static QString typeId() { return QStringLiteral(#Class); }                                     \
    QString typeName() const override { return typeId(); }                                         \
    static const ::vexa::MemberList &staticMembers();                                              \
    const ::vexa::MemberList &members() const override { return staticMembers(); }                 \
    std::shared_ptr<::vexa::Reflectable> createInstance() const override                           \
    {                                                                                              \
        return std::make_shared<Class>();                                                          \
    }                                                                                              \
                                                                                                   \
private:
