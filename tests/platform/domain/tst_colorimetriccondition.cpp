#include <domain/colorimetriccondition.h>
#include <domain/illuminant.h>
#include <domain/observer.h>

#include <QtTest>

using namespace vexa;

class tst_ColorimetricCondition : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void fromString_data();
    void fromString();
    void availableConditions();
    void illuminantAndObserverNames();
};

void tst_ColorimetricCondition::fromString_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<bool>("ok");
    QTest::addColumn<QString>("canonical");
    QTest::newRow("D65/10") << "D65/10" << true << "D65/10";
    QTest::newRow("lower case, blanks") << " d50 / 2 " << true << "D50/2";
    QTest::newRow("degree sign") << QString::fromUtf8("F11/10\u00b0") << true << "F11/10";
    QTest::newRow("unknown illuminant") << "D66/10" << false << "D65/10";
    QTest::newRow("unknown observer") << "D65/5" << false << "D65/10";
    QTest::newRow("no observer") << "D65" << false << "D65/10";
    QTest::newRow("too many parts") << "D65/10/2" << false << "D65/10";
    QTest::newRow("empty") << "" << false << "D65/10";
}

void tst_ColorimetricCondition::fromString()
{
    QFETCH(QString, text);
    QFETCH(bool, ok);
    QFETCH(QString, canonical);
    bool parsed = !ok;
    const ColorimetricCondition c = ColorimetricCondition::fromString(text, &parsed);
    QCOMPARE(parsed, ok);
    QCOMPARE(c.toString(), canonical);
    QVERIFY(c.isValid());
}

void tst_ColorimetricCondition::availableConditions()
{
    const auto all = ColorimetricCondition::availableConditions();
    QCOMPARE(all.size(), 20);
    QSet<QString> texts;
    for (const auto &c : all) {
        QVERIFY(c.isValid());
        texts.insert(c.toString());
        QCOMPARE(ColorimetricCondition::fromString(c.toString()), c);
    }
    QCOMPARE(texts.size(), 20);
    for (const char *expected : {"A/2", "C/10", "D50/2", "D55/10", "D65/10", "D75/2", "F2/10", "F7/2", "F11/10", "F12/2"})
        QVERIFY2(texts.contains(QLatin1String(expected)), expected);
    QCOMPARE(ColorimetricCondition().toString(), QStringLiteral("D65/10"));
}

void tst_ColorimetricCondition::illuminantAndObserverNames()
{
    for (Illuminant::Type t : Illuminant::all())
        QCOMPARE(Illuminant::fromValue(Illuminant::toString(t)), t);
    bool ok = true;
    QCOMPARE(Illuminant::fromValue(QStringLiteral("D93"), &ok), Illuminant::Unknown);
    QVERIFY(!ok);
    QCOMPARE(Observer::toString(Observer::Observer_10_Degree), QStringLiteral("10"));
    QCOMPARE(Observer::fromString(QStringLiteral("2")), Observer::Observer_2_Degree);
    QCOMPARE(Observer::fromString(QStringLiteral("11"), &ok), Observer::Unknown);
    QVERIFY(!ok);
}

QTEST_GUILESS_MAIN(tst_ColorimetricCondition)
#include "tst_colorimetriccondition.moc"
