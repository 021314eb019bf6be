#pragma once

#include <store/errorinfo.h>
#include <store/storerecord.h>
#include <store/store_export.h>

#include <memory>

namespace vexa {

class BaseObject;
class DirEntry;

// Converts domain objects to store records and back. The record's id, uuid and
// version are authoritative: they are set on every object read, whatever its
// stored form says (a copy keeps its original's bytes under a new id).
class VEXA_STORE_EXPORT ObjectCodec
{
public:
    static bool toRecord(const BaseObject &object, StoreRecord *record, ErrorInfo *error);
    // The object, marked stored and not a stub; null with *error on a broken row.
    static std::shared_ptr<BaseObject> fromRecord(const StoreRecord &record, ErrorInfo *error);
    // Reads a record into an existing object of the same type (a stub being
    // replaced by its full object), in place.
    static bool readInto(const StoreRecord &record, BaseObject *object, ErrorInfo *error);
    static std::shared_ptr<DirEntry> toDirEntry(const StoreRecord &record);
};

} // namespace vexa
