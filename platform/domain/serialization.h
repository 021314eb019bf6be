#pragma once

#include <domain/domain_export.h>

#include <QByteArray>
#include <QJsonObject>
#include <QString>

#include <memory>

namespace vexa {

class BaseObject;
class Reflectable;

// The stored form of objects: UTF-8 JSON in an envelope
//   {"format": 2, "type": "Trial", "object": {...members...}}
// Owned nested objects carry "$type"; references to other stored objects are
// {"$ref": id, "$type": type}. Doubles are written so that they read back exactly;
// NaN and infinities as the strings "NaN", "Infinity", "-Infinity" (and -0.0 as
// "-0"), byte arrays as base64. Older format versions are migrated on reading.
// Reading is all or nothing: on any error the result is null and the error names
// the JSON offset or the member path where the input broke.
class VEXA_DOMAIN_EXPORT Serialization
{
public:
    static constexpr int FormatVersion = 2;
    static constexpr int OldestFormatVersion = 1;

    static QJsonObject toEnvelope(const Reflectable &object);
    static QByteArray toBytes(const Reflectable &object);

    // A stored object; null with error set when bytes do not hold one.
    static std::shared_ptr<BaseObject> fromBytes(const QByteArray &bytes, QString *error = nullptr);
    // Any registered object (stored objects and value objects alike).
    static std::shared_ptr<Reflectable> readAny(const QByteArray &bytes, QString *error = nullptr,
                                                int *formatVersion = nullptr);
    static std::shared_ptr<Reflectable> fromEnvelope(const QJsonObject &envelope, QString *error = nullptr,
                                                     int *formatVersion = nullptr);

    // Rewrites the object part of an envelope of format fromVersion to the current format.
    static void migrate(QJsonObject &object, int fromVersion);
};

} // namespace vexa
