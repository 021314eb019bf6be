#pragma once

#include <vexa/vexa_export.h>

#include <QAbstractItemModel>
#include <QHash>

#include <memory>
#include <vector>

namespace vexa {

class AbstractTreeItem;
class DefaultTreeItem;

// A generic read-only tree of AbstractTreeItems. The model keeps every item it was
// given alive; a subclass names the columns (one label a column).
class VEXA_EXPORT AbstractTreeItemModel : public QAbstractItemModel
{
    Q_OBJECT
public:
    explicit AbstractTreeItemModel(QObject *parent = nullptr);
    ~AbstractTreeItemModel() override;

    // The header labels; their number is the column count.
    virtual std::vector<QString> headerLabels() const = 0;

    // Appends an item at the top level (under the invisible root), announced as one row.
    std::shared_ptr<AbstractTreeItem> addRootItem(std::shared_ptr<AbstractTreeItem> item);
    // Appends an item under parent (the root for null), announced as one row.
    std::shared_ptr<AbstractTreeItem> addItem(std::shared_ptr<AbstractTreeItem> item, AbstractTreeItem *parent);
    std::vector<std::shared_ptr<AbstractTreeItem>> rootItems() const;
    AbstractTreeItem *item(const QModelIndex &index) const;
    AbstractTreeItem *rootItem() const;
    // Removes every top-level item. The removal is announced from row 0 to the child
    // count (one past the last row); views rely on that form.
    void clear();

    QModelIndex index(int row, int column, const QModelIndex &parent = QModelIndex()) const override;
    QModelIndex parent(const QModelIndex &index) const override;
    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;

private:
    AbstractTreeItem *itemOrRoot(const QModelIndex &index) const;

    std::shared_ptr<DefaultTreeItem> m_rootItem;
    QHash<const AbstractTreeItem *, std::shared_ptr<AbstractTreeItem>> m_items;
};

} // namespace vexa
