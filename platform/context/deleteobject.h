#pragma once

#include <context/command.h>
#include <context/context_export.h>

#include <QString>
#include <QStringList>

#include <memory>

namespace vexa {

// Deletes objects. A non-empty folder is refused unless the command is recursive.
class VEXA_CONTEXT_EXPORT DeleteObject : public Command
{
public:
    DeleteObject();
    ~DeleteObject() override;

    static QString typeId() { return QStringLiteral("DeleteObject"); }
    QString typeName() const override;
    QStringList ids() const { return m_ids; }
    void setIds(const QStringList &ids) { m_ids = ids; }
    QString objectType() const { return m_objectType; }
    void setObjectType(const QString &objectType) { m_objectType = objectType; }
    bool recursive() const { return m_recursive; }
    void setRecursive(bool recursive) { m_recursive = recursive; }
    void setId(const QString &id) { m_ids = QStringList{id}; }
    QString id() const { return m_ids.isEmpty() ? QString() : m_ids.first(); }

private:
    QStringList m_ids;
    QString m_objectType;
    bool m_recursive = false;
};

} // namespace vexa
