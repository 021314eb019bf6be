#include "direntrypersistancemanager.h"

#include "direntrypaths_p.h"
#include "dispatcherconnection_p.h"

#include <context/addobject.h>
#include <context/addobjectresponse.h>
#include <context/commanddispatcher.h>
#include <context/corvidmodel.h>
#include <context/deleteobject.h>
#include <context/getcorvidobject.h>
#include <context/getcorvidobjectresponse.h>
#include <context/getdirentries.h>
#include <context/getdirentriesresponse.h>
#include <context/progress.h>
#include <context/progressmodel.h>
#include <context/qtcommand.h>
#include <context/updateobject.h>
#include <context/updateobjectresponse.h>
#include <domain/baseobject.h>
#include <domain/direntry.h>
#include <domain/globaldirentry.h>
#include <store/errorinfo.h>
#include <utilities/logger.h>

#include <QCoreApplication>

#include <type_traits>

namespace vexa {

DirEntryPersistanceManager::DirEntryPersistanceManager(CorvidModel &corvidModel, QObject *parent)
    : QObject(parent)
    , m_corvidModel(&corvidModel)
{
    qRegisterMetaType<std::string>("std::string");
}

DirEntryPersistanceManager::~DirEntryPersistanceManager() = default;

QString DirEntryPersistanceManager::copyName(const QString &name)
{
    return name + tr("( - Copy)");
}

CommandDispatcher &DirEntryPersistanceManager::commandDispatcher(const std::string &dispatcherId)
{
    return connectedDispatcher(m_corvidModel, dispatcherId,
                               m_corvidModel ? m_corvidModel->defaultDispatcherId() : std::string());
}

void DirEntryPersistanceManager::setObjectLoading(const std::string &id)
{
    m_loading.insert(id);
}

void DirEntryPersistanceManager::setObjectLoaded(const std::string &id)
{
    m_loading.erase(id);
}

bool DirEntryPersistanceManager::isObjectLoading(const std::string &id) const
{
    return m_loading.count(id) > 0;
}

std::shared_ptr<Command> DirEntryPersistanceManager::answeredCommand() const
{
    const auto *command = qobject_cast<const QtCommand *>(sender());
    return command ? command->command() : nullptr;
}

std::string DirEntryPersistanceManager::answeredCommandId() const
{
    const auto command = answeredCommand();
    return command ? command->commandId() : std::string();
}

template<class OnResponse, class OnError, class OnProgress>
void DirEntryPersistanceManager::send(const std::string &key, const std::shared_ptr<Command> &command,
                                      OnResponse onResponse, OnError onError, OnProgress onProgress)
{
    m_lastCommandId.clear();
    CommandDispatcher &dispatcher = commandDispatcher(key);
    if (command->commandId().empty())
        command->generateId();
    QtCommand *sent = dispatcher.execute(command);
    connect(sent, &QtCommand::responseReceived, this, onResponse);
    connect(sent, &QtCommand::errorReceived, this, onError);
    if constexpr (!std::is_same_v<OnProgress, std::nullptr_t>)
        connect(sent, &QtCommand::progressReceived, this, onProgress);
    m_lastCommandId = command->commandId();
}

QString DirEntryPersistanceManager::errorText(const QString &operation, const std::shared_ptr<ErrorInfo> &error)
{
    const QString message = error ? error->message() : QString();
    const int code = error ? int(error->errorCode()) : 0;
    return tr("Error occured during %1: %2 (%3)").arg(operation, message).arg(code);
}

void DirEntryPersistanceManager::setTaskValue(const std::shared_ptr<Progress> &progress)
{
    if (!progress || !m_corvidModel)
        return;
    m_corvidModel->progressModel()->setProgress(progress->commandId(), progress->progress() * 0.85 + 0.05);
}

void DirEntryPersistanceManager::endTask(const std::string &taskId)
{
    if (m_corvidModel && !taskId.empty())
        m_corvidModel->progressModel()->endProgress(taskId);
}

// ---- directory entries -------------------------------------------------------------------

void DirEntryPersistanceManager::loadDirEntry(const std::string &key, std::string id,
                                              std::function<void(std::shared_ptr<BaseObject>)> onLoaded,
                                              std::function<void(std::shared_ptr<ErrorInfo>)> onFailed)
{
    auto command = std::make_shared<GetCorvidObject>();
    command->setId(QString::fromStdString(id));
    const std::string commandId = command->generateId();
    insertLoadObjectCallBack(commandId, std::move(onLoaded));
    insertLoadObjectFailedCallBack(commandId, std::move(onFailed));
    try {
        send(key, command, &DirEntryPersistanceManager::onDirEntryLoaded,
             &DirEntryPersistanceManager::onDirEntryLoadError);
    } catch (...) {
        takeLoadObjectCallBack(commandId);
        takeLoadObjectFailedCallBack(commandId);
        throw;
    }
}

void DirEntryPersistanceManager::onDirEntryLoaded(std::shared_ptr<Response> response)
{
    const std::string commandId = response ? response->commandId() : std::string();
    const auto onLoaded = takeLoadObjectCallBack(commandId);
    const auto onFailed = takeLoadObjectFailedCallBack(commandId);
    const auto loaded = std::dynamic_pointer_cast<GetCorvidObjectResponse>(response);
    const std::shared_ptr<BaseObject> object = loaded ? loaded->object() : nullptr;
    if (!object) {
        if (onFailed)
            onFailed(ErrorInfo::create(QString::fromStdString(commandId), 2002,
                                       QStringLiteral("DirEntry nulltpr retrieved")));
        return;
    }
    if (onLoaded)
        onLoaded(object);
}

void DirEntryPersistanceManager::onDirEntryLoadError(std::shared_ptr<ErrorInfo> error)
{
    const std::string commandId = answeredCommandId();
    takeLoadObjectCallBack(commandId);
    if (const auto onFailed = takeLoadObjectFailedCallBack(commandId))
        onFailed(error);
}

void DirEntryPersistanceManager::loadAllObjects(const std::string &key, std::shared_ptr<GlobalDirEntry> folder)
{
    auto command = std::make_shared<GetDirEntries>();
    command->setParentFolderId(folder ? folder->entryObjectId() : QString());
    send(key, command, &DirEntryPersistanceManager::onObjectsLoaded, &DirEntryPersistanceManager::onObjectLoadError);
    // Where the listed entries live.
    auto listed = std::make_shared<GlobalDirEntry>();
    if (folder)
        placeInside(*listed, *folder);
    listed->setDispatcherID(QString::fromStdString(key));
    listed->setStandardizedDispatcherID(QString::fromStdString(CommandDispatcher::standardizedDispatcherId(key)));
    m_listings[m_lastCommandId] = listed;
}

void DirEntryPersistanceManager::onObjectsLoaded(std::shared_ptr<Response> response)
{
    const std::string commandId = response ? response->commandId() : std::string();
    const auto it = m_listings.find(commandId);
    std::shared_ptr<GlobalDirEntry> folder;
    if (it != m_listings.end()) {
        folder = it->second;
        m_listings.erase(it);
    }
    std::vector<std::shared_ptr<GlobalDirEntry>> entries;
    if (const auto listing = std::dynamic_pointer_cast<GetDirEntriesResponse>(response)) {
        for (const auto &entry : listing->dirEntries()) {
            auto global = std::make_shared<GlobalDirEntry>(*entry);
            if (folder) {
                global->setDispatcherID(folder->dispatcherID());
                global->setStandardizedDispatcherID(folder->standardizedDispatcherID());
                global->setPath(folder->path());
                global->setStringPath(folder->stringPath());
            }
            entries.push_back(global);
        }
    }
    Q_EMIT sgObjectsLoaded(entries);
}

// ---- loading objects ---------------------------------------------------------------------

void DirEntryPersistanceManager::loadObject(const std::string &key, std::string objectId, std::string objectType,
                                            std::shared_ptr<PersistanceManagerContext> context,
                                            std::function<void(std::shared_ptr<BaseObject>)> onLoaded)
{
    setObjectLoading(objectId);
    auto command = std::make_shared<GetCorvidObject>();
    command->setType(QString::fromStdString(objectType));
    command->setId(QString::fromStdString(objectId));
    try {
        send(key, command, &DirEntryPersistanceManager::onObjectLoaded,
             &DirEntryPersistanceManager::onObjectLoadError);
    } catch (...) {
        setObjectLoaded(objectId);
        throw;
    }
    insertPersistanceManagerContext(m_lastCommandId, std::move(context));
    insertLoadObjectCallBack(m_lastCommandId, std::move(onLoaded));
    if (m_corvidModel)
        m_corvidModel->progressModel()->startProgress(tr("Loading"), 0.02, m_lastCommandId);
}

void DirEntryPersistanceManager::onObjectLoaded(std::shared_ptr<Response> response)
{
    const std::string commandId = response ? response->commandId() : std::string();
    endTask(commandId);
    takePersistanceManagerContext(commandId);
    const auto onLoaded = takeLoadObjectCallBack(commandId);
    const auto loaded = std::dynamic_pointer_cast<GetCorvidObjectResponse>(response);
    const std::shared_ptr<BaseObject> object = loaded ? loaded->object() : nullptr;
    const auto request = response ? std::dynamic_pointer_cast<GetCorvidObject>(response->command()) : nullptr;
    if (request)
        setObjectLoaded(request->id().toStdString());
    if (object)
        setObjectLoaded(object->id().toStdString());
    if (!object) {
        Q_EMIT sgErrorOccurred(tr("Error occured during loadObject: (nullptr loaded)"));
        Q_EMIT sgRequestFinished(commandId, false);
        return;
    }
    if (onLoaded)
        onLoaded(object);
    Q_EMIT sgRequestFinished(commandId, true);
}

void DirEntryPersistanceManager::onObjectLoadError(std::shared_ptr<ErrorInfo> error)
{
    const auto command = answeredCommand();
    const std::string commandId = command ? command->commandId() : std::string();
    endTask(commandId);
    takePersistanceManagerContext(commandId);
    takeLoadObjectCallBack(commandId);
    m_listings.erase(commandId);
    if (const auto request = std::dynamic_pointer_cast<GetCorvidObject>(command))
        setObjectLoaded(request->id().toStdString());
    Q_EMIT sgErrorOccurred(errorText(QStringLiteral("loadObject"), error));
    Q_EMIT sgRequestFinished(commandId, false);
}

// ---- storing -----------------------------------------------------------------------------

void DirEntryPersistanceManager::storeObject(std::shared_ptr<BaseObject> object, std::shared_ptr<GlobalDirEntry> folder,
                                             std::function<void(std::shared_ptr<GlobalDirEntry>)> onStored)
{
    auto command = std::make_shared<AddObject>();
    command->generateId();
    command->setObject(object);
    command->setParentFolderId(folder ? folder->entryObjectId() : QString());
    const std::string key = folder ? folder->dispatcherID().toStdString() : std::string();
    send(key, command, &DirEntryPersistanceManager::onObjectStored, &DirEntryPersistanceManager::onObjectAddError,
         &DirEntryPersistanceManager::onObjectStoreProgress);
    m_saves[m_lastCommandId] = Save{folder, std::move(onStored), nullptr};
    if (m_corvidModel)
        m_corvidModel->progressModel()->startProgress(tr("Saving"), 0.05, m_lastCommandId);
}

DirEntryPersistanceManager::Save DirEntryPersistanceManager::takeSave(const std::string &commandId)
{
    Save save;
    const auto it = m_saves.find(commandId);
    if (it != m_saves.end()) {
        save = it->second;
        m_saves.erase(it);
    }
    return save;
}

void DirEntryPersistanceManager::onObjectStoreProgress(std::shared_ptr<Progress> progress)
{
    setTaskValue(progress);
}

void DirEntryPersistanceManager::onObjectStored(std::shared_ptr<Response> response)
{
    const std::string commandId = response ? response->commandId() : std::string();
    endTask(commandId);
    const Save save = takeSave(commandId);
    const auto added = std::dynamic_pointer_cast<AddObjectResponse>(response);
    if (!added || added->dirEntries().empty()) {
        const QString text = tr("Error occured during AddObject: (nullptr loaded)");
        Q_EMIT sgErrorOccurred(text);
        Q_EMIT sgSaveErrorOccurred(text);
        Q_EMIT sgRequestFinished(commandId, false);
        return;
    }
    auto entry = std::make_shared<GlobalDirEntry>(*added->dirEntries().front());
    if (save.folder)
        placeInside(*entry, *save.folder);
    if (save.onStored)
        save.onStored(entry);
    Q_EMIT sgRequestFinished(commandId, true);
}

void DirEntryPersistanceManager::onObjectAddError(std::shared_ptr<ErrorInfo> error)
{
    const std::string commandId = answeredCommandId();
    endTask(commandId);
    m_saves.erase(commandId);
    m_duplications.erase(commandId);
    const QString text = errorText(QStringLiteral("AddObject"), error);
    Q_EMIT sgErrorOccurred(text);
    Q_EMIT sgSaveErrorOccurred(text);
    Q_EMIT sgRequestFinished(commandId, false);
}

void DirEntryPersistanceManager::updateObject(const std::string &key, std::shared_ptr<BaseObject> object,
                                              std::function<void(std::shared_ptr<BaseObject>)> onUpdated)
{
    auto command = std::make_shared<UpdateObject>();
    command->setObject(object);
    send(key, command, &DirEntryPersistanceManager::onObjectUpdated, &DirEntryPersistanceManager::onObjectUpdatedError,
         &DirEntryPersistanceManager::onObjectUpdateProgress);
    m_saves[m_lastCommandId] = Save{nullptr, nullptr, std::move(onUpdated)};
    if (m_corvidModel)
        m_corvidModel->progressModel()->startProgress(tr("Saving"), 0.05, m_lastCommandId);
}

void DirEntryPersistanceManager::onObjectUpdateProgress(std::shared_ptr<Progress> progress)
{
    setTaskValue(progress);
}

void DirEntryPersistanceManager::onObjectUpdated(std::shared_ptr<Response> response)
{
    const std::string commandId = response ? response->commandId() : std::string();
    endTask(commandId);
    const Save save = takeSave(commandId);
    const auto updated = std::dynamic_pointer_cast<UpdateObjectResponse>(response);
    std::shared_ptr<BaseObject> object = updated ? updated->updatedObject() : nullptr;
    if (!object) {
        if (const auto request = response ? std::dynamic_pointer_cast<UpdateObject>(response->command()) : nullptr)
            object = request->object();
    }
    if (save.onUpdated && object)
        save.onUpdated(object);
    Q_EMIT sgRequestFinished(commandId, object != nullptr);
}

void DirEntryPersistanceManager::onObjectUpdatedError(std::shared_ptr<ErrorInfo> error)
{
    const std::string commandId = answeredCommandId();
    endTask(commandId);
    m_saves.erase(commandId);
    const QString text = errorText(QStringLiteral("UpdateObject"), error);
    Q_EMIT sgErrorOccurred(text);
    Q_EMIT sgSaveErrorOccurred(text);
    Q_EMIT sgRequestFinished(commandId, false);
}

// ---- deleting ----------------------------------------------------------------------------

void DirEntryPersistanceManager::deleteObjectFromStorage(const std::string &key, std::shared_ptr<BaseObject> object)
{
    deleteObjectsFromStorage(key, {std::move(object)});
}

void DirEntryPersistanceManager::deleteObjectsFromStorage(const std::string &key,
                                                          const std::vector<std::shared_ptr<BaseObject>> &objects)
{
    QStringList ids;
    for (const auto &object : objects) {
        if (object && !object->id().isEmpty())
            ids << object->id();
    }
    if (ids.isEmpty())
        return;
    auto command = std::make_shared<DeleteObject>();
    command->setIds(ids);
    send(key, command, &DirEntryPersistanceManager::onObjectDeleted, &DirEntryPersistanceManager::onObjectDeletedError);
    if (m_corvidModel)
        m_corvidModel->progressModel()->startProgress(tr("Deleting"), 0.0, m_lastCommandId);
}

void DirEntryPersistanceManager::onObjectDeleted(std::shared_ptr<Response> response)
{
    const std::string commandId = response ? response->commandId() : std::string();
    endTask(commandId);
    if (const auto request = response ? std::dynamic_pointer_cast<DeleteObject>(response->command()) : nullptr)
        Q_EMIT sgObjectsDeleted(request->ids());
    Q_EMIT sgRequestFinished(commandId, true);
}

void DirEntryPersistanceManager::onObjectDeletedError(std::shared_ptr<ErrorInfo> error)
{
    const std::string commandId = answeredCommandId();
    endTask(commandId);
    Q_EMIT sgErrorOccurred(errorText(QStringLiteral("DeleteObject"), error));
    Q_EMIT sgRequestFinished(commandId, false);
}

// ---- duplicating -------------------------------------------------------------------------

void DirEntryPersistanceManager::duplicateObject(std::string key, std::string objectId, std::string objectType,
                                                 std::shared_ptr<GlobalDirEntry> folder)
{
    auto command = std::make_shared<GetCorvidObject>();
    command->setId(QString::fromStdString(objectId));
    command->setType(QString::fromStdString(objectType));
    send(key, command, &DirEntryPersistanceManager::onObjectLoadedForDuplication,
         &DirEntryPersistanceManager::onObjectLoadError);
    m_duplications[m_lastCommandId] = std::move(folder);
}

void DirEntryPersistanceManager::onObjectLoadedForDuplication(std::shared_ptr<Response> response)
{
    const std::string commandId = response ? response->commandId() : std::string();
    std::shared_ptr<GlobalDirEntry> folder;
    const auto it = m_duplications.find(commandId);
    if (it != m_duplications.end()) {
        folder = it->second;
        m_duplications.erase(it);
    }
    const auto loaded = std::dynamic_pointer_cast<GetCorvidObjectResponse>(response);
    const std::shared_ptr<BaseObject> object = loaded ? loaded->object() : nullptr;
    if (!object) {
        Q_EMIT sgErrorOccurred(tr("Error occured during onObjectLoadedForDuplication: (nullptr loaded)"));
        Q_EMIT sgRequestFinished(commandId, false);
        return;
    }
    std::shared_ptr<BaseObject> copy = object->deepCopy();
    copy->setId(QString());
    copy->setUuid(QUuid());
    copy->setVersion(0);
    copy->setIsStored(false);
    copy->header().setName(copyName(object->header().name()));
    Q_EMIT sgRequestFinished(commandId, true);
    try {
        storeDuplicate(copy, folder);
    } catch (const std::exception &e) {
        Q_EMIT sgErrorOccurred(QString::fromStdString(e.what()));
    }
}

void DirEntryPersistanceManager::storeDuplicate(std::shared_ptr<BaseObject> copy, std::shared_ptr<GlobalDirEntry> folder)
{
    storeObject(copy, folder,
                [this, copy](std::shared_ptr<GlobalDirEntry> entry) { Q_EMIT sgObjectDuplicated(entry, copy); });
}

} // namespace vexa
