#pragma once

#include <vexa/browser/browsermetatypes.h>
#include <vexa/browser/objectbrowsertreeitem.h>
#include <vexa/vexa_export.h>

#include <context/corvidmodel.h>

#include <QAbstractItemModel>
#include <QPointer>
#include <QString>

#include <map>
#include <set>
#include <memory>
#include <string>
#include <vector>

class QWidget;

namespace vexa {

class BaseObject;
class CommandDispatcher;
class CorvidModel;
class DirEntry;
class ErrorInfo;
class FullObjectLoader;
class GlobalDirEntry;
class Progress;
class ProgressListener;
class Response;
class SelectedPath;

// The item model of the object browser: a lazily loaded tree of the folders and
// objects of one object store (the default dispatcher id), reached through the host's
// CorvidModel. A folder lists its entries when it is first expanded (fetchMore). New
// folders, renames, deletes, moves and copies are sent to the store as commands; the
// tree changes when the store answers, so a refused request changes nothing.
//
// Drops: within the store entries are moved or copied; from another store they can only
// be copied, with every object they refer to (the user is asked first when there are
// such objects).
//
// Operations that reach the store throw std::logic_error without a CorvidModel ("No
// Corvid model set") or when the store does not connect within about 1.1 s ("No
// connection to server available! ..."); the item-model overrides called by views
// (fetchMore, setData, dropMimeData, moveRows) report those on sgGeneralError instead.
class VEXA_EXPORT CorvidObjectsClientModel : public QAbstractItemModel
{
    Q_OBJECT
public:
    // Column identifiers for setColumns().
    enum Column {
        NameColumn = 0,
        TypeColumn = 1,
        CreatedColumn = 2,
        VersionColumn = 3,
    };

    enum Role {
        // The row's entry as std::shared_ptr<vexa::GlobalDirEntry> (store and path included).
        GlobalDirEntryRole = Qt::UserRole,
        ObjectTypeRole = Qt::UserRole + 1,
        ObjectIdRole = Qt::UserRole + 2,
        IsFolderRole = Qt::UserRole + 3,
    };

    // One dragged row as a drop reads it: its position among the dragged cells and its entry.
    class VEXA_EXPORT CargoItem
    {
    public:
        CargoItem() = default;
        CargoItem(int row, int column, std::shared_ptr<GlobalDirEntry> entry);
        int row() const { return m_row; }
        int column() const { return m_column; }
        std::shared_ptr<GlobalDirEntry> entry() const { return m_entry; }
        bool isFolder() const;

    private:
        int m_row = -1;
        int m_column = -1;
        std::shared_ptr<GlobalDirEntry> m_entry;
    };

    // One copy from another store in flight.
    class VEXA_EXPORT CopyContext
    {
    public:
        // The target folder's object id (the item is looked up again when the objects arrive).
        std::string targetFolderId;
        std::vector<std::shared_ptr<DirEntry>> entries;
        std::vector<CargoItem> cargo;
        std::shared_ptr<ProgressListener> progress;
        std::string progressTaskId;
    };

    // The longest name a rename accepts.
    static constexpr int MaximumNameLength = 255;

    explicit CorvidObjectsClientModel(CorvidModel *corvidModel, const std::string &defaultDispatcherId = std::string(),
                                      QObject *parent = nullptr);
    ~CorvidObjectsClientModel() override;

    CorvidModel *corvidModel() const { return m_corvidModel; }
    void setCorvidModel(CorvidModel *corvidModel);
    // The store this model browses; the CorvidModel's default one when empty.
    std::string defaultDispatcherId() const;
    void setDefaultDispatcherId(const std::string &dispatcherId);

    // Sub-folders list only these types (folders included only when named); the top
    // level always lists folders only. Applies to folders loaded from now on.
    std::vector<std::string> typeFilter() const { return m_typeFilter; }
    void setTypeFilter(const std::vector<std::string> &types);
    // The columns, by Column identifier; one column (the name) when empty.
    std::vector<int> columns() const { return m_columns; }
    void setColumns(const std::vector<int> &columns);
    int columnIdentifier(int column) const;

    ObjectBrowserFolder *rootFolder() { return &m_rootFolder; }
    ObjectBrowserTreeItem *item(const QModelIndex &index) const;
    QModelIndex index(const ObjectBrowserTreeItem *item, int column = 0) const;
    // The folder an index stands for: its own item when a folder, else its parent; the
    // root for an invalid index. std::runtime_error "Cannot find parent folder" otherwise.
    ObjectBrowserFolder *parentFolder(const QModelIndex &index) const;
    // The row's entry with its store and path; null for an invalid index.
    std::shared_ptr<GlobalDirEntry> globalDirEntry(const QModelIndex &index) const;
    std::shared_ptr<SelectedPath> selectedPath(const QModelIndex &index) const;
    // The row of the item with that object id, searched in the loaded tree.
    QModelIndex indexOfObject(const QString &objectId) const;
    // Lists a folder's entries (the root for an empty id); nothing without a CorvidModel.
    void loadFolder(const std::string &folderId);
    // True while a folder's entries are on the way.
    bool isLoading(const QModelIndex &folder) const;
    // Forgets a folder's rows and lists them again.
    void reload(const QModelIndex &folder);

