#include <colorimetry/colorspaceconversion.h>
#include <colorimetry/spectralweights.h>

#include <QtTest>

#include <cmath>
#include <thread>
#include <vector>

using namespace vexa;

class tst_SpectralWeights : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void whitePointMatchesPublishedValues_data();
    void whitePointMatchesPublishedValues();
    void perfectWhiteIsExactlyLab100_data();
    void perfectWhiteIsExactlyLab100();
    void coarseGridsAgreeWithFineGrid_data();
    void coarseGridsAgreeWithFineGrid();
    void constantExtrapolationOutsideMeasuredRange();
    void rejectsUnknownConditionsAndBadGrids_data();
    void rejectsUnknownConditionsAndBadGrids();
    void acceptsNameVariants();
    void concurrentLookupsShareOneResult();
};

void tst_SpectralWeights::whitePointMatchesPublishedValues_data()
{
    QTest::addColumn<QString>("illuminant");
    QTest::addColumn<QString>("observer");
    QTest::addColumn<double>("X");
    QTest::addColumn<double>("Z");
    // ASTM E308-01 white points (Y = 100) as reproduced in the CIE data notes.
    QTest::newRow("D65/2") << "D65" << "2" << 95.047 << 108.883;
    QTest::newRow("D65/10") << "D65" << "10" << 94.811 << 107.304;
    QTest::newRow("D50/2") << "D50" << "2" << 96.422 << 82.521;
    QTest::newRow("D50/10") << "D50" << "10" << 96.720 << 81.427;
    QTest::newRow("A/2") << "A" << "2" << 109.850 << 35.585;
    QTest::newRow("A/10") << "A" << "10" << 111.144 << 35.200;
    QTest::newRow("C/2") << "C" << "2" << 98.074 << 118.232;
    QTest::newRow("D55/2") << "D55" << "2" << 95.682 << 92.149;
    QTest::newRow("D75/10") << "D75" << "10" << 94.416 << 120.641;
    QTest::newRow("F2/2") << "F2" << "2" << 99.186 << 67.393;
    QTest::newRow("F7/2") << "F7" << "2" << 95.041 << 108.747;
    QTest::newRow("F11/2") << "F11" << "2" << 100.962 << 64.350;
}

void tst_SpectralWeights::whitePointMatchesPublishedValues()
{
    QFETCH(QString, illuminant);
    QFETCH(QString, observer);
    QFETCH(double, X);
    QFETCH(double, Z);
    // The white does not depend on the grid: 1 nm, and the instrument grids 400-700/10 and 400-700/20.
    for (const auto &grid : {std::make_tuple(360.0, 1.0, 471), std::make_tuple(400.0, 10.0, 31),
                             std::make_tuple(400.0, 20.0, 16)}) {
        const auto weights = SpectralWeights::forGrid(illuminant, observer, std::get<0>(grid), std::get<1>(grid),
                                                      std::get<2>(grid));
        QVERIFY(weights);
        const CieXYZ white = weights->whitePoint();
        QVERIFY2(std::fabs(white.X - X) <= 0.02, qPrintable(QString::number(white.X, 'f', 4)));
        QVERIFY2(std::fabs(white.Y - 100.0) <= 1e-9, qPrintable(QString::number(white.Y, 'f', 12)));
        QVERIFY2(std::fabs(white.Z - Z) <= 0.02, qPrintable(QString::number(white.Z, 'f', 4)));
    }
}

void tst_SpectralWeights::perfectWhiteIsExactlyLab100_data()
{
    QTest::addColumn<QString>("illuminant");
    QTest::addColumn<QString>("observer");
    for (const char *illuminant : {"A", "C", "D50", "D55", "D65", "D75", "F2", "F7", "F11", "F12"}) {
        for (const char *observer : {"2", "10"})
            QTest::addRow("%s/%s", illuminant, observer) << illuminant << observer;
    }
}

void tst_SpectralWeights::perfectWhiteIsExactlyLab100()
{
    QFETCH(QString, illuminant);
    QFETCH(QString, observer);
    for (const auto &grid : {std::make_tuple(400.0, 10.0, 31), std::make_tuple(380.0, 20.0, 19),
                             std::make_tuple(420.0, 10.0, 28), std::make_tuple(360.0, 5.0, 95)}) {
        const auto weights = SpectralWeights::forGrid(illuminant, observer, std::get<0>(grid), std::get<1>(grid),
                                                      std::get<2>(grid));
        QVERIFY(weights);
        const std::vector<double> ones(std::size_t(weights->count()), 1.0);
        const CieLab lab = ColorSpaceConversion::xyzToLab(weights->tristimulus(ones.data()), weights->whitePoint());
        QCOMPARE(lab.L, 100.0);
        QCOMPARE(lab.a, 0.0);
        QCOMPARE(lab.b, 0.0);
    }
}

void tst_SpectralWeights::coarseGridsAgreeWithFineGrid_data()
{
    QTest::addColumn<double>("start");
    QTest::addColumn<double>("interval");
    QTest::addColumn<double>("tolerance");
    QTest::newRow("5 nm") << 360.0 << 5.0 << 0.01;
    QTest::newRow("10 nm") << 400.0 << 10.0 << 0.1;
    QTest::newRow("20 nm") << 400.0 << 20.0 << 0.3;
    QTest::newRow("10 nm from 380") << 380.0 << 10.0 << 0.1;
}

