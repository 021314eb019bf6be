#include "baseobjecttreemodel.h"

#include <vexa/widgets/imagerepository.h>

#include <domain/baseobject.h>
#include <domain/domainmetatypes.h>
#include <store/errorinfo.h>
#include <utilities/logger.h>

#include <QSignalBlocker>

namespace vexa {

using Node = BaseObjectTreeModel::Node;
using PersistanceInferface = BaseObjectTreeModel::PersistanceInferface;

// ---- Node ------------------------------------------------------------------------------

Node::Node(Node *parent)
    : m_parent(parent)
{
}

Node::Node(Node *parent, std::shared_ptr<BaseObject> item)
    : m_parent(parent)
    , m_item(std::move(item))
{
}

Node::Node(const Node &other) = default;

Node::~Node() = default;

Qt::ItemFlags Node::flags()
{
    return Qt::NoItemFlags;
}

QString Node::name()
{
    return m_item ? m_item->header().name() : QString();
}

QString Node::timestamp()
{
    return m_item ? m_item->header().creationTimestamp().toString() : QString();
}

QString Node::id()
{
    return QString::fromStdString(objectId());
}

std::string Node::objectId()
{
    return m_item ? m_item->id().toStdString() : std::string();
}

std::string Node::objectType()
{
    return m_item ? m_item->typeName().toStdString() : std::string();
}

QIcon Node::icon()
{
    static const QIcon noIcon;
    if (!m_item)
        return noIcon;
    return ImageRepository::instance().iconForObject(m_item, ImageRepository::EBrightness(0));
}

std::shared_ptr<BaseObject> Node::cargo()
{
    return m_item;
}

void Node::setItem(const std::shared_ptr<BaseObject> &item, bool notifyParent)
{
    m_item = item;
    if (notifyParent && m_parent)
        m_parent->itemWasSetForChildNode(this);
}

void Node::itemWasSetForChildNode(Node *)
{
}

bool Node::isDeleteable() const
{
    return false;
}

// ---- PersistanceInferface ----------------------------------------------------------------

PersistanceInferface::PersistanceManagerContext::PersistanceManagerContext(const QVariant &userData)
    : m_userData(userData)
{
}

PersistanceInferface::PersistanceManagerContext::~PersistanceManagerContext() = default;

PersistanceInferface::~PersistanceInferface() = default;

void PersistanceInferface::loadDirEntry(const std::string &, std::string,
                                        std::function<void(std::shared_ptr<BaseObject>)>,
                                        std::function<void(std::shared_ptr<ErrorInfo>)>)
{
}

void PersistanceInferface::insertLoadObjectCallBack(const std::string &key, LoadedCallBack callBack)
{
    m_loadCallBacks[key] = std::move(callBack);
}

void PersistanceInferface::insertLoadObjectFailedCallBack(const std::string &key, FailedCallBack callBack)
{
    m_loadFailedCallBacks[key] = std::move(callBack);
}

void PersistanceInferface::insertPersistanceManagerContext(const std::string &key,
                                                           std::shared_ptr<PersistanceManagerContext> context)
{
    m_contexts[key] = std::move(context);
}

namespace {

template<class Map>
typename Map::mapped_type take(Map &map, const std::string &key)
{
    const auto it = map.find(key);
    if (it == map.end())
        return typename Map::mapped_type();
    auto value = std::move(it->second);
    map.erase(it);
    return value;
}

} // namespace

PersistanceInferface::LoadedCallBack PersistanceInferface::takeLoadObjectCallBack(const std::string &key)
{
    return take(m_loadCallBacks, key);
}

PersistanceInferface::FailedCallBack PersistanceInferface::takeLoadObjectFailedCallBack(const std::string &key)
{
    return take(m_loadFailedCallBacks, key);
}

std::shared_ptr<PersistanceInferface::PersistanceManagerContext>
PersistanceInferface::takePersistanceManagerContext(const std::string &key)
{
    return take(m_contexts, key);
}

// ---- BaseObjectTreeModel -----------------------------------------------------------------

BaseObjectTreeModel::BaseObjectTreeModel(QObject *parent)
    : QAbstractItemModel(parent)
{
    registerDomainMetaTypes();
    connect(this, &QAbstractItemModel::dataChanged, this,
            QOverload<const QModelIndex &, const QModelIndex &, const QVector<int> &>::of(
                &BaseObjectTreeModel::dataHasChanged));
    connect(this, &QAbstractItemModel::rowsInserted, this, &BaseObjectTreeModel::onRowsChanged);
    connect(this, &QAbstractItemModel::rowsRemoved, this, &BaseObjectTreeModel::onRowsChanged);
}

BaseObjectTreeModel::~BaseObjectTreeModel() = default;

void BaseObjectTreeModel::initialize()
{
    clear();
}

void BaseObjectTreeModel::clear()
{
    beginResetModel();
    m_rootNode = newRootNode();
    endResetModel();
    sort(0, Qt::AscendingOrder);
}

Node *BaseObjectTreeModel::nodeFromIndex(const QModelIndex &index) const
{
    return index.isValid() ? static_cast<Node *>(index.internalPointer()) : m_rootNode.get();
}

Node *BaseObjectTreeModel::nodeWithID(const QString &id) const
{
    if (id.isEmpty() || !m_rootNode)
        return nullptr;
    return m_rootNode->childNodeWithID(id.toStdString());
}

Node *BaseObjectTreeModel::nodeWithParentAndID(Node *parent, const QString &id) const
{
    if (id.isEmpty() || !parent)
        return nullptr;
    return parent->childNodeWithID(id.toStdString());
}

void BaseObjectTreeModel::addButton()
{
    const int c = columnCount();
    beginInsertColumns(QModelIndex(), c, c);
    ++m_buttonColumns;
    endInsertColumns();
}

void BaseObjectTreeModel::setPersistanceInferface(const std::shared_ptr<PersistanceInferface> &persistanceInferface)
{
    m_persistanceInferface = persistanceInferface;
}

void BaseObjectTreeModel::beginInsertRows(Node *parent, int first, int last)
{
    QAbstractItemModel::beginInsertRows(index(parent), first, last);
}

void BaseObjectTreeModel::endInsertRows()
{
    QAbstractItemModel::endInsertRows();
}

void BaseObjectTreeModel::beginRemoveRows(Node *parent, int first, int last)
{
    QAbstractItemModel::beginRemoveRows(index(parent), first, last);
}

void BaseObjectTreeModel::endRemoveRows()
{
    QAbstractItemModel::endRemoveRows();
}

QModelIndex BaseObjectTreeModel::index(Node *node) const
{
    if (!node || !node->parent())
        return QModelIndex();
    Node *parent = node->parent();
    return index(parent->rowOf(node), 0, index(parent));
}

QModelIndex BaseObjectTreeModel::index(int row, int column, const QModelIndex &parent) const
{
    if (row < 0 || column < 0)
        return QModelIndex();
    Node *parentNode = nodeFromIndex(parent);
    Node *child = parentNode ? parentNode->childNode(row) : nullptr;
    return child ? createIndex(row, column, child) : QModelIndex();
}

QModelIndex BaseObjectTreeModel::parent(const QModelIndex &index) const
{
    if (!index.isValid())
        return QModelIndex();
    Node *parentNode = nodeFromIndex(index)->parent();
    if (!parentNode || !parentNode->parent())
        return QModelIndex();
    return createIndex(parentNode->parent()->rowOf(parentNode), 0, parentNode);
}

int BaseObjectTreeModel::rowCount(const QModelIndex &parent) const
{
    if (parent.column() > 0)
        return 0;
    Node *node = nodeFromIndex(parent);
    return node ? node->childrenCount() : 0;
}

int BaseObjectTreeModel::columnCount(const QModelIndex &) const
{
    return m_buttonColumns + 1;
}

bool BaseObjectTreeModel::hasChildren(const QModelIndex &parent) const
{
    Node *node = nodeFromIndex(parent);
    return node && node->hasChildren();
}

// Every index may have more: derived trees load their children when they are shown.
bool BaseObjectTreeModel::canFetchMore(const QModelIndex &) const
{
    return true;
}

QVariant BaseObjectTreeModel::data(const QModelIndex &index, int role) const
{
    Node *node = nodeFromIndex(index);
    if (!node || index.column() != 0)
        return QVariant();
    switch (role) {
    case Qt::DisplayRole:
        return displayRole(node);
    case Qt::DecorationRole:
        return decorationRole(node);
    case Qt::EditRole:
        return editRole(node);
    case Qt::ToolTipRole:
        return toolTipRole(node);
    case Qt::FontRole:
        return fontRole(node);
    case Qt::UserRole:
        return userRole(node);
    default:
        return QVariant();
    }
}

QVariant BaseObjectTreeModel::editRole(Node *node) const
{
    return node->name();
}

QVariant BaseObjectTreeModel::displayRole(Node *node) const
{
    return node->isModified() ? node->name() + QStringLiteral(" *") : node->name();
}

QVariant BaseObjectTreeModel::decorationRole(Node *node) const
{
    return node ? QVariant(node->icon()) : QVariant();
}

QVariant BaseObjectTreeModel::fontRole(Node *) const
{
    return QVariant();
}

QVariant BaseObjectTreeModel::toolTipRole(Node *node) const
{
    return node->name();
}

QVariant BaseObjectTreeModel::userRole(Node *node) const
{
    const std::shared_ptr<BaseObject> cargo = node->cargo();
    return cargo ? QVariant::fromValue(cargo) : QVariant();
}

Qt::ItemFlags BaseObjectTreeModel::flags(const QModelIndex &index) const
{
    Node *node = nodeFromIndex(index);
    return node ? node->flags() : Qt::NoItemFlags;
}

QMap<int, QVariant> BaseObjectTreeModel::itemData(const QModelIndex &index) const
{
    QMap<int, QVariant> roles = QAbstractItemModel::itemData(index);
    if (index.isValid() && index.column() == 0) {
        const QVariant cargo = data(index, Qt::UserRole);
        if (cargo.isValid())
            roles.insert(Qt::UserRole, cargo);
        roles.insert(NodeAddressRole, QVariant::fromValue(qulonglong(quintptr(nodeFromIndex(index)))));
    }
    return roles;
}

bool BaseObjectTreeModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    if (index.column() != 0)
        return true;
    if (role != Qt::UserRole) {
        QAbstractItemModel::setData(index, value, role);
        return true;
    }
    std::shared_ptr<BaseObject> object;
    const int objectType = qMetaTypeId<std::shared_ptr<BaseObject>>();
    if (value.userType() == objectType) {
        object = value.value<std::shared_ptr<BaseObject>>();
    } else {
        QVariant converted = value;
        if (converted.convert(objectType))
            object = converted.value<std::shared_ptr<BaseObject>>();
    }
    Node *node = nodeFromIndex(index);
    if (!node || !object)
        return false;
    node->setItem(object, true);
    Q_EMIT dataChanged(index, index, {});
    return true;
}

