#pragma once

#include <vexa/browser/baseobjecttreemodel.h>
#include <vexa/vexa_export.h>

#include <functional>
#include <memory>

namespace vexa {

class GlobalDirEntry;

// The folder tree of the objects a user opened from the object store for editing. Each
// top-level node carries the object's directory entry (store, folder path) and, once
// loaded, the object as its cargo. An object goes through: not loaded (entry only),
// loading, loaded, modified (" *"), saving, and saved or failed.
//
// The objects are loaded and stored through the PersistanceInferface the host sets
// (a DirEntryPersistanceManager).
class VEXA_EXPORT DirEntryTreeModel : public BaseObjectTreeModel
{
    Q_OBJECT
public:
    class VEXA_EXPORT DirEntryNode : public GeneralBranchNode
    {
    public:
        DirEntryNode(std::shared_ptr<GlobalDirEntry> entry, Node *parent);
        ~DirEntryNode() override;

        std::shared_ptr<GlobalDirEntry> globalDirEntry() const { return m_entry; }
        void setGlobalDirEntry(const std::shared_ptr<GlobalDirEntry> &entry) { m_entry = entry; }
        // The store of the node's object.
        std::string dispatcherId() const;
        // Loaded: the cargo's name; else the entry's.
        QString name() override;
        QString timestamp() override;
        // The entry's object id, or the loaded object's; empty (and a log line) without both.
        std::string objectId() override;
        std::string objectType() override;
        QIcon icon() override;
        Qt::ItemFlags flags() override;
        // Stored at least once (it has an entry in a store).
        bool isStored() const;
        bool isLoaded() const { return item() != nullptr; }
        bool isSaving() const { return m_isSaving; }
        void setIsSaving(bool saving) { m_isSaving = saving; }

    private:
        std::shared_ptr<GlobalDirEntry> m_entry;
        bool m_isSaving = false;
    };

    explicit DirEntryTreeModel(QObject *parent = nullptr);
    ~DirEntryTreeModel() override;

    std::shared_ptr<Node> newRootNode() override;
    virtual Node *newDirEntryNode(std::shared_ptr<GlobalDirEntry> entry, Node *parent);

    // Opens an entry: the node of that object when it is open already, else a new
    // top-level node whose object is loaded at once.
    DirEntryNode *openDirEntry(const std::shared_ptr<GlobalDirEntry> &entry);
    // Adds a new, unsaved object (modified until it is stored); folder is where it goes.
    DirEntryNode *addNewObject(const std::shared_ptr<BaseObject> &object, const std::shared_ptr<GlobalDirEntry> &folder);
    // Loads a node's object (again): its cargo is replaced and the modified mark cleared.
    void reloadNode(Node *node);
    // Removes top-level nodes from the tree (not from the store).
    void removeNodes(const QVector<Node *> &nodes);
    // The top-level nodes, in order.
    QVector<DirEntryNode *> dirEntryNodes() const;
    bool containsNode(const Node *node) const;
    // Marks a node modified (or not) and redraws it.
    void setNodeModified(Node *node, bool modified);

    void loadNamedObject(std::shared_ptr<GlobalDirEntry> entry,
                         std::shared_ptr<PersistanceInferface::PersistanceManagerContext> context,
                         std::function<void(std::shared_ptr<BaseObject>)> onLoaded);
    void redrawNode(Node *node);

    bool setData(const QModelIndex &index, const QVariant &value, int role = Qt::EditRole) override;

Q_SIGNALS:
    // A rename was refused; one line for the user.
    void sgErrorOccurred(QString message);
    // A node's object arrived.
    void sgNodeLoaded(vexa::BaseObjectTreeModel::Node *node);

protected:
    QVariant toolTipRole(Node *node) const override;
    QVariant fontRole(Node *node) const override;

private:
    void loadNode(DirEntryNode *node);
};

} // namespace vexa
