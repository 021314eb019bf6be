#include "reflectable.h"

#include "classinformation.h"
#include "reflection.h"

namespace vexa {

Reflectable::~Reflectable() = default;

std::shared_ptr<Reflectable> Reflectable::clone() const
{
    return Reflection::deepCopy(*this);
}

std::shared_ptr<ClassInformation> Reflectable::classInformationObject() const
{
    QVector<ClassComponent> components;
    for (const auto &m : members())
        components.append(ClassComponent(m->name(), memberKindName(m->kind()), m->innerType(), m->value(*this)));
    return std::make_shared<ClassInformation>(typeName(), components);
}

void Reflectable::visit(const std::function<void(const Reflectable &)> &function) const
{
    function(*this);
    for (const auto &m : members())
        m->forEachOwned(*this, function);
}

void Reflectable::visitMembers(const std::function<void(const MemberDescriptor &, const QVariant &)> &function) const
{
    for (const auto &m : members())
        function(*m, m->value(*this));
}

bool Reflectable::isEqualTo(const Reflectable &other, QString *difference) const
{
    return Reflection::equal(*this, other, difference);
}

} // namespace vexa
