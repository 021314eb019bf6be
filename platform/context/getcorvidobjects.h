#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>
#include <QStringList>

#include <memory>

namespace vexa {

// Loads several objects: the given ids, or else everything in a folder (optionally of one type).
class VEXA_CONTEXT_EXPORT GetCorvidObjects : public Command
{
public:
    GetCorvidObjects();
    ~GetCorvidObjects() override;

    static QString typeId() { return QStringLiteral("GetCorvidObjects"); }
    QString typeName() const override;
    QStringList ids() const { return m_ids; }
    void setIds(const QStringList &ids) { m_ids = ids; }
    QString parentFolderId() const { return m_parentFolderId; }
    void setParentFolderId(const QString &parentFolderId) { m_parentFolderId = parentFolderId; }
    QString type() const { return m_type; }
    void setType(const QString &type) { m_type = type; }

private:
    QStringList m_ids;
    QString m_parentFolderId;
    QString m_type;
};

} // namespace vexa
