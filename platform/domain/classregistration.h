#pragma once

#include <domain/classinformation.h>
#include <domain/domain_export.h>
#include <domain/memberdescriptor.h>

#include <QHash>
#include <QStringList>

#include <functional>
#include <memory>

namespace vexa {

class BaseObject;
class Reflectable;

// Creates objects by class name; what a reader uses to turn "$type" into an object.
class VEXA_DOMAIN_EXPORT SerializableFactory
{
public:
    std::shared_ptr<Reflectable> create(const QString &typeName) const;
    // Null when the name is unknown or not a stored object class.
    std::shared_ptr<BaseObject> createObject(const QString &typeName) const;
    bool canCreate(const QString &typeName) const;
};

// Every concrete class of the domain by name: factory and member list. Filled
// once on first use, read-only afterwards (safe from any thread).
class VEXA_DOMAIN_EXPORT ClassRegistration
{
public:
    using Factory = std::function<std::shared_ptr<Reflectable>()>;

    static ClassRegistration &instance();

    const SerializableFactory &serializableFactory() const { return m_factory; }

    bool contains(const QString &typeName) const;
    std::shared_ptr<Reflectable> create(const QString &typeName) const;
    // The registered class names, sorted.
    QStringList typeNames() const;
    // The names of the registered classes that are stored objects (BaseObject kinds).
    QStringList objectTypeNames() const;
    // The members of a class without values; null for an unknown name.
    std::shared_ptr<ClassInformation> classInformation(const QString &typeName) const;

    template<class T>
    void registerClass()
    {
        registerFactory(T::typeId(), [] { return std::static_pointer_cast<Reflectable>(std::make_shared<T>()); });
    }
    void registerFactory(const QString &typeName, const Factory &factory);

private:
    ClassRegistration();
    Q_DISABLE_COPY(ClassRegistration)

    QHash<QString, Factory> m_factories;
    SerializableFactory m_factory;
};

} // namespace vexa
