#include "direntrytreeview.h"

#include "direntrypaths_p.h"
#include "direntrypersistancemanager.h"

#include <domain/baseobject.h>
#include <domain/globaldirentry.h>

#include <QHeaderView>
#include <QKeyEvent>
#include <QPointer>

#include <functional>

namespace vexa {

DirEntryTreeView::DirEntryTreeView(QWidget *parent)
    : QTreeView(parent)
{
    setHeaderHidden(true);
    setSelectionMode(QAbstractItemView::ExtendedSelection);
    setEditTriggers(QAbstractItemView::EditKeyPressed | QAbstractItemView::SelectedClicked);
    setUniformRowHeights(true);
    connect(this, &QAbstractItemView::activated, this, [this](const QModelIndex &index) {
        if (DirEntryTreeModel *m = dirEntryTreeModel())
            Q_EMIT sgNodeActivated(m->nodeFromIndex(index));
    });
}

DirEntryTreeView::~DirEntryTreeView() = default;

void DirEntryTreeView::setModel(QAbstractItemModel *model)
{
    QTreeView::setModel(model);
    if (selectionModel())
        connect(selectionModel(), &QItemSelectionModel::selectionChanged, this, &DirEntryTreeView::onSelectionChanged);
}

DirEntryTreeModel *DirEntryTreeView::dirEntryTreeModel() const
{
    return qobject_cast<DirEntryTreeModel *>(model());
}

DirEntryTreeView::Node *DirEntryTreeView::currentNode() const
{
    DirEntryTreeModel *m = dirEntryTreeModel();
    const QModelIndex index = currentIndex();
    return m && index.isValid() ? m->nodeFromIndex(index) : nullptr;
}

QVector<DirEntryTreeView::Node *> DirEntryTreeView::selectedNodes() const
{
    QVector<Node *> nodes;
    DirEntryTreeModel *m = dirEntryTreeModel();
    if (!m || !selectionModel())
        return nodes;
    for (const QModelIndex &index : selectionModel()->selectedRows())
        nodes << m->nodeFromIndex(index);
    return nodes;
}

QVector<DirEntryTreeView::Node *> DirEntryTreeView::allNodes() const
{
    QVector<Node *> nodes;
    DirEntryTreeModel *m = dirEntryTreeModel();
    if (!m || !m->rootNode())
        return nodes;
    std::function<void(Node *)> walk = [&](Node *branch) {
        for (int row = 0; row < branch->childrenCount(); ++row) {
            Node *child = branch->childNode(row);
            nodes << child;
            walk(child);
        }
    };
    walk(m->rootNode().get());
    return nodes;
}

void DirEntryTreeView::selectNode(Node *node)
{
    DirEntryTreeModel *m = dirEntryTreeModel();
    if (!m)
        return;
    const QModelIndex index = m->index(node);
    if (!index.isValid())
        return;
    setCurrentIndex(index);
    selectionModel()->select(index, QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows);
    scrollTo(index);
}

void DirEntryTreeView::selectAndEditNode(Node *node)
{
    selectNode(node);
    DirEntryTreeModel *m = dirEntryTreeModel();
    if (m && node)
        edit(m->index(node));
}

void DirEntryTreeView::expandNode(Node *node)
{
    if (DirEntryTreeModel *m = dirEntryTreeModel())
        expand(m->index(node));
}

void DirEntryTreeView::removeNodes(const QVector<Node *> &nodes, bool deleteFromStorage)
{
    DirEntryTreeModel *m = dirEntryTreeModel();
    if (!m)
        return;
    if (deleteFromStorage) {
        if (const auto persistance = m->persistanceInferface()) {
            for (Node *node : nodes) {
                auto *entryNode = dynamic_cast<DirEntryTreeModel::DirEntryNode *>(node);
                if (entryNode && entryNode->isStored() && entryNode->cargo())
                    persistance->deleteObjectFromStorage(entryNode->dispatcherId(), entryNode->cargo());
            }
        }
    }
    m->removeNodes(nodes);
}

void DirEntryTreeView::duplicateSelectedNodes(std::shared_ptr<GlobalDirEntry> folder)
{
    DirEntryTreeModel *m = dirEntryTreeModel();
    const auto persistance = m ? m->persistanceInferface() : nullptr;
    if (!persistance)
        return;
    for (Node *node : selectedNodes()) {
        const std::shared_ptr<BaseObject> object = node ? node->cargo() : nullptr;
        if (!object)
            continue;
        std::shared_ptr<BaseObject> copy = object->deepCopy();
        copy->setId(QString());
        copy->setUuid(QUuid());
        copy->setVersion(0);
        copy->setIsStored(false);
        copy->header().setName(DirEntryPersistanceManager::copyName(object->header().name()));
        std::shared_ptr<GlobalDirEntry> target = folder;
        if (!target) {
            // Beside the original.
            auto *entryNode = dynamic_cast<DirEntryTreeModel::DirEntryNode *>(node);
            const auto original = entryNode ? entryNode->globalDirEntry() : nullptr;
            if (original)
                target = folderHolding(*original);
        }
        QPointer<DirEntryTreeModel> model = m;
        persistance->storeObject(copy, target, [model, copy](std::shared_ptr<GlobalDirEntry> entry) {
            if (!model)
                return;
            auto *added = model->openDirEntry(entry);
            if (added && !added->cargo()) {
                added->setItem(copy, true);
                model->redrawNode(added);
            }
        });
    }
}

void DirEntryTreeView::keyPressEvent(QKeyEvent *event)
{
    if (event->matches(QKeySequence::Delete) || event->matches(QKeySequence::Close)) {
        if (Node *node = currentNode()) {
            Q_EMIT sgCloseActivated(node);
            event->accept();
            return;
        }
    }
    QTreeView::keyPressEvent(event);
}

void DirEntryTreeView::onSelectionChanged()
{
    Q_EMIT sgSelectionChanged(selectedNodes());
}

} // namespace vexa
