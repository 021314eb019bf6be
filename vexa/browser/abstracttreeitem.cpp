#include "abstracttreeitem.h"

namespace vexa {

AbstractTreeItem::AbstractTreeItem(AbstractTreeItem *parent)
    : QObject(nullptr)
    , m_parent(parent)
{
}

AbstractTreeItem::~AbstractTreeItem() = default;

QVariant AbstractTreeItem::data(int column, int role) const
{
    switch (role) {
    case Qt::DisplayRole:
        return QVariant(text(column));
    case Qt::DecorationRole:
        return QVariant(icon(column));
    default:
        return QVariant();
    }
}

std::vector<std::shared_ptr<AbstractTreeItem>> AbstractTreeItem::children() const
{
    return m_children;
}

QIcon AbstractTreeItem::icon(int) const
{
    return QIcon();
}

int AbstractTreeItem::row() const
{
    if (!m_parent)
        return 0;
    const auto &siblings = m_parent->m_children;
    for (size_t i = 0; i < siblings.size(); ++i) {
        if (siblings[i].get() == this)
            return int(i);
    }
    return 0;
}

AbstractTreeItem *AbstractTreeItem::child(int row) const
{
    return row >= 0 && row < childCount() ? m_children[size_t(row)].get() : nullptr;
}

int AbstractTreeItem::childCount() const
{
    return int(m_children.size());
}

void AbstractTreeItem::appendChild(std::shared_ptr<AbstractTreeItem> item)
{
    item->m_parent = this;
    m_children.push_back(std::move(item));
}

void AbstractTreeItem::clear()
{
    m_children.clear();
}

DefaultTreeItem::DefaultTreeItem(const std::string &text, AbstractTreeItem *parent)
    : AbstractTreeItem(parent)
    , m_text(QString::fromStdString(text))
{
}

DefaultTreeItem::~DefaultTreeItem() = default;

QString DefaultTreeItem::text(int column) const
{
    return column == 0 ? m_text : QString();
}

} // namespace vexa
