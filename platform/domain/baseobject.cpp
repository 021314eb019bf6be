#include "baseobject.h"

#include "membertraits.h"
#include "serialization.h"

namespace vexa {

BaseObject::BaseObject()
    : m_uuid(QUuid::createUuid())
{
    m_id = m_uuid.toString(QUuid::WithoutBraces);
}

BaseObject::~BaseObject() = default;

const MemberList &BaseObject::staticMembers()
{
    static const MemberList list{
        member("id", &BaseObject::id, &BaseObject::setId),
        member("uuid", &BaseObject::uuid, &BaseObject::setUuid),
        member("variant", &BaseObject::variant, &BaseObject::setVariant),
        member("version", &BaseObject::version, &BaseObject::setVersion),
        member("header", &BaseObject::headerValue, &BaseObject::setHeader),
    };
    return list;
}

std::shared_ptr<BaseObject> BaseObject::deepCopy() const
{
    return std::static_pointer_cast<BaseObject>(clone());
}

std::vector<std::shared_ptr<BaseObject>> BaseObject::referencedObjects() const
{
    return Reflection::references(*this);
}

QByteArray BaseObject::serialize() const
{
    return Serialization::toBytes(*this);
}

bool BaseObject::deserialize(const QByteArray &bytes, QString *error)
{
    QString message;
    const auto read = Serialization::fromBytes(bytes, &message);
    if (read && read->typeName() != typeName())
        message = QStringLiteral("the data holds a %1, not a %2").arg(read->typeName(), typeName());
    if (!message.isEmpty() || !read) {
        if (error)
            *error = message;
        return false;
    }
    CopyContext context;
    Reflection::copyMembers(*read, *this, context);
    return true;
}

} // namespace vexa
