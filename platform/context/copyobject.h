#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>

#include <memory>

namespace vexa {

// Copies an object (a folder with its contents) into a folder; the copies get new ids.
class VEXA_CONTEXT_EXPORT CopyObject : public Command
{
public:
    CopyObject();
    ~CopyObject() override;

    static QString typeId() { return QStringLiteral("CopyObject"); }
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