    // Adds a folder named "Untitled folder" below the folder of the index.
    void createFolder(const QModelIndex &parent);
    // Renames a row's object (the same as editing its name).
    bool renameObject(const QModelIndex &index, const QString &name);
    // Deletes the objects of the rows (a folder only when it is empty). Returns the
    // command id; sgObjectDeleted / sgObjectDeletionError answer under it.
    std::string deleteObjects(const QModelIndexList &indexes, QWidget *sourceWidget = nullptr);

    // Display name of an object type ("Tolerance set" for ToleranceSet ...).
    static QString typeDisplayName(const QString &typeId);

    QModelIndex index(int row, int column, const QModelIndex &parent = QModelIndex()) const override;
    QModelIndex parent(const QModelIndex &index) const override;
    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    bool hasChildren(const QModelIndex &parent = QModelIndex()) const override;
    bool canFetchMore(const QModelIndex &parent) const override;
    void fetchMore(const QModelIndex &parent) override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    QMap<int, QVariant> itemData(const QModelIndex &index) const override;
    QMimeData *mimeData(const QModelIndexList &indexes) const override;
    Qt::DropActions supportedDropActions() const override;
    Qt::DropActions supportedDragActions() const override;
    bool insertRows(int row, int count, const QModelIndex &parent = QModelIndex()) override;
    bool removeRows(int row, int count, const QModelIndex &parent = QModelIndex()) override;
    bool moveRows(const QModelIndex &sourceParent, int sourceRow, int count, const QModelIndex &destinationParent,
                  int destinationChild) override;
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;
    bool dropMimeData(const QMimeData *data, Qt::DropAction action, int row, int column,
                      const QModelIndex &parent) override;

    // The dragged rows of item-model drag data (each entry once, in drag order).
    static std::vector<CargoItem> cargoFromMimeData(const QMimeData *data);

Q_SIGNALS:
    void sgObjectDeleted(QWidget *sourceWidget, std::string commandId, std::string deletedId);
    void sgObjectDeletionError(QWidget *sourceWidget, std::string commandId,
                               std::shared_ptr<vexa::ErrorInfo> errorInfo);
    void sgNewFolderCreated(std::shared_ptr<vexa::SelectedPath> newFolderPath);
    void sgGeneralError(QString errorMessage);
    // A folder's entries arrived (after its rows were inserted).
    void sgFolderLoaded(const QModelIndex &folder);

public Q_SLOTS:
    void onFolderUpdated(std::shared_ptr<vexa::Response> response);
    void onFolderCreated(std::shared_ptr<vexa::Response> response);
    void onError(std::shared_ptr<vexa::ErrorInfo> error);
    void onProgress(std::shared_ptr<vexa::Progress> progress);
    void objectDeleted(std::shared_ptr<vexa::Response> response);
    void onDeletionError(std::shared_ptr<vexa::ErrorInfo> error);
    void onItemDataUpdated(std::shared_ptr<vexa::Response> response);
    void onRemoteObjectsLoaded(size_t collectId, std::vector<std::shared_ptr<vexa::BaseObject>> objects);
    void onRemoteObjectsLoadError(size_t collectId, std::shared_ptr<vexa::ErrorInfo> error);

protected:
    // The dispatcher of a request, connected (see the class comment).
    CommandDispatcher &dispatcher(const std::string &dispatcherId = std::string()) const;
    void dirEntriesLoaded(std::shared_ptr<Response> response);

private:
    void reportCommandError(const QString &command, const std::shared_ptr<ErrorInfo> &error);
    void insertEntries(ObjectBrowserFolder *folder, const std::vector<std::shared_ptr<DirEntry>> &entries);
    ObjectBrowserTreeItem *newItem(ObjectBrowserFolder *folder, const std::shared_ptr<DirEntry> &entry) const;
    void sendMove(const QString &objectId, const QString &targetFolderId);
    void sendCopy(const QString &objectId, const QString &targetFolderId);
    void onObjectMoved(std::shared_ptr<Response> response);
    void onObjectCopied(std::shared_ptr<Response> response);
    void startRemoteCopy(const std::vector<CargoItem> &cargo, ObjectBrowserFolder *target);
    void onRemoteObjectsAdded(const std::string &collectKey, std::shared_ptr<Response> response);
    void endTask(const std::string &taskId);
    bool checkName(const QString &name);
    QString columnTitle(int identifier) const;

    QPointer<CorvidModel> m_corvidModel;
    std::string m_defaultDispatcherId;
    ObjectBrowserFolder m_rootFolder;
    std::vector<std::string> m_typeFilter;
    std::vector<int> m_columns;
    std::map<size_t, std::shared_ptr<CopyContext>> m_copies;
    std::map<std::string, QPointer<QWidget>> m_deleteSources;
    std::string m_errorCommandId;
    std::set<std::string> m_loading; // Folder ids being listed.
    std::set<std::string> m_replace; // Folder ids whose rows the next listing replaces. // The delete whose error is being reported.
    FullObjectLoader *m_loader; // Child.
};

} // namespace vexa
