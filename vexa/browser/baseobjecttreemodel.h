#pragma once

#include <vexa/vexa_export.h>

#include <QAbstractItemModel>
#include <QIcon>
#include <QList>
#include <QString>
#include <QVariant>
#include <QVector>

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace vexa {

class BaseObject;
class ErrorInfo;
class GlobalDirEntry;

// A single-column tree (plus button columns) whose nodes carry a stored object, the
// node's "cargo". Nodes can be edited, dragged and dropped and carry a modified mark,
// shown as " *" after the name. Derived trees create the nodes (newRootNode) and load
// and store the objects through a PersistanceInferface.
//
// Every index stands for a node; an invalid index stands for the root node, which is
// never an index itself.
class VEXA_EXPORT BaseObjectTreeModel : public QAbstractItemModel
{
    Q_OBJECT
public:
    // One node of the tree. Not a QObject; owned by its parent branch.
    class VEXA_EXPORT Node
    {
    public:
        explicit Node(Node *parent);
        Node(Node *parent, std::shared_ptr<BaseObject> item);
        Node(const Node &other);
        Node &operator=(const Node &) = delete;
        virtual ~Node();

        virtual bool hasChildren() = 0;
        virtual int childrenCount() = 0;
        virtual Node *childNode(int row) = 0;
        // Depth first, in child order: the first node whose object id equals id.
        virtual Node *childNodeWithID(const std::string &id) = 0;
        // Takes the child out; the caller owns it.
        virtual Node *takeChild(int row) = 0;
        virtual int rowOf(Node *child) = 0;
        virtual Qt::ItemFlags flags();
        // The cargo's header name; empty without cargo.
        virtual QString name();
        // The cargo's creation time as text; empty without cargo.
        virtual QString timestamp();
        virtual QString id();
        virtual void insertEmptyNodes(int row, int count) = 0;
        virtual std::string objectId();
        // The cargo's type name; empty without cargo.
        virtual std::string objectType();
        virtual QIcon icon();
        virtual std::shared_ptr<BaseObject> cargo();
        // Stores the item; with notifyParent the parent hears of it.
        virtual void setItem(const std::shared_ptr<BaseObject> &item, bool notifyParent);
        virtual void itemWasSetForChildNode(Node *child);
        virtual bool isDeleteable() const;

        Node *parent() const { return m_parent; }
        void setParent(Node *parent) { m_parent = parent; }
        bool isModified() const { return m_isModified; }
        void setIsModified(bool modified) { m_isModified = modified; }
        std::shared_ptr<BaseObject> item() const { return m_item; }

    private:
        bool m_isModified = false;
        Node *m_parent;                    // Not owned; null for the root.
        std::shared_ptr<BaseObject> m_item; // May be null (an empty node).
    };

    // Loads and stores the objects of a tree's nodes. Requests in flight keep their
    // callbacks and contexts in keyed tables until their answer arrives.
    class VEXA_EXPORT PersistanceInferface
    {
    public:
        // What a caller hands along with a load and gets back with its answer.
        class VEXA_EXPORT PersistanceManagerContext
        {
        public:
            PersistanceManagerContext() = default;
            explicit PersistanceManagerContext(const QVariant &userData);
            virtual ~PersistanceManagerContext();
            QVariant userData() const { return m_userData; }
            void setUserData(const QVariant &userData) { m_userData = userData; }

        private:
            QVariant m_userData;
        };

        using LoadedCallBack = std::function<void(std::shared_ptr<BaseObject>)>;
        using FailedCallBack = std::function<void(std::shared_ptr<ErrorInfo>)>;

        virtual ~PersistanceInferface();

        // key: the dispatcher id of the store (empty: the default store).
        virtual void loadDirEntry(const std::string &key, std::string id,
                                  std::function<void(std::shared_ptr<BaseObject>)> onLoaded,
                                  std::function<void(std::shared_ptr<ErrorInfo>)> onFailed);
        virtual void loadAllObjects(const std::string &key, std::shared_ptr<GlobalDirEntry> folder) = 0;
        virtual void deleteObjectFromStorage(const std::string &key, std::shared_ptr<BaseObject> object) = 0;
        virtual void deleteObjectsFromStorage(const std::string &key,
                                              const std::vector<std::shared_ptr<BaseObject>> &objects) = 0;
        virtual void storeObject(std::shared_ptr<BaseObject> object, std::shared_ptr<GlobalDirEntry> folder,
                                 std::function<void(std::shared_ptr<GlobalDirEntry>)> onStored) = 0;
        virtual void updateObject(const std::string &key, std::shared_ptr<BaseObject> object,
                                  std::function<void(std::shared_ptr<BaseObject>)> onUpdated) = 0;
        // objectId, objectType.
        virtual void loadObject(const std::string &key, std::string objectId, std::string objectType,
                                std::shared_ptr<PersistanceManagerContext> context,
                                std::function<void(std::shared_ptr<BaseObject>)> onLoaded) = 0;
        // dispatcher id, objectId, objectType: the stored object copied into folder.
        virtual void duplicateObject(std::string key, std::string objectId, std::string objectType,
                                     std::shared_ptr<GlobalDirEntry> folder) = 0;

    protected:
        void insertLoadObjectCallBack(const std::string &key, LoadedCallBack callBack);
        void insertLoadObjectFailedCallBack(const std::string &key, FailedCallBack callBack);
        void insertPersistanceManagerContext(const std::string &key,
                                             std::shared_ptr<PersistanceManagerContext> context);
        // Each removes the entry under key and returns it; empty or null when there is none.
        LoadedCallBack takeLoadObjectCallBack(const std::string &key);
        FailedCallBack takeLoadObjectFailedCallBack(const std::string &key);
        std::shared_ptr<PersistanceManagerContext> takePersistanceManagerContext(const std::string &key);
        // The number of requests that still wait for a load answer.
        size_t pendingLoadCount() const { return m_loadCallBacks.size(); }

    private:
        std::map<std::string, LoadedCallBack> m_loadCallBacks;
        std::map<std::string, FailedCallBack> m_loadFailedCallBacks;
        std::map<std::string, std::shared_ptr<PersistanceManagerContext>> m_contexts;
    };

    explicit BaseObjectTreeModel(QObject *parent = nullptr);
    ~BaseObjectTreeModel() override;

    // The root for an invalid index.
    Node *nodeFromIndex(const QModelIndex &index) const;
    std::shared_ptr<Node> rootNode() const { return m_rootNode; }
    // A fresh root (the old tree is released), then a sort.
    void clear();
    Node *nodeWithID(const QString &id) const;
    Node *nodeWithParentAndID(Node *parent, const QString &id) const;
    // Adds a button column after the existing ones.
    void addButton();
    std::shared_ptr<PersistanceInferface> persistanceInferface() const { return m_persistanceInferface; }
    void setPersistanceInferface(const std::shared_ptr<PersistanceInferface> &persistanceInferface);

    // Row announcements by node.
    void beginInsertRows(Node *parent, int first, int last);
    void endInsertRows();
    void beginRemoveRows(Node *parent, int first, int last);
    void endRemoveRows();

    virtual void initialize();
    virtual std::shared_ptr<Node> newRootNode() = 0;
    virtual QModelIndex index(Node *node) const;

    QModelIndex index(int row, int column, const QModelIndex &parent = QModelIndex()) const override;
    QModelIndex parent(const QModelIndex &index) const override;
    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    bool hasChildren(const QModelIndex &parent = QModelIndex()) const override;
    bool canFetchMore(const QModelIndex &parent) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    QMap<int, QVariant> itemData(const QModelIndex &index) const override;
    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;
    bool insertRows(int row, int count, const QModelIndex &parent = QModelIndex()) override;
    bool removeRows(int row, int count, const QModelIndex &parent = QModelIndex()) override;
    bool moveRows(const QModelIndex &sourceParent, int sourceRow, int count, const QModelIndex &destinationParent,
                  int destinationChild) override;
    Qt::DropActions supportedDropActions() const override;
    bool dropMimeData(const QMimeData *data, Qt::DropAction action, int row, int column,
                      const QModelIndex &parent) override;

    // The role under which itemData carries the address of an index's node.
    static constexpr int NodeAddressRole = Qt::UserRole + 5;

Q_SIGNALS:
    void sgDataHasChanged(vexa::BaseObjectTreeModel::Node *parentNode, vexa::BaseObjectTreeModel::Node *node);
    void sgRowsChanged(vexa::BaseObjectTreeModel::Node *node);

protected:
    using QAbstractItemModel::beginInsertRows;
    using QAbstractItemModel::beginRemoveRows;

    virtual void dataHasChanged(Node *parentNode, Node *node);
    virtual QVariant editRole(Node *node) const;
    virtual QVariant displayRole(Node *node) const;
    virtual QVariant decorationRole(Node *node) const;
    virtual QVariant fontRole(Node *node) const;
    virtual QVariant toolTipRole(Node *node) const;
    virtual QVariant userRole(Node *node) const;

protected Q_SLOTS:
    void dataHasChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight, const QVector<int> &roles);
    void onRowsChanged(const QModelIndex &parent, int first, int last);

private:
    std::shared_ptr<PersistanceInferface> m_persistanceInferface;
    std::shared_ptr<Node> m_rootNode;
    int m_buttonColumns = 0;
};

