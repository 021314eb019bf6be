#include "recentlist.h"

#include <QJsonArray>
#include <QJsonDocument>

#include <algorithm>

RecentList::RecentList(int maximumLength)
    : m_maximumLength(std::max(1, maximumLength))
{
}

RecentList::RecentList(const QStringList &values, int maximumLength)
    : m_maximumLength(std::max(1, maximumLength))
{
    for (auto it = values.crbegin(); it != values.crend(); ++it)
        setCurrent(*it);
}

QString RecentList::current() const
{
    return m_values.isEmpty() ? QString() : m_values.first();
}

void RecentList::setCurrent(const QString &value)
{
    if (value.isEmpty())
        return;
    m_values.removeAll(value);
    m_values.prepend(value);
    trim();
}

bool RecentList::remove(const QString &value)
{
    return m_values.removeAll(value) > 0;
}

void RecentList::setMaximumLength(int length)
{
    m_maximumLength = std::max(1, length);
    trim();
}

QString RecentList::toString() const
{
    return QString::fromUtf8(QJsonDocument(QJsonArray::fromStringList(m_values)).toJson(QJsonDocument::Compact));
}

RecentList RecentList::fromString(const QString &text, int maximumLength)
{
    RecentList list(maximumLength);
    const QJsonDocument document = QJsonDocument::fromJson(text.toUtf8());
    if (!document.isArray())
        return list;
    const QJsonArray array = document.array();
    QStringList values;
    for (const QJsonValue &value : array) {
        if (!value.isString())
            return RecentList(maximumLength);
        values.append(value.toString());
    }
    return RecentList(values, maximumLength);
}

void RecentList::trim()
{
    while (m_values.size() > m_maximumLength)
        m_values.removeLast();
}
