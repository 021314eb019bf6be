#include "serialization.h"

#include "baseobject.h"
#include "classregistration.h"
#include "readcontext.h"
#include "reflectable.h"
#include "reflection.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonParseError>

namespace vexa {

namespace {

const QString kFormat = QStringLiteral("format");
const QString kType = QStringLiteral("type");
const QString kObject = QStringLiteral("object");

void setError(QString *error, const QString &message)
{
    if (error)
        *error = message;
}

// Format 1 wrote references as {"ref": id, "refType": type} and the header's
// creation time as "created".
QJsonValue migrateFrom1(const QJsonValue &value)
{
    if (value.isArray()) {
        QJsonArray out;
        for (const QJsonValue &v : value.toArray())
            out.append(migrateFrom1(v));
        return out;
    }
    if (!value.isObject())
        return value;
    QJsonObject o = value.toObject();
    if (o.size() == 2 && o.contains(QStringLiteral("ref")) && o.contains(QStringLiteral("refType"))) {
        QJsonObject ref;
        ref.insert(QStringLiteral("$ref"), o.value(QStringLiteral("ref")));
        ref.insert(QStringLiteral("$type"), o.value(QStringLiteral("refType")));
        return ref;
    }
    for (auto it = o.begin(); it != o.end(); ++it) {
        QJsonValue v = migrateFrom1(it.value());
        if (it.key() == QLatin1String("header") && v.isObject()) {
            QJsonObject header = v.toObject();
            if (header.contains(QStringLiteral("created"))) {
                header.insert(QStringLiteral("creationTimestamp"), header.take(QStringLiteral("created")));
                v = header;
            }
        }
        it.value() = v;
    }
    return o;
}

} // namespace

QJsonObject Serialization::toEnvelope(const Reflectable &object)
{
    QJsonObject envelope;
    envelope.insert(kFormat, FormatVersion);
    envelope.insert(kType, object.typeName());
    envelope.insert(kObject, Reflection::writeMembers(object));
    return envelope;
}

QByteArray Serialization::toBytes(const Reflectable &object)
{
    return QJsonDocument(toEnvelope(object)).toJson(QJsonDocument::Indented);
}

std::shared_ptr<BaseObject> Serialization::fromBytes(const QByteArray &bytes, QString *error)
{
    QString message;
    auto object = readAny(bytes, &message);
    if (!object) {
        setError(error, message);
        return nullptr;
    }
    auto stored = std::dynamic_pointer_cast<BaseObject>(object);
    if (!stored) {
        setError(error, QStringLiteral("%1 is not a stored object type").arg(object->typeName()));
        return nullptr;
    }
    setError(error, QString());
    return stored;
}

std::shared_ptr<Reflectable> Serialization::readAny(const QByteArray &bytes, QString *error, int *formatVersion)
{
    if (bytes.trimmed().isEmpty()) {
        setError(error, QStringLiteral("empty data"));
        return nullptr;
    }
    QJsonParseError parseError;
    const QJsonDocument document = QJsonDocument::fromJson(bytes, &parseError);
    if (parseError.error != QJsonParseError::NoError) {
        setError(error, QStringLiteral("JSON parse error at offset %1: %2").arg(parseError.offset).arg(parseError.errorString()));
        return nullptr;
    }
    if (!document.isObject()) {
        setError(error, QStringLiteral("missing envelope: expected a JSON object with \"format\", \"type\" and \"object\""));
        return nullptr;
    }
    return fromEnvelope(document.object(), error, formatVersion);
}

std::shared_ptr<Reflectable> Serialization::fromEnvelope(const QJsonObject &envelope, QString *error, int *formatVersion)
{
    const QJsonValue format = envelope.value(kFormat);
    if (!format.isDouble() || !envelope.value(kType).isString() || !envelope.contains(kObject)) {
        setError(error, QStringLiteral("missing envelope: expected a JSON object with \"format\", \"type\" and \"object\""));
        return nullptr;
    }
    const double f = format.toDouble();
    if (f != double(int(f)) || f < OldestFormatVersion) {
        setError(error, QStringLiteral("invalid format version %1").arg(f));
        return nullptr;
    }
    const int version = int(f);
    if (version > FormatVersion) {
        setError(error, QStringLiteral("format version %1 is newer than the newest supported version %2")
                            .arg(version).arg(FormatVersion));
        return nullptr;
    }
    const QString type = envelope.value(kType).toString();
    auto object = ClassRegistration::instance().create(type);
    if (!object) {
        setError(error, QStringLiteral("unknown type \"%1\"").arg(type));
        return nullptr;
    }
    QJsonValue body = envelope.value(kObject);
    if (!body.isObject()) {
        setError(error, QStringLiteral("%1: expected an object").arg(type));
        return nullptr;
    }
    QJsonObject members = body.toObject();
    migrate(members, version);
    ReadContext context(version);
    context.pushMember(type);
    if (!Reflection::readMembers(*object, members, context)) {
        setError(error, context.error());
        return nullptr;
    }
    if (formatVersion)
        *formatVersion = version;
    setError(error, QString());
    return object;
}

void Serialization::migrate(QJsonObject &object, int fromVersion)
{
    if (fromVersion < 2)
        object = migrateFrom1(object).toObject();
}

} // namespace vexa