bool BaseObjectTreeModel::insertRows(int row, int count, const QModelIndex &parent)
{
    QAbstractItemModel::beginInsertRows(parent, row, row + count - 1);
    Node *node = nodeFromIndex(parent);
    if (node)
        node->insertEmptyNodes(row, count);
    QAbstractItemModel::endInsertRows();
    return node != nullptr;
}

bool BaseObjectTreeModel::removeRows(int row, int count, const QModelIndex &parent)
{
    if (count < 1 || row < 0 || row + count > rowCount(parent))
        return false;
    Node *node = nodeFromIndex(parent);
    QAbstractItemModel::beginRemoveRows(parent, row, row + count - 1);
    {
        const QSignalBlocker blocker(this);
        for (int i = row + count - 1; i >= row; --i) {
            Node *child = node->takeChild(i);
            if (child) {
                child->setItem(nullptr, true);
                delete child;
            }
        }
    }
    QAbstractItemModel::endRemoveRows();
    return true;
}

// A move by drag and drop is a drop (insert and setItemData) followed by the removal
// of the source rows; nothing is moved here.
bool BaseObjectTreeModel::moveRows(const QModelIndex &, int, int, const QModelIndex &, int)
{
    Logger::instance().debug(LogCategory::General, QStringLiteral("BaseObjectTreeModel::moveRows"));
    return true;
}

