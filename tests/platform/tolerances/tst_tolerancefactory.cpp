#include <tolerances/tolerancefactory.h>

#include <domain/tolerance.h>
#include <domain/toleranceparameter.h>
#include <domain/toleranceruleregistry.h>
#include <domain/toleranceset.h>
#include <domain/tolerancevalue.h>

#include <QtTest>

using namespace vexa;

class tst_ToleranceFactory : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void typesGroupsAndRules();
    void geometries_data();
    void geometries();
    void createdTolerancesCarryTheirLimits_data();
    void createdTolerancesCarryTheirLimits();
    void unknownTypeOrGeometryGivesNull();
    void cie94ApplicationSetsTheFactors();
    void createToleranceSet();
};

void tst_ToleranceFactory::typesGroupsAndRules()
{
    ToleranceFactory *factory = ToleranceFactory::toleranceFactory();
    QCOMPARE(factory, ToleranceFactory::toleranceFactory());
    const QStringList types = factory->allToleranceTypes();
    QCOMPARE(types.size(), 11);
    for (const QString &type : types)
        QVERIFY2(ToleranceRuleRegistry::instance().rule(type), qPrintable(type));
    QCOMPARE(factory->toleranceGroup("DIN 6175-2"), QStringLiteral("DIN 6175-2"));
    QCOMPARE(factory->toleranceGroup("Audi2000"), QStringLiteral("Audi"));
    QCOMPARE(factory->toleranceGroup("Flop Index(+/-)"), QStringLiteral("CIEL"));
    QCOMPARE(factory->toleranceGroup("CIELab(+/-)"), QStringLiteral("CIEL"));
    QVERIFY(factory->toleranceGroup("nonsense").isEmpty());
}

void tst_ToleranceFactory::geometries_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<int>("count");
    QTest::addColumn<bool>("hasNegativeAspecular");
    QTest::newRow("CIELab(+/-)") << "CIELab(+/-)" << 13 << true;
    QTest::newRow("CIEDE2000") << "CIEDE2000" << 13 << true;
    QTest::newRow("DIN 6175-2") << "DIN 6175-2" << 5 << false;
    QTest::newRow("Audi2000") << "Audi2000" << 5 << false;
    QTest::newRow("Flop Index(+/-)") << "Flop Index(+/-)" << 0 << false;
}

void tst_ToleranceFactory::geometries()
{
    QFETCH(QString, type);
    QFETCH(int, count);
    QFETCH(bool, hasNegativeAspecular);
    const QVector<Geometry> geometries = ToleranceFactory::toleranceFactory()->supportedGeometries(type);
    QCOMPARE(geometries.size(), count);
    QCOMPARE(geometries.contains(Geometry("45as-15")), hasNegativeAspecular);
}

void tst_ToleranceFactory::createdTolerancesCarryTheirLimits_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QStringList>("limits");
    QTest::addColumn<QStringList>("visibleParameters");
    QTest::newRow("CIELab(+/-)") << "CIELab(+/-)" << QStringList{"dL-", "dL+", "da-", "da+", "db-", "db+"} << QStringList{};
    QTest::newRow("CIELCh(+/-)") << "CIELCh(+/-)" << QStringList{"dL-", "dL+", "dC-", "dC+", "dH-", "dH+"} << QStringList{};
    QTest::newRow("CIELab dE*ab") << "CIELab dE*ab" << QStringList{"dE"} << QStringList{};
    QTest::newRow("CIE94") << "CIE94" << QStringList{"dE"}
                           << QStringList{"Application", "kL", "kC", "kH", "Chroma reference"};
    QTest::newRow("CMC(l:c)") << "CMC(l:c)" << QStringList{"dE"} << QStringList{"l", "c"};
    QTest::newRow("CIEDE2000") << "CIEDE2000" << QStringList{"dE"} << QStringList{"kL", "kC", "kH"};
    QTest::newRow("DIN99") << "DIN99" << QStringList{"dE"} << QStringList{"kE", "kCH"};
    QTest::newRow("DIN99o") << "DIN99o" << QStringList{"dE"} << QStringList{"kE", "kCH"};
    QTest::newRow("DIN 6175-2") << "DIN 6175-2" << QStringList{"dE"}
                                << QStringList{"gL", "gC", "gH", "ga", "gb", "Form", "Weighting reference"};
    QTest::newRow("Audi2000") << "Audi2000" << QStringList{"dE"}
                              << QStringList{"gL", "gC", "gH", "ga", "gb", "Form", "Weighting reference"};
    QTest::newRow("Flop Index(+/-)") << "Flop Index(+/-)" << QStringList{"dFI-", "dFI+"} << QStringList{};
}

