#include <store/objectcodec.h>

#include <domain/baseobject.h>
#include <domain/direntry.h>
#include <domain/folder.h>
#include <domain/header.h>
#include <domain/serialization.h>

#include <QCoreApplication>

namespace vexa {

namespace {

bool brokenRow(ErrorInfo *error, const StoreRecord &record, const QString &detail)
{
    return ErrorInfo::fail(error, CorvidErrorCode::SerializationError,
                           QCoreApplication::translate("vexa::ObjectCodec", "The stored object \"%1\" cannot be read.")
                               .arg(record.name.isEmpty() ? record.id : record.name),
                           detail);
}

void applyRecordIdentity(const StoreRecord &record, BaseObject *object)
{
    object->setId(record.id);
    object->setUuid(QUuid::fromString(record.uuid));
    object->setVersion(record.version);
    object->setIsStored(true);
    object->setIsStub(false);
}

} // namespace

bool ObjectCodec::toRecord(const BaseObject &object, StoreRecord *record, ErrorInfo *error)
{
    Q_UNUSED(error)
    record->id = object.id();
    record->uuid = object.uuid().isNull() ? QString() : object.uuid().toString(QUuid::WithoutBraces);
    record->type = object.typeName();
    record->name = object.header().name();
    record->header = Serialization::toBytes(object.header());
    record->version = object.version();
    record->data = Serialization::toBytes(object);
    return true;
}

std::shared_ptr<BaseObject> ObjectCodec::fromRecord(const StoreRecord &record, ErrorInfo *error)
{
    std::shared_ptr<BaseObject> object;
    if (record.data.isEmpty() && record.isFolder()) {
        // The root folder has no stored form of its own.
        auto folder = std::make_shared<Folder>();
        folder->setName(record.name);
        object = folder;
    } else {
        QString detail;
        object = Serialization::fromBytes(record.data, &detail);
        if (!object) {
            brokenRow(error, record, detail);
            return nullptr;
        }
        if (object->typeName() != record.type) {
            brokenRow(error, record, QStringLiteral("stored as %1 but holds a %2").arg(record.type, object->typeName()));
            return nullptr;
        }
    }
    applyRecordIdentity(record, object.get());
    return object;
}

bool ObjectCodec::readInto(const StoreRecord &record, BaseObject *object, ErrorInfo *error)
{
    if (object->typeName() != record.type)
        return brokenRow(error, record, QStringLiteral("a %1 referred to as a %2").arg(record.type, object->typeName()));
    QString detail;
    if (!record.data.isEmpty() && !object->deserialize(record.data, &detail))
        return brokenRow(error, record, detail);
    applyRecordIdentity(record, object);
    return true;
}

std::shared_ptr<DirEntry> ObjectCodec::toDirEntry(const StoreRecord &record)
{
    auto entry = std::make_shared<DirEntry>();
    Header header;
    if (const auto read = std::dynamic_pointer_cast<Header>(Serialization::readAny(record.header)))
        header = *read;
    if (header.name().isEmpty())
        header.setName(record.name);
    entry->setEntryInfo(record.id, record.type, header);
    entry->setParentFolderId(record.parentId);
    entry->setVersion(record.version);
    entry->setIsStored(true);
    return entry;
}

} // namespace vexa
