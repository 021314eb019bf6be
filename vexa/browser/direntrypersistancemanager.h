#pragma once

#include <vexa/browser/baseobjecttreemodel.h>
#include <vexa/browser/browsermetatypes.h>
#include <vexa/vexa_export.h>

#include <context/corvidmodel.h>

#include <QObject>
#include <QPointer>
#include <QString>

#include <functional>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <vector>

namespace vexa {

class Command;
class CommandDispatcher;
class CorvidModel;
class GlobalDirEntry;
class Progress;
class Response;

// Loads, stores, updates, duplicates and deletes the objects of the folder tree of
// edited objects through commands on the host's dispatchers (the key of each request
// is the dispatcher id of the store). Long requests report into the host's progress
// model ("Loading", "Saving", "Deleting"); every failure ends in one line of text on
// sgErrorOccurred (and, for the two save paths, sgSaveErrorOccurred).
//
// Reaching a store throws like CorvidObjectsClientModel ("No Corvid model set", "No
// connection to server available! ...").
class VEXA_EXPORT DirEntryPersistanceManager : public QObject, public BaseObjectTreeModel::PersistanceInferface
{
    Q_OBJECT
public:
    explicit DirEntryPersistanceManager(CorvidModel &corvidModel, QObject *parent = nullptr);
    ~DirEntryPersistanceManager() override;

    // Loads the object of a directory entry: onLoaded gets it, onFailed an error (code
    // 2002 when the answer holds nothing).
    void loadDirEntry(const std::string &key, std::string id, std::function<void(std::shared_ptr<BaseObject>)> onLoaded,
                      std::function<void(std::shared_ptr<ErrorInfo>)> onFailed) override;
    // Lists a folder's entries: sgObjectsLoaded.
    void loadAllObjects(const std::string &key, std::shared_ptr<GlobalDirEntry> folder) override;
    void deleteObjectFromStorage(const std::string &key, std::shared_ptr<BaseObject> object) override;
    void deleteObjectsFromStorage(const std::string &key,
                                  const std::vector<std::shared_ptr<BaseObject>> &objects) override;
    // Adds a new object to folder (on the folder's store); onStored gets its entry.
    void storeObject(std::shared_ptr<BaseObject> object, std::shared_ptr<GlobalDirEntry> folder,
                     std::function<void(std::shared_ptr<GlobalDirEntry>)> onStored) override;
    // Writes a stored object back; its version must be the stored one.
    void updateObject(const std::string &key, std::shared_ptr<BaseObject> object,
                      std::function<void(std::shared_ptr<BaseObject>)> onUpdated) override;
    void loadObject(const std::string &key, std::string objectId, std::string objectType,
                    std::shared_ptr<PersistanceManagerContext> context,
                    std::function<void(std::shared_ptr<BaseObject>)> onLoaded) override;
    // Loads the stored object and stores a copy named "<name>( - Copy)" in folder:
    // sgObjectDuplicated.
    void duplicateObject(std::string key, std::string objectId, std::string objectType,
                         std::shared_ptr<GlobalDirEntry> folder) override;

    bool isObjectLoading(const std::string &id) const;
    CorvidModel *corvidModel() const { return m_corvidModel; }
    // The id of the command the last request sent (empty when it sent none).
    std::string lastCommandId() const { return m_lastCommandId; }
    // The number of stores and updates without answer.
    int pendingSaveCount() const { return int(m_saves.size()); }

    // The name a copy gets: the original's name followed by "( - Copy)".
    static QString copyName(const QString &name);

Q_SIGNALS:
    void sgErrorOccurred(QString message);
    void sgSaveErrorOccurred(QString message);
    void sgObjectsLoaded(const std::vector<std::shared_ptr<vexa::GlobalDirEntry>> &entries);
    void sgObjectsDeleted(QStringList objectIds);
    void sgObjectDuplicated(std::shared_ptr<vexa::GlobalDirEntry> entry, std::shared_ptr<vexa::BaseObject> object);
    // A request has its answer (succeeded) or failed; commandId as lastCommandId() gave it.
    void sgRequestFinished(std::string commandId, bool succeeded);

protected:
    CommandDispatcher &commandDispatcher(const std::string &dispatcherId);
    void setObjectLoading(const std::string &id);
    void setObjectLoaded(const std::string &id);

protected Q_SLOTS:
    void onDirEntryLoaded(std::shared_ptr<vexa::Response> response);
    void onDirEntryLoadError(std::shared_ptr<vexa::ErrorInfo> error);
    void onObjectLoaded(std::shared_ptr<vexa::Response> response);
    void onObjectLoadError(std::shared_ptr<vexa::ErrorInfo> error);
    void onObjectLoadedForDuplication(std::shared_ptr<vexa::Response> response);
    void onObjectsLoaded(std::shared_ptr<vexa::Response> response);
    void onObjectStored(std::shared_ptr<vexa::Response> response);
    void onObjectStoreProgress(std::shared_ptr<vexa::Progress> progress);
    void onObjectAddError(std::shared_ptr<vexa::ErrorInfo> error);
    void onObjectUpdated(std::shared_ptr<vexa::Response> response);
    void onObjectUpdateProgress(std::shared_ptr<vexa::Progress> progress);
    void onObjectUpdatedError(std::shared_ptr<vexa::ErrorInfo> error);
    void onObjectDeleted(std::shared_ptr<vexa::Response> response);
    void onObjectDeletedError(std::shared_ptr<vexa::ErrorInfo> error);

private:
    struct Save
    {
        std::shared_ptr<GlobalDirEntry> folder;
        std::function<void(std::shared_ptr<GlobalDirEntry>)> onStored;
        std::function<void(std::shared_ptr<BaseObject>)> onUpdated;
    };

    Save takeSave(const std::string &commandId);
    // The command whose answer is being handled (the sending QtCommand's), else null.
    std::shared_ptr<Command> answeredCommand() const;
    std::string answeredCommandId() const;
    // Sends a command on the store of key and connects its answers to the handlers.
    template<class OnResponse, class OnError, class OnProgress = std::nullptr_t>
    void send(const std::string &key, const std::shared_ptr<Command> &command, OnResponse onResponse, OnError onError,
              OnProgress onProgress = nullptr);
    void setTaskValue(const std::shared_ptr<Progress> &progress);
    void endTask(const std::string &taskId);
    static QString errorText(const QString &operation, const std::shared_ptr<ErrorInfo> &error);
    void storeDuplicate(std::shared_ptr<BaseObject> copy, std::shared_ptr<GlobalDirEntry> folder);

    QPointer<CorvidModel> m_corvidModel;
    std::set<std::string> m_loading;
    std::map<std::string, Save> m_saves;                                    // by command id
    std::map<std::string, std::shared_ptr<GlobalDirEntry>> m_duplications; // by command id
    std::map<std::string, std::shared_ptr<GlobalDirEntry>> m_listings;     // by command id
    std::string m_lastCommandId;
};

} // namespace vexa
