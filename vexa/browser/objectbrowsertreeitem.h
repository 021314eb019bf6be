#pragma once

#include <vexa/vexa_export.h>

#include <QIcon>
#include <QList>
#include <QString>

#include <memory>
#include <string>

namespace vexa {

class BaseObject;
class DirEntry;
class ObjectBrowserFolder;

// A row of the object browser: one directory entry of a store (a leaf object). The
// entry's header gives the name; the loaded object, when there is one, is kept beside.
class VEXA_EXPORT ObjectBrowserTreeItem
{
public:
    ObjectBrowserTreeItem(const std::string &name, ObjectBrowserFolder *parent, std::shared_ptr<DirEntry> entry);
    ObjectBrowserTreeItem(const ObjectBrowserTreeItem &) = delete;
    ObjectBrowserTreeItem &operator=(const ObjectBrowserTreeItem &) = delete;
    virtual ~ObjectBrowserTreeItem();

    QString name() const;
    void setName(const QString &name);
    // The header's creation time; empty when unknown.
    QString timestamp() const;
    // The directory entry's own id.
    QString id() const;
    // The id and type of the object the entry stands for.
    QString objectId() const;
    QString objectType() const;
    // The store of the entry (a GlobalDirEntry's dispatcher), else that of the parent folder.
    std::string dispatcherId() const;

    std::shared_ptr<DirEntry> dirEntry() const { return m_dirEntry; }
    void setDirEntry(const std::shared_ptr<DirEntry> &entry) { m_dirEntry = entry; }
    std::shared_ptr<BaseObject> object() const { return m_object; }
    void setObject(const std::shared_ptr<BaseObject> &object) { m_object = object; }

    ObjectBrowserFolder *parent() const { return m_parent; }
    void setParent(ObjectBrowserFolder *parent) { m_parent = parent; }
    // The position in the parent folder; -1 without parent.
    int row() const;
    int columnCount() const;

    // The type's icon for dark backgrounds; empty without an entry header.
    QIcon icon() const;

    virtual bool isFolder() const { return false; }
    bool isDirty() const { return m_isDirty; }
    virtual void setIsDirty(bool dirty);
    // This item when its entry's object id or the entry's own id equals id (an item
    // without entry matches only the empty id); null otherwise.
    virtual ObjectBrowserTreeItem *itemWithID(const std::string &id);

private:
    ObjectBrowserFolder *m_parent;       // Not owned.
    std::shared_ptr<DirEntry> m_dirEntry; // May be null.
    std::shared_ptr<BaseObject> m_object;
    bool m_isDirty = false;
};

// A folder row: owns its children. A folder is dirty until its entries are loaded, and
// again when it is marked for reloading.
class VEXA_EXPORT ObjectBrowserFolder : public ObjectBrowserTreeItem
{
public:
    ObjectBrowserFolder(const std::string &name, ObjectBrowserFolder *parent, std::shared_ptr<DirEntry> entry);
    ~ObjectBrowserFolder() override;

    bool isFolder() const override { return true; }
    int numberOfItems() const { return m_children.size(); }
    ObjectBrowserTreeItem *objectBrowserTreeItemAtPosition(int position) const;
    int rowOf(const ObjectBrowserTreeItem *item) const;
    void append(ObjectBrowserTreeItem *item);
    void insert(int position, ObjectBrowserTreeItem *item);
    // Takes the child out (the caller owns it); null for a bad position.
    ObjectBrowserTreeItem *takeChildAt(unsigned long position);
    // Takes the child out and deletes it; true when there was one.
    bool didDeleteChildAt(unsigned long position);
    void removeAllChilren();
    bool isRoot() const { return parent() == nullptr; }

    // Marking dirty marks the whole subtree; clearing clears this folder only.
    void setIsDirty(bool dirty) override;
    // Itself when it matches, else the first match below, depth first.
    ObjectBrowserTreeItem *itemWithID(const std::string &id) override;

    // Folder ids and names from the root to this folder (the root's own is not included).
    void path(QStringList *ids, QStringList *names) const;

private:
    QList<ObjectBrowserTreeItem *> m_children; // Owned.
};

} // namespace vexa