Qt::DropActions BaseObjectTreeModel::supportedDropActions() const
{
    return Qt::CopyAction | Qt::MoveAction | Qt::LinkAction;
}

bool BaseObjectTreeModel::dropMimeData(const QMimeData *data, Qt::DropAction action, int row, int column,
                                       const QModelIndex &parent)
{
    // The top-level node above the drop target is the object that changes.
    Node *topLevel = nodeFromIndex(parent);
    while (topLevel && topLevel->parent() && topLevel->parent()->parent())
        topLevel = topLevel->parent();
    const bool dropped = QAbstractItemModel::dropMimeData(data, action, row, column, parent);
    if (dropped && topLevel)
        topLevel->setIsModified(true);
    return dropped;
}

void BaseObjectTreeModel::dataHasChanged(Node *parentNode, Node *node)
{
    Q_EMIT sgDataHasChanged(parentNode, node);
}

void BaseObjectTreeModel::dataHasChanged(const QModelIndex &topLeft, const QModelIndex &, const QVector<int> &)
{
    Node *node = nodeFromIndex(topLeft);
    if (node && node->parent())
        dataHasChanged(node->parent(), node);
}

void BaseObjectTreeModel::onRowsChanged(const QModelIndex &parent, int, int)
{
    if (Node *node = nodeFromIndex(parent))
        Q_EMIT sgRowsChanged(node);
}

