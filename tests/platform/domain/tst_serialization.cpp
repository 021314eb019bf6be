#include <domain/appearancevalues.h>
#include <domain/classregistration.h>
#include <domain/labvalue.h>
#include <domain/reflectancespectrum.h>
#include <domain/reflection.h>
#include <domain/samplecontext.h>
#include <domain/serialization.h>
#include <domain/standard.h>
#include <domain/tagdefinition.h>
#include <domain/tagvalue.h>
#include <domain/trial.h>

#include <QJsonDocument>
#include <QJsonObject>
#include <QtTest>

#include <cmath>
#include <limits>

using namespace vexa;

namespace {

std::shared_ptr<Trial> sampleTrial()
{
    auto trial = std::make_shared<Trial>();
    SampleContext context(11);
    Reflection::fillWithSamples(*trial, context);
    return trial;
}

QByteArray replaceInJson(const QByteArray &bytes, const QStringList &path, const QJsonValue &value)
{
    // Sets the member at path (object keys, or array indices as numbers) inside "object".
    std::function<QJsonValue(const QJsonValue &, int)> set = [&](const QJsonValue &node, int depth) -> QJsonValue {
        if (depth == path.size())
            return value;
        bool isIndex = false;
        const int index = path.at(depth).toInt(&isIndex);
        if (isIndex) {
            QJsonArray a = node.toArray();
            a[index] = set(a.at(index), depth + 1);
            return a;
        }
        QJsonObject o = node.toObject();
        o[path.at(depth)] = set(o.value(path.at(depth)), depth + 1);
        return o;
    };
    QJsonObject envelope = QJsonDocument::fromJson(bytes).object();
    envelope[QStringLiteral("object")] = set(envelope.value(QStringLiteral("object")), 0);
    return QJsonDocument(envelope).toJson();
}

} // namespace

class tst_Serialization : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void roundTripEveryType_data();
    void roundTripEveryType();
    void doublesAreExact();
    void referencesReadAsStubs();
    void brokenInput_data();
    void brokenInput();
    void deserializeIsAllOrNothing();
    void formatOneFileLoads();
};

void tst_Serialization::roundTripEveryType_data()
{
    QTest::addColumn<QString>("typeName");
    const QStringList names = ClassRegistration::instance().typeNames();
    QVERIFY(names.size() > 40);
    for (const QString &name : names)
        QTest::newRow(qPrintable(name)) << name;
}

void tst_Serialization::roundTripEveryType()
{
    QFETCH(QString, typeName);
    auto original = ClassRegistration::instance().create(typeName);
    QVERIFY(original);
    QCOMPARE(original->typeName(), typeName);

    SampleContext context(3);
    Reflection::fillWithSamples(*original, context);
    // The samples differ from the defaults in every member, so a member the
    // serializer drops shows up as a difference.
    auto pristine = ClassRegistration::instance().create(typeName);
    for (const auto &member : original->members()) {
        QString difference;
        QVERIFY2(!member->equal(*original, *pristine, &difference) || original->members().size() == 0,
                 qPrintable(typeName + QLatin1Char('.') + member->name() + QStringLiteral(" kept its default")));
    }

    const QByteArray bytes = Serialization::toBytes(*original);
    QString error;
    int format = 0;
    const auto read = Serialization::readAny(bytes, &error, &format);
    QVERIFY2(read, qPrintable(error));
    QCOMPARE(format, int(Serialization::FormatVersion));
    QString difference;
    QVERIFY2(Reflection::equal(*original, *read, &difference), qPrintable(difference));
    // Writing what was read gives the same bytes.
    QCOMPARE(Serialization::toBytes(*read), bytes);

    if (std::dynamic_pointer_cast<BaseObject>(original)) {
        const auto object = Serialization::fromBytes(bytes, &error);
        QVERIFY2(object, qPrintable(error));
        QCOMPARE(object->typeName(), typeName);
    } else {
        QVERIFY(!Serialization::fromBytes(bytes, &error));
        QVERIFY(error.contains(QStringLiteral("not a stored object")));
    }
}

void tst_Serialization::doublesAreExact()
{
    const QVector<double> values{0.1, 1.0 / 3.0, -0.0, std::nextafter(1.0, 2.0), 5e-324, 1.7976931348623157e308,
                                 std::numeric_limits<double>::quiet_NaN(), std::numeric_limits<double>::infinity(),
                                 -std::numeric_limits<double>::infinity(), 123456789012345678.0, 0.30000000000000004};
    auto av = std::make_shared<AppearanceValues>();
    auto spectrum = std::make_shared<ReflectanceSpectrum>(values, 360.5, 0.1);
    spectrum->setGeometry(Geometry("45as15"));
    av->setColorValues({spectrum, std::make_shared<LabValue>(1.0 / 7.0, -0.0, qQNaN())});

    QString error;
    const auto read = std::dynamic_pointer_cast<AppearanceValues>(Serialization::fromBytes(av->serialize(), &error));
    QVERIFY2(read, qPrintable(error));
    const auto readSpectrum = read->reflectanceAt(Geometry("45as15"));
    QVERIFY(readSpectrum);
    const QVector<double> back = readSpectrum->spectralValues();
    QCOMPARE(back.size(), values.size());
    for (int i = 0; i < values.size(); ++i)
        QVERIFY2(Reflection::sameDouble(back[i], values[i]), qPrintable(QString::number(i)));
    QCOMPARE(readSpectrum->startWavelength(), 360.5);
    const auto lab = std::dynamic_pointer_cast<LabValue>(read->colorValues().at(1));
    QVERIFY(lab);
    QCOMPARE(lab->l(), 1.0 / 7.0);
    QVERIFY(std::signbit(lab->a()));
    QVERIFY(std::isnan(lab->b()));
}

