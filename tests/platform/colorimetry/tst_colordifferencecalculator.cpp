#include <colorimetry/colordifferencecalculator.h>

#include <domain/labvalue.h>

#include <utilities/logger.h>

#include <QtTest>

#include <cmath>
#include <stdexcept>

using namespace vexa;

class tst_ColorDifferenceCalculator : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void formulasByName_data();
    void formulasByName();
    void unknownFormulaThrows();
    void invalidValuesGiveNaN();
    void components();
    void valuesOfDifferentConditionsAreNotCompared();
};

void tst_ColorDifferenceCalculator::formulasByName_data()
{
    QTest::addColumn<QString>("formula");
    QTest::addColumn<double>("l");
    QTest::addColumn<double>("c");
    QTest::addColumn<double>("expected");
    // Standard (90.9257, -0.5406, -0.9208), trial (88.6381, -0.8985, -0.7239).
    QTest::newRow("CIELab") << "CIELab" << 1.0 << 1.0 << 2.3238;
    QTest::newRow("CIE1976 alias") << "CIE1976" << 1.0 << 1.0 << 2.3238;
    QTest::newRow("CIE94") << "CIE94" << 1.0 << 1.0 << 2.3226;
    QTest::newRow("CMC 2:1") << "CMC" << 2.0 << 1.0 << 0.9901;
    QTest::newRow("CMC 1:1") << "CMC" << 1.0 << 1.0 << 1.7026;
    QTest::newRow("CIE2000") << "CIE2000" << 1.0 << 1.0 << 1.5381;
    QTest::newRow("DIN99") << "DIN99" << 1.0 << 1.0 << 1.6137;
    QTest::newRow("DIN99 textiles") << "DIN99" << 2.0 << 0.5 << 0.8599;
    QTest::newRow("DIN99o") << "DIN99o" << 1.0 << 1.0 << 2.0944;
}

void tst_ColorDifferenceCalculator::formulasByName()
{
    QFETCH(QString, formula);
    QFETCH(double, l);
    QFETCH(double, c);
    QFETCH(double, expected);
    const LabValue standard(90.9257, -0.5406, -0.9208);
    const LabValue trial(88.6381, -0.8985, -0.7239);
    const double dE = ColorDifferenceCalculator::Default_DE(formula, standard, trial, l, c, 1.0);
    QVERIFY2(std::fabs(dE - expected) < 1e-4, qPrintable(QString::number(dE, 'f', 6)));
    QVERIFY(ColorDifferenceCalculator::isKnownFormula(formula));
}

void tst_ColorDifferenceCalculator::unknownFormulaThrows()
{
    try {
        ColorDifferenceCalculator::Default_DE("CIE2001", LabValue(50, 0, 0), LabValue(51, 0, 0), 1, 1, 1);
        QFAIL("no exception");
    } catch (const std::invalid_argument &e) {
        QVERIFY(QString::fromStdString(e.what()).contains(QLatin1String("\"CIE2001\"")));
    }
    QCOMPARE(ColorDifferenceCalculator::formulaNames().size(), 6);
}

void tst_ColorDifferenceCalculator::invalidValuesGiveNaN()
{
    const LabValue empty;
    const LabValue lab(50, 1, 1);
    for (const QString &formula : ColorDifferenceCalculator::formulaNames())
        QVERIFY(std::isnan(ColorDifferenceCalculator::Default_DE(formula, empty, lab, 1, 1, 1)));
    QVERIFY(std::isnan(ColorDifferenceCalculator::Delta_H(lab, empty)));
    QVERIFY(std::isnan(ColorDifferenceCalculator::Delta_C(LabValue(qInf(), 0, 0), lab)));
}

void tst_ColorDifferenceCalculator::components()
{
    const LabValue standard(60.2574, -34.0099, 36.2677);
    const LabValue trial(60.4626, -34.1751, 39.4387);
    QVERIFY(std::fabs(ColorDifferenceCalculator::Delta_L(standard, trial) - 0.2052) < 1e-4);
    QVERIFY(std::fabs(ColorDifferenceCalculator::Delta_a(standard, trial) + 0.1652) < 1e-4);
    QVERIFY(std::fabs(ColorDifferenceCalculator::Delta_b(standard, trial) - 3.1710) < 1e-4);
    QVERIFY(std::fabs(ColorDifferenceCalculator::Delta_C(standard, trial) - 2.4663) < 1e-4);
    QVERIFY(std::fabs(ColorDifferenceCalculator::Delta_H(standard, trial) + 2.0000) < 1e-4);
    QVERIFY(std::fabs(ColorDifferenceCalculator::Delta_H(standard, trial, 1, 1, 2) + 1.0000) < 1e-4);
    QVERIFY(std::fabs(ColorDifferenceCalculator::Delta_E(standard, trial) - 3.1819) < 1e-4);
}

void tst_ColorDifferenceCalculator::valuesOfDifferentConditionsAreNotCompared()
{
    struct Sink : LogInterface
    {
        void log(LogLevel level, LogCategory, const QString &message) override
        {
            if (level == LogLevel::Warning)
                warnings << message;
        }
        QStringList warnings;
    } sink;
    Logger::instance().registerLogger(&sink);
    const LabValue d65(50.0, 10.0, 10.0, ColorimetricCondition("D65", "10"));
    const LabValue illuminantA(50.5, 10.0, 10.0, ColorimetricCondition("A", "2"));
    for (const QString &formula : ColorDifferenceCalculator::formulaNames())
        QVERIFY2(std::isnan(ColorDifferenceCalculator::Default_DE(formula, d65, illuminantA)), qPrintable(formula));
    QVERIFY(std::isnan(ColorDifferenceCalculator::Delta_L(d65, illuminantA)));
    QVERIFY(std::isnan(ColorDifferenceCalculator::Delta_E(illuminantA, d65)));
    Logger::instance().unregisterLogger(&sink);
    QCOMPARE(sink.warnings.size(), ColorDifferenceCalculator::formulaNames().size() + 2);
    QVERIFY2(sink.warnings.first().contains("D65/10") && sink.warnings.first().contains("A/2"),
             qPrintable(sink.warnings.first()));
    // The same condition compares as before.
    const LabValue other(50.5, 10.0, 10.0, ColorimetricCondition("D65", "10"));
    QVERIFY(std::fabs(ColorDifferenceCalculator::Default_DE("CIELab", d65, other) - 0.5) < 1e-12);
}

QTEST_GUILESS_MAIN(tst_ColorDifferenceCalculator)
#include "tst_colordifferencecalculator.moc"
