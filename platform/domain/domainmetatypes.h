#pragma once

#include <domain/baseobject.h>
#include <domain/globaldirentry.h>

#include <QDataStream>

namespace vexa {

// Registers the domain's meta-types under their full names
// ("std::shared_ptr<vexa::BaseObject>", "std::shared_ptr<vexa::GlobalDirEntry>",
// "vexa::Geometry", ...) with data stream operators, so that objects travel in
// variants, queued signals and the item-model drag format. Safe to call repeatedly.
VEXA_DOMAIN_EXPORT void registerDomainMetaTypes();

// Objects are streamed in their stored form (Serialization); a null pointer as an
// empty byte array. Reading bad data gives a null pointer and a corrupt stream status.
VEXA_DOMAIN_EXPORT QDataStream &operator<<(QDataStream &stream, const std::shared_ptr<BaseObject> &object);
VEXA_DOMAIN_EXPORT QDataStream &operator>>(QDataStream &stream, std::shared_ptr<BaseObject> &object);
VEXA_DOMAIN_EXPORT QDataStream &operator<<(QDataStream &stream, const std::shared_ptr<GlobalDirEntry> &entry);
VEXA_DOMAIN_EXPORT QDataStream &operator>>(QDataStream &stream, std::shared_ptr<GlobalDirEntry> &entry);

} // namespace vexa