// ---- GeneralBranchNode -------------------------------------------------------------------

GeneralBranchNode::GeneralBranchNode(Node *parent, std::shared_ptr<BaseObject> item)
    : Node(parent, std::move(item))
{
}

GeneralBranchNode::GeneralBranchNode(const GeneralBranchNode &other) = default;

GeneralBranchNode::~GeneralBranchNode()
{
    qDeleteAll(m_children);
}

bool GeneralBranchNode::hasChildren()
{
    return childrenCount() > 0;
}

int GeneralBranchNode::childrenCount()
{
    return m_children.size();
}

Node *GeneralBranchNode::childNode(int row)
{
    return row >= 0 && row < m_children.size() ? m_children.at(row) : nullptr;
}

Node *GeneralBranchNode::childNodeWithID(const std::string &id)
{
    for (Node *child : qAsConst(m_children)) {
        if (child->objectId() == id)
            return child;
        if (Node *found = child->childNodeWithID(id))
            return found;
    }
    return nullptr;
}

Node *GeneralBranchNode::takeChild(int row)
{
    return m_children.takeAt(row);
}

int GeneralBranchNode::rowOf(Node *child)
{
    return m_children.indexOf(child);
}

Qt::ItemFlags GeneralBranchNode::flags()
{
    Qt::ItemFlags result = Qt::ItemIsSelectable | Qt::ItemIsEnabled;
    if (m_isDragEnabled)
        result |= Qt::ItemIsDragEnabled;
    if (m_isDropEnabled)
        result |= Qt::ItemIsDropEnabled;
    return result;
}

void GeneralBranchNode::insertEmptyNodes(int row, int count)
{
    for (int i = 0; i < count; ++i)
        m_children.insert(row + i, new GeneralBranchNode(this, nullptr));
}

bool GeneralBranchNode::isDeleteable() const
{
    return m_isDeleteable;
}

void GeneralBranchNode::setChildren(const std::vector<Node *> &nodes)
{
    qDeleteAll(m_children);
    m_children.clear();
    for (Node *node : nodes)
        m_children.append(node);
}

void GeneralBranchNode::insertIntoCache(Node *node, int row)
{
    m_children.insert(row, node);
}

} // namespace vexa
