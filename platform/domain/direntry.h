#pragma once

#include <domain/baseobject.h>

namespace vexa {

// An entry of a folder: which object (id and type) and its header (name,
// description, creation), so that folders list without loading the objects.
class VEXA_DOMAIN_EXPORT DirEntry : public BaseObject
{
    VEXA_REFLECTABLE(DirEntry)
public:
    QString entryObjectId() const { return m_entryObjectId; }
    void setEntryObjectId(const QString &id) { m_entryObjectId = id; }
    QString entryObjectType() const { return m_entryObjectType; }
    void setEntryObjectType(const QString &type) { m_entryObjectType = type; }
    QString parentFolderId() const { return m_parentFolderId; }
    void setParentFolderId(const QString &id) { m_parentFolderId = id; }

    // Takes id, type and header from the object.
    void setEntryInfo(const BaseObject &object);
    void setEntryInfo(const QString &objectId, const QString &objectType, const Header &header);

private:
    QString m_entryObjectId;
    QString m_entryObjectType;
    QString m_parentFolderId;
};

} // namespace vexa
