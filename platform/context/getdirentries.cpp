#include <context/getdirentries.h>

namespace vexa {

GetDirEntries::GetDirEntries() = default;
GetDirEntries::~GetDirEntries() = default;

QString GetDirEntries::typeName() const
{
    return typeId();
}

} // namespace vexa
