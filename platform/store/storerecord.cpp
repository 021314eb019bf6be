#include <store/storerecord.h>

namespace vexa {

QString StoreRecord::folderType()
{
    return QStringLiteral("Folder");
}

} // namespace vexa
