#pragma once

// How each kind of member is stored, copied, compared, shown and sampled, and the
// helpers member() and reference() that make one MemberDescriptor from a getter
// and a setter. Included by the classes' source files only.

#include <domain/baseobject.h>
#include <domain/classregistration.h>
#include <domain/colorimetriccondition.h>
#include <domain/copycontext.h>
#include <domain/geometry.h>
#include <domain/memberdescriptor.h>
#include <domain/readcontext.h>
#include <domain/reflectable.h>
#include <domain/reflection.h>
#include <domain/samplecontext.h>

#include <utilities/timestamp.h>

#include <QJsonArray>
#include <QJsonObject>
#include <QStringList>
#include <QUuid>
#include <QVector>

#include <QtNumeric>

#include <limits>
#include <type_traits>

namespace vexa {
namespace detail {

inline QString jsonTypeName(const QJsonValue &v)
{
    switch (v.type()) {
    case QJsonValue::Null: return QStringLiteral("null");
    case QJsonValue::Bool: return QStringLiteral("a boolean");
    case QJsonValue::Double: return QStringLiteral("a number");
    case QJsonValue::String: return QStringLiteral("a string");
    case QJsonValue::Array: return QStringLiteral("an array");
    case QJsonValue::Object: return QStringLiteral("an object");
    case QJsonValue::Undefined: break;
    }
    return QStringLiteral("nothing");
}

inline bool expected(ReadContext &context, const char *what, const QJsonValue &got)
{
    return context.fail(QStringLiteral("expected %1, found %2").arg(QLatin1String(what), jsonTypeName(got)));
}

template<class V>
QString differ(const V &, const V &)
{
    return QStringLiteral(": values differ");
}

// Defaults for plain values: copied by value, no references, no owned objects.
template<class V>
struct PlainTraits
{
    static V copy(const V &v, CopyContext &) { return v; }
    static bool equal(const V &a, const V &b, QString *difference)
    {
        if (a == b)
            return true;
        if (difference)
            *difference = QStringLiteral(": ") + QVariant::fromValue(a).toString() + QStringLiteral(" != ")
                + QVariant::fromValue(b).toString();
        return false;
    }
    static QVariant toVariant(const V &v) { return QVariant::fromValue(v); }
    static void references(const V &, std::vector<std::shared_ptr<BaseObject>> &) {}
    static void owned(const V &, const std::function<void(const Reflectable &)> &) {}
};

template<class V, class Enable = void>
struct MemberTraits;

template<>
struct MemberTraits<bool> : PlainTraits<bool>
{
    static constexpr MemberKind kind = MemberKind::Bool;
    static QString innerType() { return QString(); }
    static QJsonValue write(bool v) { return v; }
    static bool read(const QJsonValue &j, bool &v, ReadContext &c)
    {
        if (!j.isBool())
            return expected(c, "a boolean", j);
        v = j.toBool();
        return true;
    }
    static bool sample(SampleContext &) { return true; }
};

template<>
struct MemberTraits<int> : PlainTraits<int>
{
    static constexpr MemberKind kind = MemberKind::Int;
    static QString innerType() { return QString(); }
    static QJsonValue write(int v) { return v; }
    static bool read(const QJsonValue &j, int &v, ReadContext &c)
    {
        const double d = j.toDouble();
        if (!j.isDouble() || d != double(int(d)) || d < -2147483648.0 || d > 2147483647.0)
            return j.isDouble() ? c.fail(QStringLiteral("expected an integer, found %1").arg(d))
                                : expected(c, "an integer", j);
        v = int(d);
        return true;
    }
    static int sample(SampleContext &c) { return 7 + c.next(); }
};

template<>
struct MemberTraits<unsigned char> : PlainTraits<unsigned char>
{
    static constexpr MemberKind kind = MemberKind::Byte;
    static QString innerType() { return QString(); }
    static QJsonValue write(unsigned char v) { return int(v); }
    static bool read(const QJsonValue &j, unsigned char &v, ReadContext &c)
    {
        const double d = j.toDouble();
        if (!j.isDouble() || d != double(int(d)) || d < 0 || d > 255)
            return expected(c, "an integer from 0 to 255", j);
        v = static_cast<unsigned char>(d);
        return true;
    }
    static unsigned char sample(SampleContext &c) { return static_cast<unsigned char>(1 + c.next() % 250); }
};

template<>
struct MemberTraits<double> : PlainTraits<double>
{
    static constexpr MemberKind kind = MemberKind::Double;
    static QString innerType() { return QString(); }
    static QJsonValue write(double v) { return Reflection::doubleToJson(v); }
    static bool read(const QJsonValue &j, double &v, ReadContext &c)
    {
        return Reflection::doubleFromJson(j, v) || expected(c, "a number", j);
    }
    static bool equal(double a, double b, QString *difference)
    {
        if (Reflection::sameDouble(a, b))
            return true;
        if (difference)
            *difference = QStringLiteral(": %1 != %2").arg(a, 0, 'g', 17).arg(b, 0, 'g', 17);
        return false;
    }
    // Values with a long binary expansion, so that a lossy writer shows.
    static double sample(SampleContext &c) { return 0.1 * c.next() + 1.0 / 3.0; }
};

template<>
struct MemberTraits<QString> : PlainTraits<QString>
{
    static constexpr MemberKind kind = MemberKind::String;
    static QString innerType() { return QString(); }
    static QJsonValue write(const QString &v) { return v; }
    static bool read(const QJsonValue &j, QString &v, ReadContext &c)
    {
        if (!j.isString())
            return expected(c, "a string", j);
        v = j.toString();
        return true;
    }
    static QString sample(SampleContext &c) { return QStringLiteral("text \u00e9\"%1\"").arg(c.next()); }
};

template<>
struct MemberTraits<QStringList> : PlainTraits<QStringList>
{
    static constexpr MemberKind kind = MemberKind::StringList;
    static QString innerType() { return QStringLiteral("QString"); }
    static QJsonValue write(const QStringList &v) { return QJsonArray::fromStringList(v); }
    static bool read(const QJsonValue &j, QStringList &v, ReadContext &c)
    {
        if (!j.isArray())
            return expected(c, "an array", j);
        QStringList out;
        const QJsonArray a = j.toArray();
        for (int i = 0; i < a.size(); ++i) {
            if (!a.at(i).isString()) {
                c.pushIndex(i);
                expected(c, "a string", a.at(i));
                c.pop();
                return false;
            }
            out.append(a.at(i).toString());
        }
        v = out;
        return true;
    }
    static bool equal(const QStringList &a, const QStringList &b, QString *difference)
    {
        if (a == b)
            return true;
        if (difference)
            *difference = QStringLiteral(": [%1] != [%2]").arg(a.join(QLatin1Char(',')), b.join(QLatin1Char(',')));
        return false;
    }
    static QStringList sample(SampleContext &c)
    {
        return {QStringLiteral("first %1").arg(c.next()), QString(), QStringLiteral("third")};
    }
};

template<>
struct MemberTraits<QVector<double>> : PlainTraits<QVector<double>>
{
    static constexpr MemberKind kind = MemberKind::DoubleVector;
    static QString innerType() { return QStringLiteral("double"); }
    static QJsonValue write(const QVector<double> &v)
    {
        QJsonArray a;
        for (double d : v)
            a.append(Reflection::doubleToJson(d));
        return a;
    }
    static bool read(const QJsonValue &j, QVector<double> &v, ReadContext &c)
    {
        if (!j.isArray())
            return expected(c, "an array", j);
        const QJsonArray a = j.toArray();
        QVector<double> out(a.size());
        for (int i = 0; i < a.size(); ++i) {
            if (!Reflection::doubleFromJson(a.at(i), out[i])) {
                c.pushIndex(i);
                expected(c, "a number", a.at(i));
                c.pop();
                return false;
            }
        }
        v = out;
        return true;
    }
    static bool equal(const QVector<double> &a, const QVector<double> &b, QString *difference)
    {
        if (a.size() != b.size()) {
            if (difference)
                *difference = QStringLiteral(": %1 values != %2 values").arg(a.size()).arg(b.size());
            return false;
        }
        for (int i = 0; i < a.size(); ++i) {
            if (!Reflection::sameDouble(a.at(i), b.at(i))) {
                if (difference)
                    *difference = QStringLiteral("[%1]: %2 != %3").arg(i).arg(a.at(i), 0, 'g', 17).arg(b.at(i), 0, 'g', 17);
                return false;
            }
        }
        return true;
    }
    static QVariant toVariant(const QVector<double> &v)
    {
        QVariantList l;
        for (double d : v)
            l.append(d);
        return l;
    }
    static QVector<double> sample(SampleContext &c)
    {
        const double base = c.next();
        return {base / 7.0, 0.1, -0.0, qQNaN(), qInf(), -qInf(), 1e-310, 1.7976931348623157e308};
    }
};

template<>
struct MemberTraits<QByteArray> : PlainTraits<QByteArray>
{
    static constexpr MemberKind kind = MemberKind::ByteArray;
    static QString innerType() { return QString(); }
    static QJsonValue write(const QByteArray &v) { return QString::fromLatin1(v.toBase64()); }
    static bool read(const QJsonValue &j, QByteArray &v, ReadContext &c)
    {
        if (!j.isString())
            return expected(c, "a base64 string", j);
        const auto result = QByteArray::fromBase64Encoding(j.toString().toLatin1(),
                                                           QByteArray::AbortOnBase64DecodingErrors);
        if (!result)
            return c.fail(QStringLiteral("invalid base64 data"));
        v = result.decoded;
        return true;
    }
    static bool equal(const QByteArray &a, const QByteArray &b, QString *difference)
    {
        if (a == b)
            return true;
        if (difference)
            *difference = QStringLiteral(": %1 bytes != %2 bytes (or different content)").arg(a.size()).arg(b.size());
        return false;
    }
    static QByteArray sample(SampleContext &c)
    {
        QByteArray b(300, '\0');
        for (int i = 0; i < b.size(); ++i)
            b[i] = char((i * 31 + c.next()) & 0xff);
        return b;
    }
};

template<>
struct MemberTraits<Timestamp> : PlainTraits<Timestamp>
{
    static constexpr MemberKind kind = MemberKind::Timestamp;
    static QString innerType() { return QString(); }
    static QJsonValue write(const Timestamp &v) { return v.toString(); }
    static bool read(const QJsonValue &j, Timestamp &v, ReadContext &c)
    {
        if (!j.isString())
            return expected(c, "a timestamp string", j);
        bool ok = false;
        const Timestamp t = Timestamp::fromString(j.toString(), &ok);
        if (!ok)
            return c.fail(QStringLiteral("invalid timestamp \"%1\"").arg(j.toString()));
        v = t;
        return true;
    }
    static bool equal(const Timestamp &a, const Timestamp &b, QString *difference)
    {
        if (a == b)
            return true;
        if (difference)
            *difference = QStringLiteral(": %1 != %2").arg(a.toString(), b.toString());
        return false;
    }
    static QVariant toVariant(const Timestamp &v) { return v.toString(); }
    static Timestamp sample(SampleContext &c) { return Timestamp(2024, 1 + c.next() % 12, 28, 13, 59, c.next() % 60); }
};

template<>
struct MemberTraits<Geometry> : PlainTraits<Geometry>
{
    static constexpr MemberKind kind = MemberKind::Geometry;
    static QString innerType() { return QString(); }
    static QJsonValue write(const Geometry &v) { return v.toString(); }
    static bool read(const QJsonValue &j, Geometry &v, ReadContext &c)
    {
        if (!j.isString())
            return expected(c, "a geometry string", j);
        if (j.toString().isEmpty()) {
            v = Geometry();
            return true;
        }
        bool ok = false;
        const Geometry g = Geometry::toGeometry(j.toString(), &ok);
        if (!ok)
            return c.fail(QStringLiteral("unknown geometry \"%1\"").arg(j.toString()));
        v = g;
        return true;
    }
    static bool equal(const Geometry &a, const Geometry &b, QString *difference)
    {
        if (a == b)
            return true;
        if (difference)
            *difference = QStringLiteral(": %1 != %2").arg(a.toString(), b.toString());
        return false;
    }
    static QVariant toVariant(const Geometry &v) { return v.toString(); }
    static Geometry sample(SampleContext &c)
    {
        const auto all = Geometry::geometries(GeometrySet::All);
        return all.at(c.next() % all.size());
    }
};

template<>
struct MemberTraits<ColorimetricCondition> : PlainTraits<ColorimetricCondition>
{
    static constexpr MemberKind kind = MemberKind::ColorimetricCondition;
    static QString innerType() { return QString(); }
    static QJsonValue write(const ColorimetricCondition &v) { return v.toString(); }
    static bool read(const QJsonValue &j, ColorimetricCondition &v, ReadContext &c)
    {
        if (!j.isString())
            return expected(c, "a colorimetric condition string", j);
        bool ok = false;
        const ColorimetricCondition cc = ColorimetricCondition::fromString(j.toString(), &ok);
        if (!ok)
            return c.fail(QStringLiteral("invalid colorimetric condition \"%1\"").arg(j.toString()));
        v = cc;
        return true;
    }
    static bool equal(const ColorimetricCondition &a, const ColorimetricCondition &b, QString *difference)
    {
        if (a == b)
            return true;
        if (difference)
            *difference = QStringLiteral(": %1 != %2").arg(a.toString(), b.toString());
        return false;
    }
    static QVariant toVariant(const ColorimetricCondition &v) { return v.toString(); }
    static ColorimetricCondition sample(SampleContext &c)
    {
        const auto all = ColorimetricCondition::availableConditions();
        return all.at(c.next() % all.size());
    }
};

template<>
struct MemberTraits<QUuid> : PlainTraits<QUuid>
{
    static constexpr MemberKind kind = MemberKind::Uuid;
    static QString innerType() { return QString(); }
    static QJsonValue write(const QUuid &v) { return v.toString(QUuid::WithoutBraces); }
    static bool read(const QJsonValue &j, QUuid &v, ReadContext &c)
    {
        if (!j.isString())
            return expected(c, "a UUID string", j);
        const QUuid u(j.toString());
        if (u.isNull() && !j.toString().isEmpty() && j.toString() != QUuid().toString(QUuid::WithoutBraces))
            return c.fail(QStringLiteral("invalid UUID \"%1\"").arg(j.toString()));
        v = u;
        return true;
    }
    static QVariant toVariant(const QUuid &v) { return v.toString(QUuid::WithoutBraces); }
    static QUuid sample(SampleContext &) { return QUuid::createUuid(); }
};

// QVariant members hold the simple values of parameters: invalid, bool, int,
// double, string or string list. They are stored tagged, so that an int stays an int.
template<>
struct MemberTraits<QVariant>
{
    static constexpr MemberKind kind = MemberKind::Variant;
    static QString innerType() { return QString(); }
    static QJsonValue write(const QVariant &v)
    {
        QJsonObject o;
        switch (v.userType()) {
        case QMetaType::UnknownType:
            return QJsonValue::Null;
        case QMetaType::Bool:
            o.insert(QStringLiteral("bool"), v.toBool());
            break;
        case QMetaType::Int:
        case QMetaType::UInt:
        case QMetaType::LongLong:
        case QMetaType::ULongLong:
            o.insert(QStringLiteral("int"), QString::number(v.toLongLong()));
            break;
        case QMetaType::Double:
        case QMetaType::Float:
            o.insert(QStringLiteral("double"), Reflection::doubleToJson(v.toDouble()));
            break;
        case QMetaType::QStringList:
            o.insert(QStringLiteral("stringList"), QJsonArray::fromStringList(v.toStringList()));
            break;
        default:
            o.insert(QStringLiteral("string"), v.toString());
            break;
        }
        return o;
    }
    static bool read(const QJsonValue &j, QVariant &v, ReadContext &c)
    {
        if (j.isNull()) {
            v = QVariant();
            return true;
        }
        const QJsonObject o = j.toObject();
        if (!j.isObject() || o.size() != 1)
            return expected(c, "null or an object with one of \"bool\", \"int\", \"double\", \"string\", \"stringList\"", j);
        const QString tag = o.begin().key();
        const QJsonValue x = o.begin().value();
        c.pushMember(tag);
        bool ok = true;
        if (tag == QLatin1String("bool")) {
            ok = x.isBool() || expected(c, "a boolean", x);
            v = x.toBool();
        } else if (tag == QLatin1String("int")) {
            bool good = false;
            const qlonglong n = x.toString().toLongLong(&good);
            ok = good || c.fail(QStringLiteral("expected an integer string"));
            v = (n >= std::numeric_limits<int>::min() && n <= std::numeric_limits<int>::max()) ? QVariant(int(n))
                                                                                              : QVariant(n);
        } else if (tag == QLatin1String("double")) {
            double d = 0;
            ok = Reflection::doubleFromJson(x, d) || expected(c, "a number", x);
            v = d;
        } else if (tag == QLatin1String("string")) {
            ok = x.isString() || expected(c, "a string", x);
            v = x.toString();
        } else if (tag == QLatin1String("stringList")) {
            QStringList l;
            ok = MemberTraits<QStringList>::read(x, l, c);
            v = l;
        } else {
            ok = c.fail(QStringLiteral("unknown value kind \"%1\"").arg(tag));
        }
        c.pop();
        return ok;
    }
    static QVariant copy(const QVariant &v, CopyContext &) { return v; }
    static bool equal(const QVariant &a, const QVariant &b, QString *difference)
    {
        bool same = a.userType() == b.userType();
        if (same && (a.userType() == QMetaType::Double || a.userType() == QMetaType::Float))
            same = Reflection::sameDouble(a.toDouble(), b.toDouble());
        else if (same)
            same = a == b;
        if (!same && difference)
            *difference = QStringLiteral(": %1(%2) != %3(%4)")
                              .arg(QLatin1String(a.typeName()), a.toString(), QLatin1String(b.typeName()), b.toString());
        return same;
    }
    static QVariant toVariant(const QVariant &v) { return v; }
    static QVariant sample(SampleContext &c)
    {
        switch (c.next() % 5) {
        case 0: return true;
        case 1: return c.next();
        case 2: return 0.1 + c.next();
        case 3: return QStringLiteral("choice %1").arg(c.next());
        default: return QStringList{QStringLiteral("a"), QStringLiteral("b")};
        }
    }
    static void references(const QVariant &, std::vector<std::shared_ptr<BaseObject>> &) {}
    static void owned(const QVariant &, const std::function<void(const Reflectable &)> &) {}
};

// Enumerations are stored as their integer value.
template<class E>
struct MemberTraits<E, std::enable_if_t<std::is_enum<E>::value>>
{
    static constexpr MemberKind kind = MemberKind::Enum;
    static QString innerType() { return QString(); }
    static QJsonValue write(E v) { return int(v); }
    static bool read(const QJsonValue &j, E &v, ReadContext &c)
    {
        int i = 0;
        if (!MemberTraits<int>::read(j, i, c))
            return false;
        v = static_cast<E>(i);
        return true;
    }
    static E copy(E v, CopyContext &) { return v; }
    static bool equal(E a, E b, QString *difference)
    {
        if (a == b)
            return true;
        if (difference)
            *difference = QStringLiteral(": %1 != %2").arg(int(a)).arg(int(b));
        return false;
    }
    static QVariant toVariant(E v) { return int(v); }
    // The second enumerator: differs from the usual default, the first.
    static E sample(SampleContext &) { return static_cast<E>(1); }
    static void references(E, std::vector<std::shared_ptr<BaseObject>> &) {}
    static void owned(E, const std::function<void(const Reflectable &)> &) {}
};

// A nested object held by value: its members as a plain JSON object.
template<class T>
struct MemberTraits<T, std::enable_if_t<std::is_base_of<Reflectable, T>::value>>
{
    static constexpr MemberKind kind = MemberKind::ValueObject;
    static QString innerType() { return T::typeId(); }
    static QJsonValue write(const T &v) { return Reflection::writeMembers(v); }
    static bool read(const QJsonValue &j, T &v, ReadContext &c)
    {
        if (!j.isObject())
            return expected(c, "an object", j);
        T fresh;
        if (!Reflection::readMembers(fresh, j.toObject(), c))
            return false;
        v = fresh;
        return true;
    }
    static T copy(const T &v, CopyContext &c)
    {
        T out;
        Reflection::copyMembers(v, out, c);
        return out;
    }
    static bool equal(const T &a, const T &b, QString *difference)
    {
        QString sub;
        if (Reflection::equal(a, b, &sub))
            return true;
        if (difference)
            *difference = QLatin1Char('.') + sub.section(QLatin1Char('.'), 1);
        return false;
    }
    static QVariant toVariant(const T &v)
    {
        return QVariant::fromValue(std::static_pointer_cast<Reflectable>(std::make_shared<T>(v)));
    }
    static T sample(SampleContext &c)
    {
        T v;
        Reflection::fillWithSamples(v, c);
        return v;
    }
    static void references(const T &v, std::vector<std::shared_ptr<BaseObject>> &out)
    {
        const auto r = Reflection::references(v);
        out.insert(out.end(), r.begin(), r.end());
    }
    // Held by value, so part of the owner: visit() goes only through objects held by pointer.
    static void owned(const T &, const std::function<void(const Reflectable &)> &) {}
};

template<class T>
std::shared_ptr<T> sampleOwned(SampleContext &c, int pick)
{
    const auto kinds = Reflection::instancesOfKind([](const Reflectable &r) { return dynamic_cast<const T *>(&r); });
    if (kinds.empty())
        return nullptr;
    auto object = std::dynamic_pointer_cast<T>(kinds.at(size_t(pick) % kinds.size()));
    c.enter();
    Reflection::fillWithSamples(*object, c);
    c.leave();
    return object;
}

template<class T>
QString ownedDifference(const T *a, const T *b)
{
    if (!a || !b)
        return a == b ? QString() : QStringLiteral(": one is null");
    QString sub;
    if (Reflection::equal(*a, *b, &sub))
        return QString();
    const QString rest = sub.section(QLatin1Char('.'), 1);
    return rest.isEmpty() ? sub.mid(sub.indexOf(QLatin1Char(':'))) : QLatin1Char('.') + rest;
}

// An owned nested object, possibly of a derived kind: {"$type": ..., members}.
template<class T>
struct MemberTraits<std::shared_ptr<T>, std::enable_if_t<std::is_base_of<Reflectable, T>::value>>
{
    static constexpr MemberKind kind = MemberKind::OwnedObject;
    static QString innerType() { return T::typeId(); }
    static QJsonValue write(const std::shared_ptr<T> &v)
    {
        return v ? QJsonValue(Reflection::writeTypedObject(*v)) : QJsonValue(QJsonValue::Null);
    }
    static bool read(const QJsonValue &j, std::shared_ptr<T> &v, ReadContext &c)
    {
        if (j.isNull()) {
            v.reset();
            return true;
        }
        const auto object = Reflection::readTypedObject(j, c);
        if (!object)
            return false;
        auto typed = std::dynamic_pointer_cast<T>(object);
        if (!typed)
            return c.fail(QStringLiteral("a %1 is not a %2").arg(object->typeName(), T::typeId()));
        v = typed;
        return true;
    }
    static std::shared_ptr<T> copy(const std::shared_ptr<T> &v, CopyContext &c)
    {
        return v ? std::static_pointer_cast<T>(Reflection::deepCopy(*v, c)) : nullptr;
    }
    static bool equal(const std::shared_ptr<T> &a, const std::shared_ptr<T> &b, QString *difference)
    {
        const QString d = ownedDifference<T>(a.get(), b.get());
        if (difference)
            *difference = d;
        return d.isEmpty();
    }
    static QVariant toVariant(const std::shared_ptr<T> &v)
    {
        return QVariant::fromValue(std::static_pointer_cast<Reflectable>(v));
    }
    static std::shared_ptr<T> sample(SampleContext &c)
    {
        return c.canDescend() ? sampleOwned<T>(c, c.next()) : nullptr;
    }
    static void references(const std::shared_ptr<T> &v, std::vector<std::shared_ptr<BaseObject>> &out)
    {
        if (v) {
            const auto r = Reflection::references(*v);
            out.insert(out.end(), r.begin(), r.end());
        }
    }
    static void owned(const std::shared_ptr<T> &v, const std::function<void(const Reflectable &)> &f)
    {
        if (v)
            v->visit(f);
    }
};

// What a list of objects does with its items, shared by the owned and the referenced
// lists: the stored form is an array of the items' forms, in order.
template<class ItemTraits, class T>
struct ObjectListOps
{
    using Item = ItemTraits;
    using List = std::vector<std::shared_ptr<T>>;
    static QJsonValue write(const List &v)
    {
        QJsonArray a;
        for (const auto &item : v)
            a.append(Item::write(item));
        return a;
    }
    static bool read(const QJsonValue &j, List &v, ReadContext &c)
    {
        if (!j.isArray())
            return expected(c, "an array", j);
        const QJsonArray a = j.toArray();
        List out;
        out.reserve(size_t(a.size()));
        for (int i = 0; i < a.size(); ++i) {
            c.pushIndex(i);
            std::shared_ptr<T> item;
            const bool ok = Item::read(a.at(i), item, c);
            c.pop();
            if (!ok)
                return false;
            out.push_back(item);
        }
        v = out;
        return true;
    }
    static List copy(const List &v, CopyContext &c)
    {
        List out;
        out.reserve(v.size());
        for (const auto &item : v)
            out.push_back(Item::copy(item, c));
        return out;
    }
    static bool equal(const List &a, const List &b, QString *difference)
    {
        if (a.size() != b.size()) {
            if (difference)
                *difference = QStringLiteral(": %1 items != %2 items").arg(a.size()).arg(b.size());
            return false;
        }
        for (size_t i = 0; i < a.size(); ++i) {
            QString sub;
            if (!Item::equal(a[i], b[i], &sub)) {
                if (difference)
                    *difference = QStringLiteral("[%1]").arg(i) + sub;
                return false;
            }
        }
        return true;
    }
    static QVariant toVariant(const List &v)
    {
        QVariantList l;
        for (const auto &item : v)
            l.append(Item::toVariant(item));
        return l;
    }
};

// A list of owned nested objects, each with its "$type".
template<class T>
struct MemberTraits<std::vector<std::shared_ptr<T>>, std::enable_if_t<std::is_base_of<Reflectable, T>::value>>
    : ObjectListOps<MemberTraits<std::shared_ptr<T>>, T>
{
    using Item = MemberTraits<std::shared_ptr<T>>;
    using List = std::vector<std::shared_ptr<T>>;
    static constexpr MemberKind kind = MemberKind::OwnedObjectList;
    static QString innerType() { return T::typeId(); }
    // One object of every registered kind that fits (a list of colour values gets
    // a reflectance, a Lab value, ...), so that every kind is covered.
    static List sample(SampleContext &c)
    {
        List out;
        if (!c.canDescend())
            return out;
        const auto kinds = Reflection::instancesOfKind([](const Reflectable &r) { return dynamic_cast<const T *>(&r); });
        for (size_t i = 0; i < kinds.size(); ++i)
            out.push_back(sampleOwned<T>(c, int(i)));
        return out;
    }
    static void references(const List &v, std::vector<std::shared_ptr<BaseObject>> &out)
    {
        for (const auto &item : v)
            Item::references(item, out);
    }
    static void owned(const List &v, const std::function<void(const Reflectable &)> &f)
    {
        for (const auto &item : v)
            Item::owned(item, f);
    }
};

template<class V, class Enable = void>
struct ReferenceTraits;

// A reference to another stored object: {"$ref": id, "$type": type}. Read back as
// an unloaded stub of the right class with only its id set.
template<class T>
struct ReferenceTraits<std::shared_ptr<T>, std::enable_if_t<std::is_base_of<BaseObject, T>::value>>
{
    static constexpr MemberKind kind = MemberKind::Reference;
    static QString innerType() { return T::typeId(); }
    static QJsonValue write(const std::shared_ptr<T> &v)
    {
        if (!v)
            return QJsonValue::Null;
        QJsonObject o;
        o.insert(QStringLiteral("$ref"), v->id());
        o.insert(QStringLiteral("$type"), v->typeName());
        return o;
    }
    static bool read(const QJsonValue &j, std::shared_ptr<T> &v, ReadContext &c)
    {
        if (j.isNull()) {
            v.reset();
            return true;
        }
        const QJsonObject o = j.toObject();
        if (!j.isObject() || !o.value(QStringLiteral("$ref")).isString() || !o.value(QStringLiteral("$type")).isString())
            return expected(c, "a reference {\"$ref\": id, \"$type\": type}", j);
        const QString type = o.value(QStringLiteral("$type")).toString();
        auto object = std::dynamic_pointer_cast<T>(ClassRegistration::instance().serializableFactory().createObject(type));
        if (!object)
            return c.fail(QStringLiteral("unknown or unfitting type \"%1\" for a reference to a %2").arg(type, T::typeId()));
        object->setId(o.value(QStringLiteral("$ref")).toString());
        object->setIsStub(true);
        v = object;
        return true;
    }
    // Referenced objects are copied too (once per copy), keeping their ids.
    static std::shared_ptr<T> copy(const std::shared_ptr<T> &v, CopyContext &c)
    {
        return v ? std::static_pointer_cast<T>(Reflection::deepCopy(*v, c)) : nullptr;
    }
    static bool equal(const std::shared_ptr<T> &a, const std::shared_ptr<T> &b, QString *difference)
    {
        const bool same = (!a && !b) || (a && b && a->id() == b->id() && a->typeName() == b->typeName());
        if (!same && difference)
            *difference = QStringLiteral(": reference %1 != %2").arg(a ? a->id() : QStringLiteral("null"),
                                                                       b ? b->id() : QStringLiteral("null"));
        return same;
    }
    static QVariant toVariant(const std::shared_ptr<T> &v)
    {
        return QVariant::fromValue(std::static_pointer_cast<BaseObject>(v));
    }
    static std::shared_ptr<T> sample(SampleContext &c)
    {
        const auto kinds = Reflection::instancesOfKind([](const Reflectable &r) { return dynamic_cast<const T *>(&r); });
        if (kinds.empty())
            return nullptr;
        const int n = c.next();
        auto object = std::dynamic_pointer_cast<T>(kinds.at(size_t(n) % kinds.size()));
        object->setId(QStringLiteral("referenced-%1").arg(n));
        object->setIsStub(true);
        return object;
    }
    static void references(const std::shared_ptr<T> &v, std::vector<std::shared_ptr<BaseObject>> &out)
    {
        if (v)
            out.push_back(v);
    }
    static void owned(const std::shared_ptr<T> &, const std::function<void(const Reflectable &)> &) {}
};

template<class T>
struct ReferenceTraits<std::vector<std::shared_ptr<T>>, std::enable_if_t<std::is_base_of<BaseObject, T>::value>>
    : ObjectListOps<ReferenceTraits<std::shared_ptr<T>>, T>
{
    using Item = ReferenceTraits<std::shared_ptr<T>>;
    using List = std::vector<std::shared_ptr<T>>;
    static constexpr MemberKind kind = MemberKind::ReferenceList;
    static QString innerType() { return T::typeId(); }
    static List sample(SampleContext &c) { return {Item::sample(c), Item::sample(c)}; }
    static void references(const List &v, std::vector<std::shared_ptr<BaseObject>> &out)
    {
        for (const auto &item : v)
            Item::references(item, out);
    }
    static void owned(const List &, const std::function<void(const Reflectable &)> &) {}
};

template<class V, class Traits>
class TypedMember : public MemberDescriptor
{
public:
    using Getter = std::function<V(const Reflectable &)>;
    using Setter = std::function<void(Reflectable &, const V &)>;

