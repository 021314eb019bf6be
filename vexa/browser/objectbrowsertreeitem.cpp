#include "objectbrowsertreeitem.h"

#include <vexa/widgets/imagerepository.h>

#include <domain/direntry.h>
#include <domain/globaldirentry.h>

namespace vexa {

ObjectBrowserTreeItem::ObjectBrowserTreeItem(const std::string &name, ObjectBrowserFolder *parent,
                                             std::shared_ptr<DirEntry> entry)
    : m_parent(parent)
    , m_dirEntry(std::move(entry))
{
    if (m_dirEntry && m_dirEntry->header().name().isEmpty() && !name.empty())
        m_dirEntry->header().setName(QString::fromStdString(name));
}

ObjectBrowserTreeItem::~ObjectBrowserTreeItem() = default;

QString ObjectBrowserTreeItem::name() const
{
    return m_dirEntry ? m_dirEntry->header().name() : QString();
}

void ObjectBrowserTreeItem::setName(const QString &name)
{
    if (m_dirEntry)
        m_dirEntry->header().setName(name);
    if (m_object)
        m_object->header().setName(name);
}

QString ObjectBrowserTreeItem::timestamp() const
{
    return m_dirEntry ? m_dirEntry->header().creationTimestamp().toString() : QString();
}

QString ObjectBrowserTreeItem::id() const
{
    return m_dirEntry ? m_dirEntry->id() : QString();
}

QString ObjectBrowserTreeItem::objectId() const
{
    return m_dirEntry ? m_dirEntry->entryObjectId() : QString();
}

QString ObjectBrowserTreeItem::objectType() const
{
    return m_dirEntry ? m_dirEntry->entryObjectType() : QString();
}

std::string ObjectBrowserTreeItem::dispatcherId() const
{
    if (const auto global = std::dynamic_pointer_cast<GlobalDirEntry>(m_dirEntry)) {
        if (!global->dispatcherID().isEmpty())
            return global->dispatcherID().toStdString();
    }
    return m_parent ? m_parent->dispatcherId() : std::string();
}

int ObjectBrowserTreeItem::row() const
{
    return m_parent ? m_parent->rowOf(this) : -1;
}

int ObjectBrowserTreeItem::columnCount() const
{
    return 1;
}

QIcon ObjectBrowserTreeItem::icon() const
{
    if (!m_dirEntry)
        return QIcon();
    return ImageRepository::instance().iconForType(objectType(), ImageRepository::EBrightness(1));
}

void ObjectBrowserTreeItem::setIsDirty(bool dirty)
{
    m_isDirty = dirty;
}

ObjectBrowserTreeItem *ObjectBrowserTreeItem::itemWithID(const std::string &id)
{
    if (!m_dirEntry)
        return id.empty() ? this : nullptr;
    const QString wanted = QString::fromStdString(id);
    if (m_dirEntry->entryObjectId() == wanted || m_dirEntry->id() == wanted)
        return this;
    return nullptr;
}

ObjectBrowserFolder::ObjectBrowserFolder(const std::string &name, ObjectBrowserFolder *parent,
                                         std::shared_ptr<DirEntry> entry)
    : ObjectBrowserTreeItem(name, parent, std::move(entry))
{
    // Nothing is known of a new folder's contents yet.
    ObjectBrowserTreeItem::setIsDirty(true);
}

ObjectBrowserFolder::~ObjectBrowserFolder()
{
    qDeleteAll(m_children);
}

ObjectBrowserTreeItem *ObjectBrowserFolder::objectBrowserTreeItemAtPosition(int position) const
{
    return position >= 0 && position < m_children.size() ? m_children.at(position) : nullptr;
}

int ObjectBrowserFolder::rowOf(const ObjectBrowserTreeItem *item) const
{
    return m_children.indexOf(const_cast<ObjectBrowserTreeItem *>(item));
}

void ObjectBrowserFolder::append(ObjectBrowserTreeItem *item)
{
    insert(m_children.size(), item);
}

void ObjectBrowserFolder::insert(int position, ObjectBrowserTreeItem *item)
{
    if (!item)
        return;
    item->setParent(this);
    m_children.insert(qBound(0, position, int(m_children.size())), item);
}

ObjectBrowserTreeItem *ObjectBrowserFolder::takeChildAt(unsigned long position)
{
    if (position >= static_cast<unsigned long>(m_children.size()))
        return nullptr;
    ObjectBrowserTreeItem *child = m_children.takeAt(int(position));
    child->setParent(nullptr);
    return child;
}

bool ObjectBrowserFolder::didDeleteChildAt(unsigned long position)
{
    ObjectBrowserTreeItem *child = takeChildAt(position);
    delete child;
    return child != nullptr;
}

void ObjectBrowserFolder::removeAllChilren()
{
    qDeleteAll(m_children);
    m_children.clear();
}

void ObjectBrowserFolder::setIsDirty(bool dirty)
{
    ObjectBrowserTreeItem::setIsDirty(dirty);
    if (!dirty)
        return;
    for (ObjectBrowserTreeItem *child : qAsConst(m_children))
        child->setIsDirty(true);
}

ObjectBrowserTreeItem *ObjectBrowserFolder::itemWithID(const std::string &id)
{
    if (ObjectBrowserTreeItem *self = ObjectBrowserTreeItem::itemWithID(id))
        return self;
    for (ObjectBrowserTreeItem *child : qAsConst(m_children)) {
        if (ObjectBrowserTreeItem *found = child->itemWithID(id))
            return found;
    }
    return nullptr;
}

void ObjectBrowserFolder::path(QStringList *ids, QStringList *names) const
{
    QStringList i;
    QStringList n;
    for (const ObjectBrowserFolder *f = this; f && !f->isRoot(); f = f->parent()) {
        i.prepend(f->objectId());
        n.prepend(f->name());
    }
    if (ids)
        *ids = i;
    if (names)
        *names = n;
}

} // namespace vexa
