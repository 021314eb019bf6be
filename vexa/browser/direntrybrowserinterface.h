#pragma once

#include <vexa/vexa_export.h>

#include <QCoreApplication>
#include <QString>

#include <memory>
#include <string>

namespace vexa {

class BaseObject;
class GlobalDirEntry;

// What a host tells the folder tree of edited objects about the objects it edits: their
// kind (for menus and default names), how a new one is made and where it is saved.
class VEXA_EXPORT DirEntryBrowserInterface
{
    Q_DECLARE_TR_FUNCTIONS(vexa::DirEntryBrowserInterface)
public:
    // kind: the display name ("Tolerance set"); objectType: the type id of new objects.
    DirEntryBrowserInterface(const QString &kind, const std::string &objectType);
    virtual ~DirEntryBrowserInterface();

    QString objectKind() const { return m_kind; }
    std::string objectType() const { return m_objectType; }

    // The name of the next new object: the kind and a running number ("Tolerance set 2").
    virtual QString defaultNamedObjectName();
    // A new object of the type, named by defaultNamedObjectName(); null for types that
    // cannot be made.
    virtual std::shared_ptr<BaseObject> newNamedObject();
    // Where new objects are saved; null: the user is asked.
    virtual std::shared_ptr<GlobalDirEntry> defaultFolder() const { return m_defaultFolder; }
    void setDefaultFolder(const std::shared_ptr<GlobalDirEntry> &folder) { m_defaultFolder = folder; }

private:
    QString m_kind;
    std::string m_objectType;
    int m_created = 0;
    std::shared_ptr<GlobalDirEntry> m_defaultFolder;
};

} // namespace vexa