    TypedMember(const QString &name, Getter getter, Setter setter)
        : MemberDescriptor(name, Traits::kind, Traits::innerType()), m_get(std::move(getter)), m_set(std::move(setter))
    {
    }

    QJsonValue write(const Reflectable &object) const override { return Traits::write(m_get(object)); }
    bool read(Reflectable &object, const QJsonValue &json, ReadContext &context) const override
    {
        V v = m_get(object);
        if (!Traits::read(json, v, context))
            return false;
        m_set(object, v);
        return true;
    }
    void copy(const Reflectable &from, Reflectable &to, CopyContext &context) const override
    {
        m_set(to, Traits::copy(m_get(from), context));
    }
    bool equal(const Reflectable &a, const Reflectable &b, QString *difference) const override
    {
        return Traits::equal(m_get(a), m_get(b), difference);
    }
    QVariant value(const Reflectable &object) const override { return Traits::toVariant(m_get(object)); }
    void fillSample(Reflectable &object, SampleContext &context) const override
    {
        V sample = Traits::sample(context);
        // Flags and enumerations have few values: make sure the sample differs from the current one.
        if constexpr (std::is_same<V, bool>::value)
            sample = !m_get(object);
        else if constexpr (std::is_enum<V>::value)
            sample = (sample == m_get(object)) ? static_cast<V>(0) : sample;
        m_set(object, sample);
    }
    void collectReferences(const Reflectable &object, std::vector<std::shared_ptr<BaseObject>> &out) const override
    {
        Traits::references(m_get(object), out);
    }
    void forEachOwned(const Reflectable &object, const std::function<void(const Reflectable &)> &f) const override
    {
        Traits::owned(m_get(object), f);
    }

private:
    Getter m_get;
    Setter m_set;
};

template<template<class, class> class TraitsOf, class CG, class R, class CS, class A>
MemberDescriptorPtr makeMember(const QString &name, R (CG::*getter)() const, void (CS::*setter)(A))
{
    using V = std::decay_t<R>;
    using Traits = TraitsOf<V, void>;
    return std::make_shared<TypedMember<V, Traits>>(
        name,
        [getter](const Reflectable &o) -> V { return (static_cast<const CG &>(o).*getter)(); },
        [setter](Reflectable &o, const V &v) { (static_cast<CS &>(o).*setter)(v); });
}

} // namespace detail

// A member held by the object: plain values, value objects, owned objects and lists.
template<class CG, class R, class CS, class A>
MemberDescriptorPtr member(const char *name, R (CG::*getter)() const, void (CS::*setter)(A))
{
    return detail::makeMember<detail::MemberTraits>(QLatin1String(name), getter, setter);
}

// A member that refers to another stored object (or a list of them).
template<class CG, class R, class CS, class A>
MemberDescriptorPtr reference(const char *name, R (CG::*getter)() const, void (CS::*setter)(A))
{
    return detail::makeMember<detail::ReferenceTraits>(QLatin1String(name), getter, setter);
}

} // namespace vexa
