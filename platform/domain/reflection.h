#pragma once

#include <domain/domain_export.h>

#include <QJsonObject>
#include <QJsonValue>

#include <memory>
#include <vector>

namespace vexa {

class BaseObject;
class CopyContext;
class ReadContext;
class Reflectable;
class SampleContext;

// The generic operations over described members. The member traits call these
// for nested objects; callers normally use Serialization or the object methods.
namespace Reflection {

// Members as a JSON object (no type tag).
VEXA_DOMAIN_EXPORT QJsonObject writeMembers(const Reflectable &object);
// Members plus "$type": the form of an owned, possibly derived, nested object.
VEXA_DOMAIN_EXPORT QJsonObject writeTypedObject(const Reflectable &object);
// Reads every member present in json into object. Missing members keep their
// defaults; members of the wrong kind fail with the path.
VEXA_DOMAIN_EXPORT bool readMembers(Reflectable &object, const QJsonObject &json, ReadContext &context);
// Reads a "$type"-tagged object; null (and an error in context) on failure.
VEXA_DOMAIN_EXPORT std::shared_ptr<Reflectable> readTypedObject(const QJsonValue &json, ReadContext &context);

VEXA_DOMAIN_EXPORT std::shared_ptr<Reflectable> deepCopy(const Reflectable &object, CopyContext &context);
VEXA_DOMAIN_EXPORT std::shared_ptr<Reflectable> deepCopy(const Reflectable &object);
VEXA_DOMAIN_EXPORT void copyMembers(const Reflectable &from, Reflectable &to, CopyContext &context);

VEXA_DOMAIN_EXPORT bool equal(const Reflectable &a, const Reflectable &b, QString *difference = nullptr);

// Sets every member to a non-default value generated from its kind (owned
// objects and lists get objects of every registered kind that fits). For tests.
VEXA_DOMAIN_EXPORT void fillWithSamples(Reflectable &object, SampleContext &context);

// The stored objects that object and its owned sub-objects refer to.
VEXA_DOMAIN_EXPORT std::vector<std::shared_ptr<BaseObject>> references(const Reflectable &object);

// The registered concrete classes that derive from the class tested by isKind.
VEXA_DOMAIN_EXPORT std::vector<std::shared_ptr<Reflectable>>
instancesOfKind(const std::function<bool(const Reflectable &)> &isKind);

// JSON of doubles that may be NaN or infinite: numbers, or "NaN", "Infinity", "-Infinity".
VEXA_DOMAIN_EXPORT QJsonValue doubleToJson(double value);
VEXA_DOMAIN_EXPORT bool doubleFromJson(const QJsonValue &json, double &value);
// Doubles compared so that NaN equals NaN and 0.0 differs from -0.0.
VEXA_DOMAIN_EXPORT bool sameDouble(double a, double b);

} // namespace Reflection
} // namespace vexa
