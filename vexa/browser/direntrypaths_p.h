#pragma once

#include <memory>

namespace vexa {

class GlobalDirEntry;

// Where entries live: the store and the folder path of an entry placed inside a folder
// entry, and the folder entry that holds an entry (the store's top for an entry there).
void placeInside(GlobalDirEntry &entry, const GlobalDirEntry &folder);
std::shared_ptr<GlobalDirEntry> folderHolding(const GlobalDirEntry &entry);

} // namespace vexa
