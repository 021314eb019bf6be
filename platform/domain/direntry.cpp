#include "direntry.h"

#include "membertraits.h"

namespace vexa {

const MemberList &DirEntry::staticMembers()
{
    static const MemberList list(BaseObject::staticMembers(), {
        member("entryObjectId", &DirEntry::entryObjectId, &DirEntry::setEntryObjectId),
        member("entryObjectType", &DirEntry::entryObjectType, &DirEntry::setEntryObjectType),
        member("parentFolderId", &DirEntry::parentFolderId, &DirEntry::setParentFolderId),
    });
    return list;
}

void DirEntry::setEntryInfo(const BaseObject &object)
{
    setEntryInfo(object.id(), object.typeName(), object.header());
}

void DirEntry::setEntryInfo(const QString &objectId, const QString &objectType, const Header &header)
{
    m_entryObjectId = objectId;
    m_entryObjectType = objectType;
    setHeader(header);
}

} // namespace vexa
