#include "globaldirentry.h"

#include "membertraits.h"

namespace vexa {

GlobalDirEntry::GlobalDirEntry(const DirEntry &entry)
{
    setDirEntry(entry);
}

const MemberList &GlobalDirEntry::staticMembers()
{
    using C = GlobalDirEntry;
    static const MemberList list(DirEntry::staticMembers(), {
        member("path", &C::path, &C::setPath),
        member("stringPath", &C::stringPath, &C::setStringPath),
        member("dispatcherID", &C::dispatcherID, &C::setDispatcherID),
        member("standardizedDispatcherID", &C::standardizedDispatcherID, &C::setStandardizedDispatcherID),
    });
    return list;
}

void GlobalDirEntry::setDirEntry(const DirEntry &entry)
{
    CopyContext context;
    for (const auto &m : DirEntry::staticMembers())
        m->copy(entry, *this, context);
    setIsStored(entry.isStored());
}

} // namespace vexa
