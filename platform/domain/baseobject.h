#pragma once

#include <domain/domain_export.h>
#include <domain/header.h>
#include <domain/reflectable.h>

#include <QByteArray>
#include <QMetaType>
#include <QUuid>

#include <memory>
#include <vector>

namespace vexa {

// Every stored object. The id is the store's key (a new object gets its UUID's
// text as id); version is the optimistic-locking counter the store increments.
// isStored and the stub mark are state of this process, not stored:
// a stub is an object known only by id and type (a reference read from storage)
// that a loader replaces with the full object.
class VEXA_DOMAIN_EXPORT BaseObject : public Reflectable
{
    VEXA_REFLECTABLE_ABSTRACT(BaseObject)
public:
    ~BaseObject() override;

    QString id() const { return m_id; }
    void setId(const QString &id) { m_id = id; }
    QUuid uuid() const { return m_uuid; }
    void setUuid(const QUuid &uuid) { m_uuid = uuid; }
    int variant() const { return m_variant; }
    void setVariant(int variant) { m_variant = variant; }
    int version() const { return m_version; }
    void setVersion(int version) { m_version = version; }

    const Header &header() const { return m_header; }
    Header &header() { return m_header; }
    void setHeader(const Header &header) { m_header = header; }

    bool isStored() const { return m_isStored; }
    void setIsStored(bool stored) { m_isStored = stored; }
    bool isStub() const { return m_isStub; }
    void setIsStub(bool stub) { m_isStub = stub; }

    // A copy sharing nothing mutable with this object, referenced objects included
    // (each copied once; ids are kept).
    std::shared_ptr<BaseObject> deepCopy() const;
    // The stored objects this object and its owned parts refer to.
    std::vector<std::shared_ptr<BaseObject>> referencedObjects() const;

    // The stored form (Serialization::toBytes).
    QByteArray serialize() const;
    // Replaces every member with those of the stored form in bytes, which must hold an
    // object of this class. On failure nothing changes and error says why.
    bool deserialize(const QByteArray &bytes, QString *error = nullptr);

protected:
    BaseObject();
    BaseObject(const BaseObject &) = default;
    BaseObject &operator=(const BaseObject &) = default;

private:
    Header headerValue() const { return m_header; }

    QString m_id;
    QUuid m_uuid;
    int m_variant = 0;
    int m_version = 0;
    Header m_header;
    bool m_isStored = false;
    bool m_isStub = false;
};

} // namespace vexa

Q_DECLARE_METATYPE(std::shared_ptr<vexa::BaseObject>)
