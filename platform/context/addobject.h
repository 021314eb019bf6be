#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>

#include <memory>
#include <vector>

namespace vexa {

class BaseObject;

// Stores new objects in a folder. An object without id gets one; an object with an id keeps it
// (copies from another store), which must not be taken.
class VEXA_CONTEXT_EXPORT AddObject : public Command
{
public:
    AddObject();
    ~AddObject() override;

    static QString typeId() { return QStringLiteral("AddObject"); }
    QString typeName() const override;
    std::vector<std::shared_ptr<BaseObject>> objects() const { return m_objects; }
    void setObjects(const std::vector<std::shared_ptr<BaseObject>> &objects) { m_objects = objects; }
    QString parentFolderId() const { return m_parentFolderId; }
    void setParentFolderId(const QString &parentFolderId) { m_parentFolderId = parentFolderId; }
    void setObject(const std::shared_ptr<BaseObject> &object) { m_objects = {object}; }
    std::shared_ptr<BaseObject> object() const { return m_objects.empty() ? nullptr : m_objects.front(); }

private:
    std::vector<std::shared_ptr<BaseObject>> m_objects;
    QString m_parentFolderId;
};

} // namespace vexa