void tst_SpectralWeights::coarseGridsAgreeWithFineGrid()
{
    QFETCH(double, start);
    QFETCH(double, interval);
    QFETCH(double, tolerance);
    // A smooth reflectance (a broad green bump) sampled on a coarse grid must give nearly the XYZ of
    // the same curve at 1 nm: the weights interpolate, they do not sample.
    auto reflectance = [](double nm) { return 0.2 + 0.5 * std::exp(-std::pow((nm - 540.0) / 60.0, 2.0)); };
    const auto fine = SpectralWeights::forGrid("D65", "10", 360.0, 1.0, 471);
    std::vector<double> fineValues;
    for (int nm = 360; nm <= 830; ++nm)
        fineValues.push_back(reflectance(nm));
    const CieXYZ expected = fine->tristimulus(fineValues.data());

    const int count = int((700.0 - start) / interval) + 1;
    const auto coarse = SpectralWeights::forGrid("D65", "10", start, interval, count);
    std::vector<double> values;
    for (int i = 0; i < count; ++i)
        values.push_back(reflectance(start + i * interval));
    const CieXYZ actual = coarse->tristimulus(values.data());
    QVERIFY2(std::fabs(actual.X - expected.X) < tolerance, qPrintable(QString::number(actual.X - expected.X)));
    QVERIFY2(std::fabs(actual.Y - expected.Y) < tolerance, qPrintable(QString::number(actual.Y - expected.Y)));
    QVERIFY2(std::fabs(actual.Z - expected.Z) < tolerance, qPrintable(QString::number(actual.Z - expected.Z)));
}

void tst_SpectralWeights::constantExtrapolationOutsideMeasuredRange()
{
    // A spectrum that is constant 0.5 from 420 to 700 nm is treated as 0.5 everywhere.
    const auto weights = SpectralWeights::forGrid("D50", "2", 420.0, 10.0, 29);
    const std::vector<double> half(29, 0.5);
    const CieXYZ xyz = weights->tristimulus(half.data());
    QCOMPARE(xyz.Y, 0.5 * weights->whitePoint().Y);
    QVERIFY(std::fabs(xyz.X - 0.5 * weights->whitePoint().X) < 1e-9);
}

void tst_SpectralWeights::rejectsUnknownConditionsAndBadGrids_data()
{
    QTest::addColumn<QString>("illuminant");
    QTest::addColumn<QString>("observer");
    QTest::addColumn<double>("start");
    QTest::addColumn<double>("interval");
    QTest::addColumn<int>("count");
    QTest::newRow("unknown illuminant") << "D93" << "10" << 400.0 << 10.0 << 31;
    QTest::newRow("unknown observer") << "D65" << "4" << 400.0 << 10.0 << 31;
    QTest::newRow("empty") << "D65" << "10" << 400.0 << 10.0 << 0;
    QTest::newRow("zero interval") << "D65" << "10" << 400.0 << 0.0 << 31;
    QTest::newRow("negative interval") << "D65" << "10" << 400.0 << -10.0 << 31;
    QTest::newRow("NaN start") << "D65" << "10" << qQNaN() << 10.0 << 31;
}

void tst_SpectralWeights::rejectsUnknownConditionsAndBadGrids()
{
    QFETCH(QString, illuminant);
    QFETCH(QString, observer);
    QFETCH(double, start);
    QFETCH(double, interval);
    QFETCH(int, count);
    QVERIFY(!SpectralWeights::forGrid(illuminant, observer, start, interval, count));
}

void tst_SpectralWeights::acceptsNameVariants()
{
    QCOMPARE(SpectralWeights::illuminantName("fl11"), QStringLiteral("F11"));
    QCOMPARE(SpectralWeights::illuminantName(" d65 "), QStringLiteral("D65"));
    QCOMPARE(SpectralWeights::observerName(QStringLiteral("10\u00b0")), QStringLiteral("10"));
    QCOMPARE(SpectralWeights::observerName("2 deg"), QStringLiteral("2"));
    QVERIFY(SpectralWeights::illuminantName("X").isEmpty());
}

void tst_SpectralWeights::concurrentLookupsShareOneResult()
{
    std::vector<std::thread> threads;
    std::vector<CieXYZ> whites(8);
    for (std::size_t i = 0; i < whites.size(); ++i) {
        threads.emplace_back([i, &whites] {
            for (int n = 0; n < 50; ++n)
                whites[i] = SpectralWeights::forGrid("F12", "10", 400.0 + n % 3, 10.0, 31)->whitePoint();
        });
    }
    for (auto &thread : threads)
        thread.join();
    for (const CieXYZ &white : whites) {
        QCOMPARE(white.X, whites.front().X);
        QCOMPARE(white.Z, whites.front().Z);
    }
}

QTEST_GUILESS_MAIN(tst_SpectralWeights)
#include "tst_spectralweights.moc"
