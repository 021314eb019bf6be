#pragma once

#include <domain/direntry.h>

#include <QStringList>

namespace vexa {

// A directory entry together with where it lives: the store connection
// (dispatcher id) and the folder path from the root, as ids and as names.
class VEXA_DOMAIN_EXPORT GlobalDirEntry : public DirEntry
{
    VEXA_REFLECTABLE(GlobalDirEntry)
public:
    GlobalDirEntry() = default;
    explicit GlobalDirEntry(const DirEntry &entry);

    // Folder ids from the root to the entry's parent folder.
    QStringList path() const { return m_path; }
    void setPath(const QStringList &path) { m_path = path; }
    // The same folders by name.
    QStringList stringPath() const { return m_stringPath; }
    void setStringPath(const QStringList &path) { m_stringPath = path; }
    QString dispatcherID() const { return m_dispatcherID; }
    void setDispatcherID(const QString &id) { m_dispatcherID = id; }
    QString standardizedDispatcherID() const { return m_standardizedDispatcherID; }
    void setStandardizedDispatcherID(const QString &id) { m_standardizedDispatcherID = id; }

    // Takes every member of the directory entry (id, header, object id and type, parent).
    void setDirEntry(const DirEntry &entry);

private:
    QStringList m_path;
    QStringList m_stringPath;
    QString m_dispatcherID;
    QString m_standardizedDispatcherID;
};

} // namespace vexa

Q_DECLARE_METATYPE(std::shared_ptr<vexa::GlobalDirEntry>)
