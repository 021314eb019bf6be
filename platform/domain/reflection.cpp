#include "reflection.h"

#include "baseobject.h"
#include "classregistration.h"
#include "copycontext.h"
#include "readcontext.h"
#include "reflectable.h"
#include "samplecontext.h"

#include <QJsonArray>
#include <QtNumeric>

#include <cmath>
#include <cstring>

namespace vexa {
namespace Reflection {

namespace {
const QString kType = QStringLiteral("$type");
}

QJsonObject writeMembers(const Reflectable &object)
{
    QJsonObject json;
    for (const auto &m : object.members())
        json.insert(m->name(), m->write(object));
    return json;
}

QJsonObject writeTypedObject(const Reflectable &object)
{
    QJsonObject json = writeMembers(object);
    json.insert(kType, object.typeName());
    return json;
}

bool readMembers(Reflectable &object, const QJsonObject &json, ReadContext &context)
{
    for (const auto &m : object.members()) {
        const auto it = json.constFind(m->name());
        if (it == json.constEnd())
            continue;
        context.pushMember(m->name());
        const bool ok = m->read(object, it.value(), context);
        context.pop();
        if (!ok)
            return false;
    }
    return true;
}

std::shared_ptr<Reflectable> readTypedObject(const QJsonValue &json, ReadContext &context)
{
    if (!json.isObject()) {
        context.fail(QStringLiteral("expected an object"));
        return nullptr;
    }
    const QJsonObject o = json.toObject();
    const QJsonValue type = o.value(kType);
    if (!type.isString()) {
        context.fail(QStringLiteral("missing \"$type\""));
        return nullptr;
    }
    auto object = ClassRegistration::instance().create(type.toString());
    if (!object) {
        context.fail(QStringLiteral("unknown type \"%1\"").arg(type.toString()));
        return nullptr;
    }
    if (!readMembers(*object, o, context))
        return nullptr;
    return object;
}

std::shared_ptr<Reflectable> deepCopy(const Reflectable &object, CopyContext &context)
{
    if (auto done = context.copyOf(&object))
        return done;
    auto copy = object.createInstance();
    context.remember(&object, copy);
    copyMembers(object, *copy, context);
    if (auto base = dynamic_cast<const BaseObject *>(&object)) {
        auto target = static_cast<BaseObject *>(copy.get());
        target->setIsStored(base->isStored());
        target->setIsStub(base->isStub());
    }
    return copy;
}

std::shared_ptr<Reflectable> deepCopy(const Reflectable &object)
{
    CopyContext context;
    return deepCopy(object, context);
}

void copyMembers(const Reflectable &from, Reflectable &to, CopyContext &context)
{
    for (const auto &m : from.members())
        m->copy(from, to, context);
}

bool equal(const Reflectable &a, const Reflectable &b, QString *difference)
{
    if (a.typeName() != b.typeName()) {
        if (difference)
            *difference = QStringLiteral("%1: type differs from %2").arg(a.typeName(), b.typeName());
        return false;
    }
    for (const auto &m : a.members()) {
        QString sub;
        if (!m->equal(a, b, &sub)) {
            if (difference)
                *difference = a.typeName() + QLatin1Char('.') + m->name() + sub;
            return false;
        }
    }
    return true;
}

void fillWithSamples(Reflectable &object, SampleContext &context)
{
    for (const auto &m : object.members())
        m->fillSample(object, context);
}

std::vector<std::shared_ptr<BaseObject>> references(const Reflectable &object)
{
    std::vector<std::shared_ptr<BaseObject>> out;
    for (const auto &m : object.members())
        m->collectReferences(object, out);
    return out;
}

std::vector<std::shared_ptr<Reflectable>> instancesOfKind(const std::function<bool(const Reflectable &)> &isKind)
{
    std::vector<std::shared_ptr<Reflectable>> out;
    const auto &registration = ClassRegistration::instance();
    for (const QString &name : registration.typeNames()) {
        auto object = registration.create(name);
        if (object && isKind(*object))
            out.push_back(object);
    }
    return out;
}

QJsonValue doubleToJson(double value)
{
    if (std::isnan(value))
        return QStringLiteral("NaN");
    if (std::isinf(value))
        return value > 0 ? QStringLiteral("Infinity") : QStringLiteral("-Infinity");
    if (value == 0.0 && std::signbit(value))
        return QStringLiteral("-0");
    return value;
}

bool doubleFromJson(const QJsonValue &json, double &value)
{
    if (json.isDouble()) {
        value = json.toDouble();
        return true;
    }
    const QString s = json.toString();
    if (s == QLatin1String("NaN"))
        value = qQNaN();
    else if (s == QLatin1String("Infinity"))
        value = qInf();
    else if (s == QLatin1String("-Infinity"))
        value = -qInf();
    else if (s == QLatin1String("-0"))
        value = -0.0;
    else
        return false;
    return true;
}

bool sameDouble(double a, double b)
{
    if (std::isnan(a) || std::isnan(b))
        return std::isnan(a) && std::isnan(b);
    return std::memcmp(&a, &b, sizeof(double)) == 0;
}

} // namespace Reflection
} // namespace vexa
