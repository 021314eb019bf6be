#include <domain/geometry.h>

#include <QtTest>

#include <algorithm>
#include <stdexcept>

using namespace vexa;

class tst_Geometry : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void parse_data();
    void parse();
    void badText_data();
    void badText();
    void throwingVariantNamesTheText();
    void ordering();
    void equalityAndHash();
    void namedConstantsAndSets();
};

void tst_Geometry::parse_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("canonical");
    QTest::addColumn<int>("kind");
    QTest::addColumn<int>("illumination");
    QTest::addColumn<int>("aspecular");

    const int dir = int(Geometry::Kind::Directional);
    const int dif = int(Geometry::Kind::Diffuse);
    QTest::newRow("45as15") << "45as15" << "45as15" << dir << 45 << 15;
    QTest::newRow("45as-15") << "45as-15" << "45as-15" << dir << 45 << -15;
    QTest::newRow("N for minus") << "45asN15" << "45as-15" << dir << 45 << -15;
    QTest::newRow("15as-45") << "15as-45" << "15as-45" << dir << 15 << -45;
    QTest::newRow("45as110") << "45as110" << "45as110" << dir << 45 << 110;
    QTest::newRow("case and blanks") << "  45AS45 " << "45as45" << dir << 45 << 45;
    QTest::newRow("leading zero") << "45as015" << "45as15" << dir << 45 << 15;
    QTest::newRow("d8") << "d8" << "d8" << dif << 8 << 0;
    QTest::newRow("d/8") << "D/8" << "d8" << dif << 8 << 0;
    QTest::newRow("diffuse") << "Diffuse" << "diffuse" << dif << 0 << 0;
    QTest::newRow("15_diffuse") << "15_diffuse" << "15_diffuse" << dif << 15 << 0;
    QTest::newRow("15diffuse") << "15diffuse" << "15_diffuse" << dif << 15 << 0;
    QTest::newRow("SPIN") << "spin" << "SPIN" << int(Geometry::Kind::Spin) << 8 << 0;
}

void tst_Geometry::parse()
{
    QFETCH(QString, text);
    QFETCH(QString, canonical);
    QFETCH(int, kind);
    QFETCH(int, illumination);
    QFETCH(int, aspecular);

    bool ok = false;
    const Geometry g = Geometry::toGeometry(text, &ok);
    QVERIFY(ok);
    QVERIFY(g.isValid());
    QCOMPARE(g.toString(), canonical);
    QCOMPARE(int(g.kind()), kind);
    QCOMPARE(g.isDiffuse(), kind == int(Geometry::Kind::Diffuse));
    QCOMPARE(g.getIlluminationAngle(), illumination);
    QCOMPARE(g.getAspecular(), aspecular);
    // The canonical text reads back to the same geometry.
    QCOMPARE(Geometry(g.toString()), g);
    QCOMPARE(Geometry(text), g);
}

void tst_Geometry::badText_data()
{
    QTest::addColumn<QString>("text");
    QTest::newRow("empty") << "";
    QTest::newRow("blank") << "   ";
    QTest::newRow("no aspecular") << "45as";
    QTest::newRow("no illumination") << "as15";
    QTest::newRow("letters") << "45asXY";
    QTest::newRow("illumination beyond 90") << "95as15";
    QTest::newRow("aspecular below the horizon") << "45as140";
    QTest::newRow("double sign") << "45as--15";
    QTest::newRow("trailing text") << "45as15x";
    QTest::newRow("d9") << "d9";
    QTest::newRow("spinning") << "SPINNING";
    QTest::newRow("decimal") << "45as15.5";
}

void tst_Geometry::badText()
{
    QFETCH(QString, text);
    bool ok = true;
    const Geometry g = Geometry::toGeometry(text, &ok);
    QVERIFY(!ok);
    QVERIFY(!g.isValid());
    QVERIFY(g.toString().isEmpty());
    QCOMPARE(g, Geometry());
    QVERIFY(!Geometry::toGeometry(text, false).isValid());
}