void tst_ToleranceFactory::createdTolerancesCarryTheirLimits()
{
    QFETCH(QString, type);
    QFETCH(QStringList, limits);
    QFETCH(QStringList, visibleParameters);
    const auto tolerance = ToleranceFactory::toleranceFactory()->createTolerance(type);
    QVERIFY(tolerance);
    QCOMPARE(tolerance->toleranceType(), type);
    QCOMPARE(tolerance->toleranceGroup(), ToleranceFactory::toleranceFactory()->toleranceGroup(type));
    QCOMPARE(tolerance->passThreshold(), 1.0);
    QCOMPARE(tolerance->checkThreshold(), 0.8);
    QStringList names;
    for (const auto &value : tolerance->toleranceValues()) {
        names << value->name();
        QVERIFY(value->isEditable() && value->isVisible());
        QCOMPARE(std::fabs(value->valueAsDouble()), 1.0);
    }
    QCOMPARE(names, limits);
    QStringList visible;
    for (const auto &parameter : tolerance->toleranceParameters()) {
        if (parameter->isVisible())
            visible << parameter->name();
        QVERIFY(!parameter->displayName().isEmpty());
        if (parameter->parameterType() == ToleranceParameter::ParameterType::Choice) {
            bool found = false;
            for (const auto &choice : parameter->possibleValues())
                found = found || choice->value() == parameter->value();
            QVERIFY2(found, qPrintable(parameter->name()));
        }
    }
    QCOMPARE(visible, visibleParameters);
}

void tst_ToleranceFactory::unknownTypeOrGeometryGivesNull()
{
    QVERIFY(!ToleranceFactory::toleranceFactory()->createTolerance("CIE2001"));
    QVERIFY(!ToleranceFactory::toleranceFactory()->createTolerance("Audi2000", Geometry("15as15")));
    QVERIFY(ToleranceFactory::toleranceFactory()->supportedGeometries("CIE2001").isEmpty());
}

void tst_ToleranceFactory::cie94ApplicationSetsTheFactors()
{
    ToleranceFactory *factory = ToleranceFactory::toleranceFactory();
    auto set = factory->createToleranceSet("CIE94", "set", {Geometry("45as45")});
    const auto tolerance = set->tolerances().front();
    tolerance->toleranceParameter("Application")->setValue(QStringLiteral("Textiles"));
    set = factory->recomputeToleranceSet(set);
    QCOMPARE(tolerance->toleranceParameter("kL")->valueAsDouble(), 2.0);
    QCOMPARE(tolerance->toleranceParameter("K1")->valueAsDouble(), 0.048);
    QCOMPARE(tolerance->toleranceParameter("K2")->valueAsDouble(), 0.014);
    // kL follows the application: shown, not edited, and rewritten by every recompute.
    QVERIFY(!tolerance->toleranceParameter("kL")->isEditable());
    tolerance->toleranceParameter("kL")->setValue(1.5);
    factory->recomputeToleranceSet(*set);
    QCOMPARE(tolerance->toleranceParameter("kL")->valueAsDouble(), 2.0);
    tolerance->toleranceParameter("Application")->setValue(QStringLiteral("Graphic arts"));
    factory->recomputeToleranceSet(*set);
    QCOMPARE(tolerance->toleranceParameter("kL")->valueAsDouble(), 1.0);
    QCOMPARE(tolerance->toleranceParameter("K1")->valueAsDouble(), 0.045);
    QVERIFY(!factory->recomputeToleranceSet(std::shared_ptr<ToleranceSet>()));
}

void tst_ToleranceFactory::createToleranceSet()
{
    ToleranceFactory *factory = ToleranceFactory::toleranceFactory();
    const auto set = factory->createToleranceSet("DIN 6175-2", "Effect");
    QCOMPARE(set->name(), QStringLiteral("Effect"));
    QCOMPARE(int(set->tolerances().size()), 5);
    QVERIFY(set->toleranceWithGeometry(Geometry("45as110")));
    const auto flop = factory->createToleranceSet("Flop Index(+/-)", "Flop");
    QCOMPARE(int(flop->tolerances().size()), 1);
    QVERIFY(!factory->createToleranceSet("nonsense", "x"));
}

QTEST_GUILESS_MAIN(tst_ToleranceFactory)
#include "tst_tolerancefactory.moc"
