#include <colorimetry/colorconverter.h>
#include <colorimetry/colordifferencecalculator.h>
#include <colorimetry/colorindicescalculator.h>

#include "metamers.h"

#include <domain/reflectancespectrum.h>

#include <QtTest>

#include <cmath>
#include <limits>
#include <stdexcept>

using namespace vexa;

// The special metamerism index for a change of illuminant, on pairs whose answer is known:
// a pair that matches under the reference (standard plus a metameric black) keeps its
// whole difference under the test light; a pair that differs only by a constant factor
// has none left after the multiplicative correction.
class tst_MetamerismIndex : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void identicalPairHasNone_data();
    void identicalPairHasNone();
    void scaledTrialIsCorrectedAway();
    void metamericPairKeepsTheTestDifference_data();
    void metamericPairKeepsTheTestDifference();
    void unusableSpectraGiveNaN_data();
    void unusableSpectraGiveNaN();
    void unknownFormulaThrows();
};

namespace {

const ColorimetricCondition D65(QStringLiteral("D65"), QStringLiteral("10"));
const ColorimetricCondition A(QStringLiteral("A"), QStringLiteral("10"));
const ColorimetricCondition F11(QStringLiteral("F11"), QStringLiteral("10"));

QVector<double> standardValues()
{
    QVector<double> values;
    for (int i = 0; i < 31; ++i)
        values << 0.35 + 0.25 * std::exp(-std::pow((400 + 10 * i - 560) / 60.0, 2));
    return values;
}

ReflectanceSpectrum spectrum(const QVector<double> &values)
{
    return ReflectanceSpectrum(values, 400, 10);
}

double deltaE(const ReflectanceSpectrum &s, const ReflectanceSpectrum &t, const ColorimetricCondition &c,
              const QString &formula = QStringLiteral("CIELab"))
{
    return ColorDifferenceCalculator::Default_DE(formula, ColorConverter::toLab(s, c), ColorConverter::toLab(t, c));
}

} // namespace

void tst_MetamerismIndex::identicalPairHasNone_data()
{
    QTest::addColumn<QString>("formula");
    for (const QString &formula : ColorDifferenceCalculator::formulaNames())
        QTest::newRow(qPrintable(formula)) << formula;
}

void tst_MetamerismIndex::identicalPairHasNone()
{
    QFETCH(QString, formula);
    const ReflectanceSpectrum s = spectrum(standardValues());
    QVERIFY(std::fabs(ColorIndicesCalculator::MetamerismIndex(s, s, D65, A, formula)) < 1e-9);
    QVERIFY(std::fabs(ColorIndicesCalculator::MetamerismIndex(s, s, D65, F11, formula)) < 1e-9);
}

void tst_MetamerismIndex::scaledTrialIsCorrectedAway()
{
    QVector<double> darker = standardValues();
    for (double &v : darker)
        v *= 0.8;
    const ReflectanceSpectrum s = spectrum(standardValues());
    const ReflectanceSpectrum t = spectrum(darker);
    QVERIFY(deltaE(s, t, A) > 3.0);
    QVERIFY(std::fabs(ColorIndicesCalculator::MetamerismIndex(s, t, D65, A, QStringLiteral("CIELab"))) < 1e-9);
}

void tst_MetamerismIndex::metamericPairKeepsTheTestDifference_data()
{
    QTest::addColumn<QString>("formula");
    QTest::newRow("CIELab") << "CIELab";
    QTest::newRow("CIE2000") << "CIE2000";
}

void tst_MetamerismIndex::metamericPairKeepsTheTestDifference()
{
    QFETCH(QString, formula);
    const ReflectanceSpectrum s = spectrum(standardValues());
    const QVector<double> metameric = metamers::metamer(standardValues(), 400, 10, D65);
    for (double v : metameric)
        QVERIFY(v > 0.0);
    const ReflectanceSpectrum t = spectrum(metameric);
    QVERIFY2(deltaE(s, t, D65, formula) < 1e-6, qPrintable(QString::number(deltaE(s, t, D65, formula))));
    for (const ColorimetricCondition &test : {A, F11}) {
        const double difference = deltaE(s, t, test, formula);
        QVERIFY2(difference > 0.2, qPrintable(QString::number(difference)));
        const double index = ColorIndicesCalculator::MetamerismIndex(s, t, D65, test, formula);
        QVERIFY2(std::fabs(index - difference) < 1e-5,
                 qPrintable(QStringLiteral("%1 vs %2").arg(index).arg(difference)));
    }
}

void tst_MetamerismIndex::unusableSpectraGiveNaN_data()
{
    QTest::addColumn<QVector<double>>("trial");
    QTest::addColumn<QString>("test");
    QVector<double> withNaN = standardValues();
    withNaN[3] = std::numeric_limits<double>::quiet_NaN();
    QTest::newRow("empty trial") << QVector<double>() << "A/10";
    QTest::newRow("NaN in the trial") << withNaN << "A/10";
    QTest::newRow("black trial") << QVector<double>(31, 0.0) << "A/10";
    QTest::newRow("unknown test illuminant") << standardValues() << "X/10";
}

void tst_MetamerismIndex::unusableSpectraGiveNaN()
{
    QFETCH(QVector<double>, trial);
    QFETCH(QString, test);
    const QStringList parts = test.split(QLatin1Char('/'));
    const double index = ColorIndicesCalculator::MetamerismIndex(spectrum(standardValues()), spectrum(trial), D65,
                                                                 ColorimetricCondition(parts[0], parts[1]),
                                                                 QStringLiteral("CIE2000"));
    QVERIFY(std::isnan(index));
}

void tst_MetamerismIndex::unknownFormulaThrows()
{
    const ReflectanceSpectrum s = spectrum(standardValues());
    QVERIFY_EXCEPTION_THROWN(ColorIndicesCalculator::MetamerismIndex(s, s, D65, A, QStringLiteral("nonsense")),
                             std::invalid_argument);
}

QTEST_APPLESS_MAIN(tst_MetamerismIndex)
#include "tst_metamerismindex.moc"