void tst_Geometry::throwingVariantNamesTheText()
{
    QCOMPARE(Geometry::toGeometry(QString::fromLatin1(Geometry::ANGLE_45as45), true).toString(), QStringLiteral("45as45"));
    try {
        Geometry::toGeometry(QStringLiteral("45asfoo"), true);
        QFAIL("no exception");
    } catch (const std::invalid_argument &e) {
        QVERIFY2(QString::fromUtf8(e.what()).contains(QStringLiteral("\"45asfoo\"")), e.what());
    }
}

void tst_Geometry::ordering()
{
    const QStringList expected{QString(), "15as-45", "15as-30", "15as-15", "15as15", "15as45", "15as80",
                               "45as-15", "45as15", "45as25", "45as45", "45as75", "45as110",
                               "diffuse", "d8", "15_diffuse", "SPIN"};
    QVector<Geometry> geometries;
    for (const QString &text : expected)
        geometries.append(text.isEmpty() ? Geometry() : Geometry(text));
    std::reverse(geometries.begin(), geometries.end());
    std::sort(geometries.begin(), geometries.end());
    QStringList sorted;
    for (const Geometry &g : geometries)
        sorted.append(g.toString());
    QCOMPARE(sorted, expected);

    for (int i = 0; i + 1 < geometries.size(); ++i) {
        QCOMPARE(Geometry::geometryCompare(geometries[i], geometries[i + 1]), -1);
        QCOMPARE(Geometry::geometryCompare(geometries[i + 1], geometries[i]), 1);
        QVERIFY(!(geometries[i + 1] < geometries[i]));
    }
    QCOMPARE(Geometry::geometryCompare(Geometry("45as15"), Geometry("45AS015")), 0);
}

void tst_Geometry::equalityAndHash()
{
    QVERIFY(Geometry("45asN15") == Geometry("45as-15"));
    QVERIFY(Geometry("45as15") != Geometry("45as-15"));
    QVERIFY(Geometry("15as15") != Geometry("45as15"));
    QVERIFY(Geometry("d8") != Geometry("diffuse"));
    QCOMPARE(qHash(Geometry("45asN15")), qHash(Geometry("45as-15")));
    QSet<Geometry> set{Geometry("45as15"), Geometry("45AS15"), Geometry("45as45")};
    QCOMPARE(set.size(), 2);
}

void tst_Geometry::namedConstantsAndSets()
{
    for (const char *name : {Geometry::ANGLE_15_diffuse, Geometry::ANGLE_15as15, Geometry::ANGLE_15as45,
                             Geometry::ANGLE_15as80, Geometry::ANGLE_15asN15, Geometry::ANGLE_15asN30,
                             Geometry::ANGLE_15asN45, Geometry::ANGLE_45as110, Geometry::ANGLE_45as15,
                             Geometry::ANGLE_45as25, Geometry::ANGLE_45as45, Geometry::ANGLE_45as75,
                             Geometry::ANGLE_45asN15, Geometry::SPIN}) {
        const Geometry g(name);
        QVERIFY2(g.isValid(), name);
        QCOMPARE(g.toString(), QString::fromLatin1(name));
        QVERIFY2(Geometry::geometries(GeometrySet::All).contains(g), name);
    }
    QCOMPARE(Geometry::geometriesMultiAngleSimple(),
             (QVector<Geometry>{Geometry("45as15"), Geometry("45as45"), Geometry("45as110")}));
    for (GeometrySet set : {GeometrySet::MultiAngleSimple, GeometrySet::MultiAngle, GeometrySet::MultiAngle15,
                            GeometrySet::Color, GeometrySet::Texture, GeometrySet::Sphere, GeometrySet::All}) {
        const auto list = Geometry::geometries(set);
        QVERIFY(!list.isEmpty());
        QCOMPARE(QSet<Geometry>(list.begin(), list.end()).size(), list.size());
    }
}

QTEST_GUILESS_MAIN(tst_Geometry)
#include "tst_geometry.moc"
