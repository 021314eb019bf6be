#pragma once

#include <vexa/vexa_export.h>

#include <QMetaType>
#include <QString>
#include <QStringList>

#include <memory>

namespace vexa {

// A place in an object store: the store (dispatcher id) and the folders from the root
// to it, as ids and as names. An empty path is the root folder.
class VEXA_EXPORT SelectedPath
{
public:
    SelectedPath() = default;
    SelectedPath(const QString &dispatcherId, const QStringList &path, const QStringList &stringPath = QStringList());

    QString dispatcherId() const { return m_dispatcherId; }
    void setDispatcherId(const QString &id) { m_dispatcherId = id; }
    // Folder ids from the root.
    QStringList path() const { return m_path; }
    void setPath(const QStringList &path) { m_path = path; }
    // The same folders by name (may be empty when unknown).
    QStringList stringPath() const { return m_stringPath; }
    void setStringPath(const QStringList &path) { m_stringPath = path; }
    bool isRoot() const { return m_path.isEmpty(); }

    // The readable path, "/Standards/Silver Trials"; "/" for the root.
    QString pathToString() const;
    // The ids joined by "/", the persisted form; fromIdString reads it back.
    QString idString() const;
    static QStringList fromIdString(const QString &text);
    static QString separator() { return QStringLiteral("/"); }

    bool operator==(const SelectedPath &other) const;
    bool operator!=(const SelectedPath &other) const { return !(*this == other); }

private:
    QString m_dispatcherId;
    QStringList m_path;
    QStringList m_stringPath;
};

} // namespace vexa

Q_DECLARE_METATYPE(std::shared_ptr<vexa::SelectedPath>)
