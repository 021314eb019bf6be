#pragma once

#include <settings/settings_export.h>

#include <QString>
#include <QStringList>

// Most-recently-used values, newest first, without duplicates and cut to a
// maximum length. Its text form (toString/fromString) is a JSON array, so
// values may hold any characters.
class VEXA_SETTINGS_EXPORT RecentList
{
public:
    static constexpr int DefaultMaximumLength = 10;

    explicit RecentList(int maximumLength = DefaultMaximumLength);
    RecentList(const QStringList &values, int maximumLength = DefaultMaximumLength);

    QStringList values() const { return m_values; }
    // The newest value, empty when the list is empty.
    QString current() const;
    // Moves (or adds) the value to the front; empty values are ignored.
    void setCurrent(const QString &value);
    bool remove(const QString &value);
    void clear() { m_values.clear(); }
    bool isEmpty() const { return m_values.isEmpty(); }
    int size() const { return m_values.size(); }

    int maximumLength() const { return m_maximumLength; }
    // At least 1; the oldest values beyond it are dropped.
    void setMaximumLength(int length);

    QString toString() const;
    // A list from its text form; text that is not a JSON array of strings gives an empty list.
    static RecentList fromString(const QString &text, int maximumLength = DefaultMaximumLength);

    bool operator==(const RecentList &other) const
    {
        return m_values == other.m_values && m_maximumLength == other.m_maximumLength;
    }

private:
    void trim();

    QStringList m_values;
    int m_maximumLength;
};