void tst_Serialization::referencesReadAsStubs()
{
    auto standard = std::make_shared<Standard>();
    standard->setName(QStringLiteral("Silver metallic"));
    standard->setAppearanceValues(std::make_shared<AppearanceValues>());
    auto trial = std::make_shared<Trial>();
    trial->setStandard(standard);

    const QJsonObject json = QJsonDocument::fromJson(trial->serialize()).object();
    const QJsonObject ref = json.value(QStringLiteral("object")).toObject().value(QStringLiteral("standard")).toObject();
    QCOMPARE(ref.value(QStringLiteral("$ref")).toString(), standard->id());
    QCOMPARE(ref.value(QStringLiteral("$type")).toString(), QStringLiteral("Standard"));
    QCOMPARE(ref.size(), 2);

    const auto read = std::dynamic_pointer_cast<Trial>(Serialization::fromBytes(trial->serialize()));
    QVERIFY(read && read->standard());
    QVERIFY(read->standard()->isStub());
    QCOMPARE(read->standard()->id(), standard->id());
    QVERIFY(read->standard()->name().isEmpty());
    QVERIFY(!read->standard()->appearanceValues());
}

void tst_Serialization::brokenInput_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("expectedError");

    const auto trial = sampleTrial();
    const QByteArray good = trial->serialize();
    int spectrumIndex = -1;
    for (size_t i = 0; i < trial->appearanceValues()->colorValues().size(); ++i) {
        if (std::dynamic_pointer_cast<ReflectanceSpectrum>(trial->appearanceValues()->colorValues()[i]))
            spectrumIndex = int(i);
    }
    QVERIFY(spectrumIndex >= 0);
    const QString spectrum = QString::number(spectrumIndex);
    for (int cut : {0, 1, 10, good.size() / 3, good.size() / 2, good.size() - 2})
        QTest::addRow("truncated at %d", cut) << good.left(cut)
                                              << (cut == 0 ? QStringLiteral("empty data") : QStringLiteral("JSON parse error at offset"));

    QTest::newRow("spectrum not an array")
        << replaceInJson(good, {"appearanceValues", "colorValues", spectrum, "spectralValues"}, QStringLiteral("0.5"))
        << QStringLiteral("Trial.appearanceValues.colorValues[%1].spectralValues: expected an array, found a string").arg(spectrum);
    QTest::newRow("text inside a spectrum")
        << replaceInJson(good, {"appearanceValues", "colorValues", spectrum, "spectralValues", "2"}, QStringLiteral("x"))
        << QStringLiteral("Trial.appearanceValues.colorValues[%1].spectralValues[2]: expected a number").arg(spectrum);
    QTest::newRow("fractional version") << replaceInJson(good, {"version"}, 1.5)
                                        << "Trial.version: expected an integer, found 1.5";
    QTest::newRow("bad timestamp") << replaceInJson(good, {"header", "creationTimestamp"}, QStringLiteral("yesterday"))
                                   << "Trial.header.creationTimestamp: invalid timestamp \"yesterday\"";
    QTest::newRow("unknown nested type")
        << replaceInJson(good, {"appearanceValues", "colorValues", "1", "$type"}, QStringLiteral("Paint"))
        << "Trial.appearanceValues.colorValues[1]: unknown type \"Paint\"";
    QTest::newRow("nested kind that does not fit")
        << replaceInJson(good, {"appearanceValues", "$type"}, QStringLiteral("Trial"))
        << "Trial.appearanceValues: a Trial is not a AppearanceValues";
    QTest::newRow("reference to an unknown type")
        << replaceInJson(good, {"standard", "$type"}, QStringLiteral("Paint"))
        << "Trial.standard: unknown or unfitting type \"Paint\" for a reference to a Standard";
    QTest::newRow("bad colorimetric condition")
        << replaceInJson(good, {"appearanceValues", "colorValues", "0"},
                         QJsonObject{{"$type", "LabValue"}, {"colorimetricCondition", "D65/7"}})
        << "Trial.appearanceValues.colorValues[0].colorimetricCondition: invalid colorimetric condition \"D65/7\"";
    QTest::newRow("unknown type name") << QByteArray(R"({"format": 2, "type": "Paint", "object": {}})")
                                       << "unknown type \"Paint\"";
    QTest::newRow("missing envelope") << QByteArray(R"({"id": "x", "header": {}})") << "missing envelope";
    QTest::newRow("not an object") << QByteArray("[1, 2]") << "missing envelope";
    QTest::newRow("future format") << QByteArray(R"({"format": 3, "type": "Trial", "object": {}})")
                                   << "format version 3 is newer than the newest supported version 2";
    QTest::newRow("format zero") << QByteArray(R"({"format": 0, "type": "Trial", "object": {}})")
                                 << "invalid format version 0";
    QTest::newRow("object not an object") << QByteArray(R"({"format": 2, "type": "Trial", "object": 5})")
                                          << "Trial: expected an object";
}

