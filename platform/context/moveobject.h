#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>

#include <memory>

namespace vexa {

// Moves an object (a folder with its contents) into another folder.
class VEXA_CONTEXT_EXPORT MoveObject : public Command
{
public:
    MoveObject();
    ~MoveObject() override;

    static QString typeId() { return QStringLiteral("MoveObject"); }
    QString typeName() const override;
    QString id() const { return m_id; }
    void setId(const QString &id) { m_id = id; }
    QString targetFolderId() const { return m_targetFolderId; }
    void setTargetFolderId(const QString &targetFolderId) { m_targetFolderId = targetFolderId; }

private:
    QString m_id;
    QString m_targetFolderId;
};

} // namespace vexa
