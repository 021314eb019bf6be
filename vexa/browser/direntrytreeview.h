#pragma once

#include <vexa/browser/direntrytreemodel.h>
#include <vexa/vexa_export.h>

#include <QTreeView>
#include <QVector>

#include <memory>

namespace vexa {

class GlobalDirEntry;

// The view of the folder tree of edited objects: single column, F2 renames, Delete
// (or Ctrl+W) asks to close the current object, double-click or Enter opens it.
class VEXA_EXPORT DirEntryTreeView : public QTreeView
{
    Q_OBJECT
public:
    using Node = BaseObjectTreeModel::Node;

    explicit DirEntryTreeView(QWidget *parent = nullptr);
    ~DirEntryTreeView() override;

    void setModel(QAbstractItemModel *model) override;
    DirEntryTreeModel *dirEntryTreeModel() const;

    Node *currentNode() const;
    QVector<Node *> selectedNodes() const;
    // Every node below the root, depth first.
    QVector<Node *> allNodes() const;
    void selectNode(Node *node);
    void selectAndEditNode(Node *node);
    void expandNode(Node *node);
    // Takes nodes out of the tree; with deleteFromStorage their objects are deleted
    // from their stores too.
    void removeNodes(const QVector<Node *> &nodes, bool deleteFromStorage);
    // Stores a copy of each selected loaded object in folder, named "<name>( - Copy)".
    void duplicateSelectedNodes(std::shared_ptr<GlobalDirEntry> folder);

Q_SIGNALS:
    void sgSelectionChanged(QVector<vexa::BaseObjectTreeModel::Node *> nodes);
    void sgCloseActivated(vexa::BaseObjectTreeModel::Node *node);
    void sgNodeActivated(vexa::BaseObjectTreeModel::Node *node);

protected:
    void keyPressEvent(QKeyEvent *event) override;

private:
    void onSelectionChanged();
};

} // namespace vexa