// The branch node of the derived trees: owns its children and carries the drag, drop
// and delete permissions of its row.
class VEXA_EXPORT GeneralBranchNode : public BaseObjectTreeModel::Node
{
public:
    GeneralBranchNode(Node *parent, std::shared_ptr<BaseObject> item);
    // Takes the flags, the modified mark, the parent, the cargo and the child pointers as
    // they are (the children then have two owners: the caller sorts that out).
    GeneralBranchNode(const GeneralBranchNode &other);
    ~GeneralBranchNode() override;

    bool hasChildren() override;
    int childrenCount() override;
    Node *childNode(int row) override;
    Node *childNodeWithID(const std::string &id) override;
    Node *takeChild(int row) override;
    int rowOf(Node *child) override;
    Qt::ItemFlags flags() override;
    void insertEmptyNodes(int row, int count) override;
    bool isDeleteable() const override;

    QList<Node *> childNodes() const { return m_children; }
    // Deletes the current children, then takes the given ones in order.
    void setChildren(const std::vector<Node *> &nodes);
    // Inserts without any model announcement (building a subtree before showing it).
    void insertIntoCache(Node *node, int row);
    void setIsDeleteable(bool deleteable) { m_isDeleteable = deleteable; }
    void setIsDragEnabled(bool enabled) { m_isDragEnabled = enabled; }
    void setIsDropEnabled(bool enabled) { m_isDropEnabled = enabled; }
    bool isDragEnabled() const { return m_isDragEnabled; }
    bool isDropEnabled() const { return m_isDropEnabled; }

private:
    bool m_isDragEnabled = false;
    bool m_isDropEnabled = false;
    bool m_isDeleteable = false;
    QList<Node *> m_children; // Owned.
};

} // namespace vexa

Q_DECLARE_METATYPE(vexa::BaseObjectTreeModel::Node *)
