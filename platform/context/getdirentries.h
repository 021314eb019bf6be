#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>
#include <QStringList>

#include <memory>

namespace vexa {

// Lists the entries of a folder (the root folder for an empty id), optionally only of some types.
class VEXA_CONTEXT_EXPORT GetDirEntries : public Command
{
public:
    GetDirEntries();
    ~GetDirEntries() override;

    static QString typeId() { return QStringLiteral("GetDirEntries"); }
    QString typeName() const override;
    QString parentFolderId() const { return m_parentFolderId; }
    void setParentFolderId(const QString &parentFolderId) { m_parentFolderId = parentFolderId; }
    QStringList types() const { return m_types; }
    void setTypes(const QStringList &types) { m_types = types; }
    // One type; the same as setTypes({type}).
    void setType(const QString &type) { m_types = QStringList{type}; }
    QString type() const { return m_types.isEmpty() ? QString() : m_types.first(); }

private:
    QString m_parentFolderId;
    QStringList m_types;
};

} // namespace vexa
