#include "classregistration.h"

#include "baseobject.h"
#include "domainclasses.h"
#include "reflectable.h"

#include <algorithm>

namespace vexa {

std::shared_ptr<Reflectable> SerializableFactory::create(const QString &typeName) const
{
    return ClassRegistration::instance().create(typeName);
}

std::shared_ptr<BaseObject> SerializableFactory::createObject(const QString &typeName) const
{
    return std::dynamic_pointer_cast<BaseObject>(create(typeName));
}

bool SerializableFactory::canCreate(const QString &typeName) const
{
    return ClassRegistration::instance().contains(typeName);
}

ClassRegistration::ClassRegistration()
{
    registerDomainClasses(*this);
}

ClassRegistration &ClassRegistration::instance()
{
    static ClassRegistration registration;
    return registration;
}

void ClassRegistration::registerFactory(const QString &typeName, const Factory &factory)
{
    m_factories.insert(typeName, factory);
}

bool ClassRegistration::contains(const QString &typeName) const
{
    return m_factories.contains(typeName);
}

std::shared_ptr<Reflectable> ClassRegistration::create(const QString &typeName) const
{
    const auto it = m_factories.constFind(typeName);
    return it == m_factories.constEnd() ? nullptr : it.value()();
}

QStringList ClassRegistration::typeNames() const
{
    QStringList names = m_factories.keys();
    std::sort(names.begin(), names.end());
    return names;
}

QStringList ClassRegistration::objectTypeNames() const
{
    QStringList out;
    for (const QString &name : typeNames()) {
        if (std::dynamic_pointer_cast<BaseObject>(create(name)))
            out.append(name);
    }
    return out;
}

std::shared_ptr<ClassInformation> ClassRegistration::classInformation(const QString &typeName) const
{
    const auto object = create(typeName);
    if (!object)
        return nullptr;
    QVector<ClassComponent> components;
    for (const auto &m : object->members())
        components.append(ClassComponent(m->name(), memberKindName(m->kind()), m->innerType(), QVariant()));
    return std::make_shared<ClassInformation>(typeName, components);
}

} // namespace vexa
