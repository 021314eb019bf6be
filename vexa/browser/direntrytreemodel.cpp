#include "direntrytreemodel.h"

#include "corvidobjectsclientmodel.h"
#include "direntrypaths_p.h"
#include "selectedpath.h"

#include <vexa/widgets/imagerepository.h>

#include <domain/baseobject.h>
#include <domain/globaldirentry.h>
#include <utilities/logger.h>

#include <QFont>

#include <stdexcept>

namespace vexa {

using Node = BaseObjectTreeModel::Node;

// ---- DirEntryNode ------------------------------------------------------------------------

DirEntryTreeModel::DirEntryNode::DirEntryNode(std::shared_ptr<GlobalDirEntry> entry, Node *parent)
    : GeneralBranchNode(parent, nullptr)
    , m_entry(std::move(entry))
{
    setIsDeleteable(true);
}

DirEntryTreeModel::DirEntryNode::~DirEntryNode() = default;

std::string DirEntryTreeModel::DirEntryNode::dispatcherId() const
{
    return m_entry ? m_entry->dispatcherID().toStdString() : std::string();
}

QString DirEntryTreeModel::DirEntryNode::name()
{
    if (item())
        return Node::name();
    return m_entry ? m_entry->header().name() : QString();
}

QString DirEntryTreeModel::DirEntryNode::timestamp()
{
    if (item())
        return Node::timestamp();
    return m_entry ? m_entry->header().creationTimestamp().toString() : QString();
}

std::string DirEntryTreeModel::DirEntryNode::objectId()
{
    if (m_entry && !m_entry->entryObjectId().isEmpty())
        return m_entry->entryObjectId().toStdString();
    if (item())
        return Node::objectId();
    Logger::instance().debug(LogCategory::General, QStringLiteral("PROBLEM !!! no globalDirEntry and no namedObject"));
    return std::string();
}

std::string DirEntryTreeModel::DirEntryNode::objectType()
{
    if (item())
        return Node::objectType();
    return m_entry ? m_entry->entryObjectType().toStdString() : std::string();
}

QIcon DirEntryTreeModel::DirEntryNode::icon()
{
    if (item())
        return Node::icon();
    if (m_entry)
        return ImageRepository::instance().iconForType(m_entry->entryObjectType(), ImageRepository::Light);
    return Node::icon();
}

Qt::ItemFlags DirEntryTreeModel::DirEntryNode::flags()
{
    Qt::ItemFlags result = GeneralBranchNode::flags();
    if (item() && !m_isSaving)
        result |= Qt::ItemIsEditable;
    return result;
}

bool DirEntryTreeModel::DirEntryNode::isStored() const
{
    return m_entry && !m_entry->entryObjectId().isEmpty() && (!item() || item()->isStored());
}

// ---- DirEntryTreeModel -------------------------------------------------------------------

DirEntryTreeModel::DirEntryTreeModel(QObject *parent)
    : BaseObjectTreeModel(parent)
{
}

DirEntryTreeModel::~DirEntryTreeModel() = default;

std::shared_ptr<Node> DirEntryTreeModel::newRootNode()
{
    return std::make_shared<GeneralBranchNode>(nullptr, nullptr);
}

Node *DirEntryTreeModel::newDirEntryNode(std::shared_ptr<GlobalDirEntry> entry, Node *parent)
{
    return new DirEntryNode(std::move(entry), parent);
}

QVector<DirEntryTreeModel::DirEntryNode *> DirEntryTreeModel::dirEntryNodes() const
{
    QVector<DirEntryNode *> nodes;
    const auto root = std::dynamic_pointer_cast<GeneralBranchNode>(rootNode());
    if (!root)
        return nodes;
    for (Node *node : root->childNodes()) {
        if (auto *entryNode = dynamic_cast<DirEntryNode *>(node))
            nodes << entryNode;
    }
    return nodes;
}

namespace {

// Searches by address only: the node looked for may be gone already.
bool containsAddress(Node *branch, const Node *wanted)
{
    const int count = branch->childrenCount();
    for (int row = 0; row < count; ++row) {
        Node *child = branch->childNode(row);
        if (child == wanted || (child && containsAddress(child, wanted)))
            return true;
    }
    return false;
}

} // namespace

bool DirEntryTreeModel::containsNode(const Node *node) const
{
    if (!node || !rootNode())
        return false;
    return node == rootNode().get() || containsAddress(rootNode().get(), node);
}

DirEntryTreeModel::DirEntryNode *DirEntryTreeModel::openDirEntry(const std::shared_ptr<GlobalDirEntry> &entry)
{
    if (!entry)
        return nullptr;
    if (!rootNode())
        initialize();
    for (DirEntryNode *node : dirEntryNodes()) {
        const auto known = node->globalDirEntry();
        if (known && known->entryObjectId() == entry->entryObjectId()
            && known->standardizedDispatcherID() == entry->standardizedDispatcherID())
            return node;
    }
    auto *root = static_cast<GeneralBranchNode *>(rootNode().get());
    const int row = root->childrenCount();
    auto *node = static_cast<DirEntryNode *>(newDirEntryNode(entry, root));
    beginInsertRows(root, row, row);
    root->insertIntoCache(node, row);
    endInsertRows();
    loadNode(node);
    return node;
}

DirEntryTreeModel::DirEntryNode *DirEntryTreeModel::addNewObject(const std::shared_ptr<BaseObject> &object,
                                                                 const std::shared_ptr<GlobalDirEntry> &folder)
{
    if (!object)
        return nullptr;
    if (!rootNode())
        initialize();
    // The entry of an unsaved object names only where it will go.
    auto entry = std::make_shared<GlobalDirEntry>();
    entry->setEntryObjectType(object->typeName());
    entry->setHeader(object->header());
    if (folder)
        placeInside(*entry, *folder);
    auto *root = static_cast<GeneralBranchNode *>(rootNode().get());
    const int row = root->childrenCount();
    auto *node = static_cast<DirEntryNode *>(newDirEntryNode(entry, root));
    node->setItem(object, false);
    node->setIsModified(true);
    beginInsertRows(root, row, row);
    root->insertIntoCache(node, row);
    endInsertRows();
    return node;
}

void DirEntryTreeModel::loadNode(DirEntryNode *node)
{
    const auto entry = node->globalDirEntry();
    if (!entry || entry->entryObjectId().isEmpty())
        return;
    auto context = std::make_shared<PersistanceInferface::PersistanceManagerContext>(
        QVariant::fromValue(qulonglong(quintptr(node))));
    loadNamedObject(entry, context, [this, node](std::shared_ptr<BaseObject> object) {
        // The node may have been closed while its object was on the way.
        if (!containsNode(node))
            return;
        node->setItem(object, true);
        node->setIsModified(false);
        redrawNode(node);
        Q_EMIT sgNodeLoaded(node);
    });
}

void DirEntryTreeModel::reloadNode(Node *node)
{
    if (auto *entryNode = dynamic_cast<DirEntryNode *>(node))
        loadNode(entryNode);
}

void DirEntryTreeModel::loadNamedObject(std::shared_ptr<GlobalDirEntry> entry,
                                        std::shared_ptr<PersistanceInferface::PersistanceManagerContext> context,
                                        std::function<void(std::shared_ptr<BaseObject>)> onLoaded)
{
    const auto persistance = persistanceInferface();
    if (!persistance || !entry)
        return;
    try {
        persistance->loadObject(entry->dispatcherID().toStdString(), entry->entryObjectId().toStdString(),
                                entry->entryObjectType().toStdString(), std::move(context), std::move(onLoaded));
    } catch (const std::exception &e) {
        Q_EMIT sgErrorOccurred(QString::fromStdString(e.what()));
    }
}

void DirEntryTreeModel::removeNodes(const QVector<Node *> &nodes)
{
    for (Node *node : nodes) {
        if (!containsNode(node) || !node->parent())
            continue;
        const QModelIndex index = this->index(node);
        removeRows(index.row(), 1, index.parent());
    }
}

void DirEntryTreeModel::setNodeModified(Node *node, bool modified)
{
    if (!node)
        return;
    node->setIsModified(modified);
    redrawNode(node);
}

void DirEntryTreeModel::redrawNode(Node *node)
{
    const QModelIndex index = this->index(node);
    if (index.isValid())
        Q_EMIT dataChanged(index, index.siblingAtColumn(columnCount() - 1));
}

bool DirEntryTreeModel::setData(const QModelIndex &index, const QVariant &value, int role)
{
    if (role != Qt::EditRole || index.column() != 0)
        return BaseObjectTreeModel::setData(index, value, role);
    Node *node = nodeFromIndex(index);
    const std::shared_ptr<BaseObject> object = node ? node->cargo() : nullptr;
    if (!object)
        return false;
    const QString name = value.toString().trimmed();
    if (name.isEmpty()) {
        Q_EMIT sgErrorOccurred(tr("A name cannot be empty."));
        return false;
    }
    if (name.size() > CorvidObjectsClientModel::MaximumNameLength) {
        Q_EMIT sgErrorOccurred(tr("A name can have at most %1 characters; this one has %2.")
                                   .arg(CorvidObjectsClientModel::MaximumNameLength)
                                   .arg(name.size()));
        return false;
    }
    if (name == object->header().name())
        return true;
    object->header().setName(name);
    node->setIsModified(true);
    Q_EMIT dataChanged(index, index);
    return true;
}

QVariant DirEntryTreeModel::toolTipRole(Node *node) const
{
    auto *entryNode = dynamic_cast<DirEntryNode *>(node);
    const auto entry = entryNode ? entryNode->globalDirEntry() : nullptr;
    if (!entry)
        return BaseObjectTreeModel::toolTipRole(node);
    const SelectedPath path(entry->dispatcherID(), entry->path(), entry->stringPath());
    QString text = path.pathToString();
    if (!text.endsWith(SelectedPath::separator()))
        text += SelectedPath::separator();
    text += node->name();
    if (!entry->dispatcherID().isEmpty())
        text += QLatin1Char('\n') + entry->dispatcherID();
    if (!entryNode->isStored())
        text += QLatin1Char('\n') + tr("Not saved yet");
    return text;
}

QVariant DirEntryTreeModel::fontRole(Node *node) const
{
    auto *entryNode = dynamic_cast<DirEntryNode *>(node);
    if (entryNode && !entryNode->isLoaded()) {
        QFont font;
        font.setItalic(true);
        return font;
    }
    return BaseObjectTreeModel::fontRole(node);
}

} // namespace vexa
