#pragma once

#include <vexa/vexa_export.h>

#include <QIcon>
#include <QObject>
#include <QString>
#include <QVariant>

#include <memory>
#include <string>
#include <vector>

namespace vexa {

class AbstractTreeItemModel;

// One item of a generic read-only tree: answers a text and an icon per column.
// Items are held by std::shared_ptr (their model keeps them alive); the parent
// pointer does not own.
class VEXA_EXPORT AbstractTreeItem : public QObject
{
    Q_OBJECT
public:
    explicit AbstractTreeItem(AbstractTreeItem *parent = nullptr);
    ~AbstractTreeItem() override;

    // Qt::DisplayRole: text(column); Qt::DecorationRole: icon(column); else invalid.
    virtual QVariant data(int column, int role) const;
    // The children in display order.
    virtual std::vector<std::shared_ptr<AbstractTreeItem>> children() const;
    virtual QString text(int column) const = 0;
    // No icon unless a subclass draws one.
    virtual QIcon icon(int column) const;

    // The position among the parent's children (by address, from the front); 0 without
    // parent or when not found.
    int row() const;
    AbstractTreeItem *child(int row) const;
    int childCount() const;
    AbstractTreeItem *parent() const { return m_parent; }

private:
    friend class AbstractTreeItemModel;
    void appendChild(std::shared_ptr<AbstractTreeItem> item);
    virtual void clear();

    std::vector<std::shared_ptr<AbstractTreeItem>> m_children;
    AbstractTreeItem *m_parent; // Not owned.
};

// A tree item that shows one text in its first column.
class VEXA_EXPORT DefaultTreeItem : public AbstractTreeItem
{
    Q_OBJECT
public:
    DefaultTreeItem(const std::string &text, AbstractTreeItem *parent);
    ~DefaultTreeItem() override;

    QString text(int column) const override;

private:
    QString m_text;
};

} // namespace vexa
