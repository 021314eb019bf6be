#include "domainmetatypes.h"

#include "colorimetriccondition.h"
#include "geometry.h"
#include "serialization.h"

#include <mutex>

namespace vexa {

namespace {

template<class T>
void readObject(QDataStream &stream, std::shared_ptr<T> &object)
{
    QByteArray bytes;
    stream >> bytes;
    object.reset();
    if (stream.status() != QDataStream::Ok || bytes.isEmpty())
        return;
    object = std::dynamic_pointer_cast<T>(Serialization::fromBytes(bytes));
    if (!object)
        stream.setStatus(QDataStream::ReadCorruptData);
}

} // namespace

QDataStream &operator<<(QDataStream &stream, const std::shared_ptr<BaseObject> &object)
{
    return stream << (object ? Serialization::toBytes(*object) : QByteArray());
}

QDataStream &operator>>(QDataStream &stream, std::shared_ptr<BaseObject> &object)
{
    readObject(stream, object);
    return stream;
}

QDataStream &operator<<(QDataStream &stream, const std::shared_ptr<GlobalDirEntry> &entry)
{
    return stream << (entry ? Serialization::toBytes(*entry) : QByteArray());
}

QDataStream &operator>>(QDataStream &stream, std::shared_ptr<GlobalDirEntry> &entry)
{
    readObject(stream, entry);
    return stream;
}

void registerDomainMetaTypes()
{
    static std::once_flag once;
    std::call_once(once, [] {
        qRegisterMetaType<std::shared_ptr<BaseObject>>("std::shared_ptr<vexa::BaseObject>");
        qRegisterMetaType<std::shared_ptr<GlobalDirEntry>>("std::shared_ptr<vexa::GlobalDirEntry>");
        qRegisterMetaTypeStreamOperators<std::shared_ptr<BaseObject>>("std::shared_ptr<vexa::BaseObject>");
        qRegisterMetaTypeStreamOperators<std::shared_ptr<GlobalDirEntry>>("std::shared_ptr<vexa::GlobalDirEntry>");
        qRegisterMetaType<std::shared_ptr<Reflectable>>("std::shared_ptr<vexa::Reflectable>");
        qRegisterMetaType<Geometry>("vexa::Geometry");
        qRegisterMetaType<ColorimetricCondition>("vexa::ColorimetricCondition");
    });
}

} // namespace vexa
