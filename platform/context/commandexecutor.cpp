#include <context/commandexecutor.h>

#include <context/addobject.h>
#include <context/addobjectresponse.h>
#include <context/copyobject.h>
#include <context/copyobjectresponse.h>
#include <context/deleteobject.h>
#include <context/getappearanceimage.h>
#include <context/getcorvidobject.h>
#include <context/getcorvidobjectresponse.h>
#include <context/getcorvidobjects.h>
#include <context/getcorvidobjectsresponse.h>
#include <context/getdatabases.h>
#include <context/getdatabasesresponse.h>
#include <context/getdirentries.h>
#include <context/getdirentriesresponse.h>
#include <context/moveobject.h>
#include <context/moveobjectresponse.h>
#include <context/serverinfo.h>
#include <context/serverinforesponse.h>
#include <context/updateobject.h>
#include <context/updateobjectresponse.h>

#include <domain/baseobject.h>
#include <domain/direntry.h>

#include <store/objectcodec.h>
#include <store/objectstore.h>

#include <utilities/logger.h>

#include <QCoreApplication>
#include <QFileInfo>
#include <QHash>

namespace vexa {

namespace {

QString tr(const char *text)
{
    return QCoreApplication::translate("vexa::CommandExecutor", text);
}

// Reports progress at most about fifty times per command.
class Steps
{
public:
    Steps(const CommandExecutor::ProgressFunction &progress, size_t total)
        : m_progress(progress)
        , m_total(total)
    {
    }
    void done(size_t count)
    {
        if (!m_progress || m_total == 0)
            return;
        const size_t stride = std::max<size_t>(1, m_total / 50);
        if (count == m_total || count % stride == 0)
            m_progress(double(count) / double(m_total));
    }

private:
    const CommandExecutor::ProgressFunction &m_progress;
    size_t m_total;
};

// Replaces the unloaded references (stubs) of the objects, in place, with the
// stored objects, `depth` levels deep (-1: all). A reference to an object that
// is gone or unreadable stays a stub and is logged: it must not make the
// referring object unloadable.
void resolveReferences(ObjectStore &store, const std::vector<std::shared_ptr<BaseObject>> &roots, int depth)
{
    QHash<QString, StoreRecord> records;
    for (const auto &root : roots) {
        if (root)
            records.insert(root->id(), StoreRecord());
    }
    std::vector<std::shared_ptr<BaseObject>> level = roots;
    for (int d = 0; !level.empty() && (depth < 0 || d < depth); ++d) {
        std::vector<std::shared_ptr<BaseObject>> next;
        for (const auto &object : level) {
            if (!object)
                continue;
            for (const auto &reference : object->referencedObjects()) {
                if (!reference || !reference->isStub())
                    continue;
                const QString id = reference->id();
                const bool seen = records.contains(id);
                StoreRecord record = records.value(id);
                if (!seen) {
                    std::vector<StoreRecord> found;
                    ErrorInfo error;
                    if (!store.fetch({id}, QString(), &found, &error)) {
                        Logger::instance().debug(LogCategory::Store,
                                                 QStringLiteral("Unresolved reference %1 in %2: %3")
                                                     .arg(id, object->id(), error.toString()));
                        records.insert(id, StoreRecord());
                        continue;
                    }
                    record = found.front();
                    records.insert(id, record);
                }
                if (record.id.isEmpty())
                    continue; // a root object, or known to be missing
                ErrorInfo error;
                if (!ObjectCodec::readInto(record, reference.get(), &error)) {
                    Logger::instance().error(LogCategory::Store,
                                             QStringLiteral("CommandExecutor: %1 [%2]")
                                                 .arg(error.toString(), error.internalMessage()));
                    continue;
                }
                if (!seen)
                    next.push_back(reference);
            }
        }
        level = std::move(next);
    }
}

bool objectsFromRecords(const std::vector<StoreRecord> &records, std::vector<std::shared_ptr<BaseObject>> *objects,
                        Steps *steps, ErrorInfo *error)
{
    objects->clear();
    objects->reserve(records.size());
    for (const StoreRecord &record : records) {
        auto object = ObjectCodec::fromRecord(record, error);
        if (!object)
            return false;
        objects->push_back(std::move(object));
        if (steps)
            steps->done(objects->size());
    }
    return true;
}

} // namespace

CommandExecutor::CommandExecutor(ObjectStore &store)
    : m_store(store)
{
}

std::shared_ptr<Response> CommandExecutor::execute(const std::shared_ptr<Command> &command,
                                                   const ProgressFunction &progress, ErrorInfo *error)
{
    if (!command) {
        ErrorInfo::fail(error, CorvidErrorCode::InvalidRequest, tr("No command."));
        return nullptr;
    }

    if (auto c = std::dynamic_pointer_cast<GetDirEntries>(command)) {
        std::vector<StoreRecord> records;
        if (!m_store.listEntries(c->parentFolderId(), c->types(), &records, error))
            return nullptr;
        std::vector<std::shared_ptr<DirEntry>> entries;
        entries.reserve(records.size());
        for (const StoreRecord &record : records)
            entries.push_back(ObjectCodec::toDirEntry(record));
        auto response = std::make_shared<GetDirEntriesResponse>(command);
        response->setDirEntries(entries);
        return response;
    }

    if (auto c = std::dynamic_pointer_cast<GetCorvidObject>(command)) {
        std::vector<StoreRecord> records;
        if (c->id().isEmpty()) {
            ErrorInfo::fail(error, CorvidErrorCode::ObjectNotFound, tr("No object id given."));
            return nullptr;
        }
        if (!m_store.fetch({c->id()}, c->type(), &records, error))
            return nullptr;
        std::vector<std::shared_ptr<BaseObject>> objects;
        if (!objectsFromRecords(records, &objects, nullptr, error))
            return nullptr;
        resolveReferences(m_store, objects, c->loadAllDetails() ? -1 : c->depth());
        auto response = std::make_shared<GetCorvidObjectResponse>(command);
        response->setObject(objects.front());
        return response;
    }

    if (auto c = std::dynamic_pointer_cast<GetCorvidObjects>(command)) {
        std::vector<StoreRecord> records;
        const bool ok = c->ids().isEmpty() ? m_store.fetchChildren(c->parentFolderId(), c->type(), &records, error)
                                           : m_store.fetch(c->ids(), c->type(), &records, error);
        if (!ok)
            return nullptr;
        Steps steps(progress, records.size());
        std::vector<std::shared_ptr<BaseObject>> objects;
        if (!objectsFromRecords(records, &objects, &steps, error))
            return nullptr;
        if (c->loadAllDetails())
            resolveReferences(m_store, objects, -1);
        auto response = std::make_shared<GetCorvidObjectsResponse>(command);
        response->setObjects(objects);
        return response;
    }

    if (auto c = std::dynamic_pointer_cast<AddObject>(command)) {
        const auto objects = c->objects();
        std::vector<StoreRecord> records(objects.size());
        for (size_t i = 0; i < objects.size(); ++i) {
            if (!objects[i]) {
                ErrorInfo::fail(error, CorvidErrorCode::InvalidRequest, tr("An empty object cannot be stored."));
                return nullptr;
            }
            if (!ObjectCodec::toRecord(*objects[i], &records[i], error))
                return nullptr;
        }
        if (progress)
            progress(0.1);
        if (!m_store.add(&records, c->parentFolderId(), error))
            return nullptr;
        std::vector<std::shared_ptr<DirEntry>> entries;
        for (size_t i = 0; i < objects.size(); ++i) {
            // The command's objects belong to the dispatcher until the answer: they learn their identity.
            objects[i]->setId(records[i].id);
            objects[i]->setUuid(QUuid::fromString(records[i].uuid));
            objects[i]->setVersion(records[i].version);
            objects[i]->setIsStored(true);
            entries.push_back(ObjectCodec::toDirEntry(records[i]));
        }
        if (progress)
            progress(1.0);
        auto response = std::make_shared<AddObjectResponse>(command);
        response->setDirEntries(entries);
        return response;
    }

    if (auto c = std::dynamic_pointer_cast<UpdateObject>(command)) {
        const auto object = c->object();
        if (!object || object->id().isEmpty()) {
            ErrorInfo::fail(error, CorvidErrorCode::ObjectNotFound, tr("The object to update was never stored."));
            return nullptr;
        }
        StoreRecord record;
        if (!ObjectCodec::toRecord(*object, &record, error))
            return nullptr;
        if (progress)
            progress(0.1);
        if (!m_store.update(&record, error))
            return nullptr;
        object->setVersion(record.version);
        object->setIsStored(true);
        if (progress)
            progress(1.0);
        auto response = std::make_shared<UpdateObjectResponse>(command);
        response->setUpdatedObject(object);
        return response;
    }

    if (auto c = std::dynamic_pointer_cast<DeleteObject>(command)) {
        QStringList removed;
        if (c->ids().isEmpty()) {
            ErrorInfo::fail(error, CorvidErrorCode::ObjectNotFound, tr("No object id given."));
            return nullptr;
        }
        if (!m_store.remove(c->ids(), c->objectType(), c->recursive(), &removed, error))
            return nullptr;
        if (progress)
            progress(1.0);
        return std::make_shared<Response>(command);
    }

    if (auto c = std::dynamic_pointer_cast<CopyObject>(command)) {
        StoreRecord copied;
        if (!m_store.copy(c->id(), c->targetFolderId(), &copied, error))
            return nullptr;
        auto response = std::make_shared<CopyObjectResponse>(command);
        response->setDirEntry(ObjectCodec::toDirEntry(copied));
        return response;
    }

    if (auto c = std::dynamic_pointer_cast<MoveObject>(command)) {
        StoreRecord moved;
        if (!m_store.move(c->id(), c->targetFolderId(), &moved, error))
            return nullptr;
        auto response = std::make_shared<MoveObjectResponse>(command);
        response->setDirEntry(ObjectCodec::toDirEntry(moved));
        return response;
    }

    if (auto c = std::dynamic_pointer_cast<GetAppearanceImage>(command)) {
        // The embedded store keeps no rendered texture images.
        ErrorInfo::fail(error, CorvidErrorCode::ImageNotAvailable,
                        tr("No texture image is available for \"%1\".").arg(c->textureValuesId()));
        return nullptr;
    }

    if (std::dynamic_pointer_cast<GetDatabases>(command)) {
        auto response = std::make_shared<GetDatabasesResponse>(command);
        response->setDatabases({QFileInfo(m_store.location()).completeBaseName()});
        return response;
    }

    if (std::dynamic_pointer_cast<ServerInfo>(command)) {
        auto response = std::make_shared<ServerInfoResponse>(command);
        response->setServerName(m_store.location());
        return response;
    }

    ErrorInfo::fail(error, CorvidErrorCode::NotSupported,
                    tr("The command %1 is not supported by this server.").arg(command->typeName()));
    return nullptr;
}

} // namespace vexa