void tst_Serialization::brokenInput()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, expectedError);
    QString error;
    QVERIFY(!Serialization::fromBytes(bytes, &error));
    QVERIFY2(error.startsWith(expectedError), qPrintable(error));
}

void tst_Serialization::deserializeIsAllOrNothing()
{
    auto trial = sampleTrial();
    const auto before = trial->deepCopy();
    QByteArray broken = replaceInJson(trial->serialize(), {"appearanceValues", "instrumentInfo", "type"}, 7);
    broken = replaceInJson(broken, {"header", "name"}, QStringLiteral("changed"));
    QString error;
    QVERIFY(!trial->deserialize(broken, &error));
    QVERIFY2(error.contains(QStringLiteral("instrumentInfo.type")), qPrintable(error));
    QString difference;
    QVERIFY2(Reflection::equal(*trial, *before, &difference), qPrintable(difference));

    // A stored object of another class is refused too.
    QVERIFY(!trial->deserialize(std::make_shared<Standard>()->serialize(), &error));
    QVERIFY2(error.contains(QStringLiteral("not a Trial")), qPrintable(error));

    // And a good one replaces every member.
    auto other = sampleTrial();
    other->setName(QStringLiteral("other"));
    QVERIFY(trial->deserialize(other->serialize(), &error));
    QCOMPARE(trial->name(), QStringLiteral("other"));
    QVERIFY2(Reflection::equal(*trial, *other, &difference), qPrintable(difference));
}

void tst_Serialization::formatOneFileLoads()
{
    QFile file(QStringLiteral(VEXA_SOURCE_DIR "/tests/platform/domain/data/trial-format1.json"));
    QVERIFY(file.open(QIODevice::ReadOnly));
    QString error;
    int format = 0;
    const auto trial = std::dynamic_pointer_cast<Trial>(Serialization::readAny(file.readAll(), &error, &format));
    QVERIFY2(trial, qPrintable(error));
    QCOMPARE(format, 1);
    QCOMPARE(trial->id(), QStringLiteral("trial-0001"));
    QCOMPARE(trial->version(), 3);
    QCOMPARE(trial->name(), QStringLiteral("Door panel 12"));
    QCOMPARE(trial->header().creationTimestamp(), Timestamp(2019, 6, 4, 8, 15, 30));
    QVERIFY(trial->standard() && trial->standard()->isStub());
    QCOMPARE(trial->standard()->id(), QStringLiteral("standard-0042"));
    QCOMPARE(trial->tagDefinitions().size(), size_t(1));
    QCOMPARE(trial->tagDefinitions().front()->id(), QStringLiteral("tag-colour-family"));
    TagDefinition family;
    family.setId(QStringLiteral("tag-colour-family"));
    QVERIFY(trial->tagValue(family));
    QCOMPARE(trial->tagValue(family)->value(), QStringLiteral("Silver"));

    const auto av = trial->appearanceValues();
    QVERIFY(av);
    QCOMPARE(av->instrumentInfo().serialNumber(), QStringLiteral("SN-40211"));
    const auto spectrum = av->reflectanceAt(Geometry("45as15"));
    QVERIFY(spectrum);
    QCOMPARE(spectrum->spectralValues().size(), 5);
    QVERIFY(std::isnan(spectrum->spectralValues().at(3)));
    QVERIFY(!spectrum->isValid());
    const auto lab = std::dynamic_pointer_cast<LabValue>(av->colorValues().at(1));
    QVERIFY(lab);
    QCOMPARE(lab->values(), (QVector<double>{31.25, -0.5, 2.125}));
    QCOMPARE(lab->geometry(), Geometry("45as110"));

    // Saved again, it is in the current format and reads back equal.
    const QByteArray current = trial->serialize();
    QVERIFY(current.contains("\"format\": 2"));
    const auto again = Serialization::fromBytes(current, &error);
    QVERIFY2(again, qPrintable(error));
    QString difference;
    QVERIFY2(Reflection::equal(*trial, *again, &difference), qPrintable(difference));
}

QTEST_GUILESS_MAIN(tst_Serialization)
#include "tst_serialization.moc"
