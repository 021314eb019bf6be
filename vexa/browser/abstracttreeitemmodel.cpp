#include "abstracttreeitemmodel.h"

#include "abstracttreeitem.h"

namespace vexa {

AbstractTreeItemModel::AbstractTreeItemModel(QObject *parent)
    : QAbstractItemModel(parent)
    , m_rootItem(std::make_shared<DefaultTreeItem>(std::string(), nullptr))
{
}

AbstractTreeItemModel::~AbstractTreeItemModel() = default;

std::shared_ptr<AbstractTreeItem> AbstractTreeItemModel::addRootItem(std::shared_ptr<AbstractTreeItem> item)
{
    return addItem(std::move(item), m_rootItem.get());
}

std::shared_ptr<AbstractTreeItem> AbstractTreeItemModel::addItem(std::shared_ptr<AbstractTreeItem> item,
                                                                 AbstractTreeItem *parent)
{
    if (!item)
        return item;
    if (!parent)
        parent = m_rootItem.get();
    const int n = parent->childCount();
    const QModelIndex parentIndex = parent == m_rootItem.get() ? QModelIndex() : createIndex(parent->row(), 0, parent);
    beginInsertRows(parentIndex, n, n);
    parent->appendChild(item);
    m_items.insert(item.get(), item);
    endInsertRows();
    return item;
}

std::vector<std::shared_ptr<AbstractTreeItem>> AbstractTreeItemModel::rootItems() const
{
    return m_rootItem->children();
}

AbstractTreeItem *AbstractTreeItemModel::item(const QModelIndex &index) const
{
    return static_cast<AbstractTreeItem *>(index.internalPointer());
}

AbstractTreeItem *AbstractTreeItemModel::rootItem() const
{
    return m_rootItem.get();
}

void AbstractTreeItemModel::clear()
{
    const int n = m_rootItem->childCount();
    if (n < 1)
        return;
    beginRemoveRows(QModelIndex(), 0, n);
    m_rootItem->clear();
    m_items.clear();
    endRemoveRows();
}

AbstractTreeItem *AbstractTreeItemModel::itemOrRoot(const QModelIndex &index) const
{
    return index.isValid() ? item(index) : m_rootItem.get();
}

QModelIndex AbstractTreeItemModel::index(int row, int column, const QModelIndex &parent) const
{
    if (!hasIndex(row, column, parent))
        return QModelIndex();
    AbstractTreeItem *parentItem = itemOrRoot(parent);
    if (!parentItem || row >= parentItem->childCount())
        return QModelIndex();
    return createIndex(row, column, parentItem->child(row));
}

QModelIndex AbstractTreeItemModel::parent(const QModelIndex &index) const
{
    if (!index.isValid())
        return QModelIndex();
    AbstractTreeItem *parentItem = item(index)->parent();
    if (!parentItem || parentItem == m_rootItem.get())
        return QModelIndex();
    return createIndex(parentItem->row(), 0, parentItem);
}

int AbstractTreeItemModel::rowCount(const QModelIndex &parent) const
{
    if (parent.column() > 0)
        return 0;
    const AbstractTreeItem *parentItem = itemOrRoot(parent);
    return parentItem ? parentItem->childCount() : 0;
}

int AbstractTreeItemModel::columnCount(const QModelIndex &) const
{
    return int(headerLabels().size());
}

QVariant AbstractTreeItemModel::data(const QModelIndex &index, int role) const
{
    if (!index.isValid())
        return QVariant();
    return item(index)->data(index.column(), role);
}

Qt::ItemFlags AbstractTreeItemModel::flags(const QModelIndex &index) const
{
    return index.isValid() ? Qt::ItemIsSelectable | Qt::ItemIsEnabled : Qt::NoItemFlags;
}

QVariant AbstractTreeItemModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (role != Qt::DisplayRole)
        return QAbstractItemModel::headerData(section, orientation, role);
    const std::vector<QString> labels = headerLabels();
    if (section < 0 || section >= int(labels.size()))
        return QVariant();
    return labels[size_t(section)];
}

} // namespace vexa
