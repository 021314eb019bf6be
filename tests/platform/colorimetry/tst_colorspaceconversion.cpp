#include <colorimetry/colorindicescalculator.h>
#include <colorimetry/colorspaceconversion.h>

#include <QtTest>

#include <cmath>

using namespace vexa;

class tst_ColorSpaceConversion : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void xyzToLabReference();
    void labXyzRoundTrip();
    void lchRoundTrip_data();
    void lchRoundTrip();
    void srgbOfWhiteBlackAndPrimaries();
    void srgbOutOfGamutKeepsHue();
    void srgbOfNaNIsBlack();
    void flopIndex_data();
    void flopIndex();
    void flopIndexUndefined();
};

void tst_ColorSpaceConversion::xyzToLabReference()
{
    const CieXYZ white{95.04559, 100.0, 108.90578};
    const CieLab lab = ColorSpaceConversion::xyzToLab({20.654008, 12.197225, 5.136952}, white);
    QVERIFY(std::fabs(lab.L - 41.527875) < 1e-5);
    QVERIFY(std::fabs(lab.a - 52.638583) < 1e-5);
    QVERIFY(std::fabs(lab.b - 26.923179) < 1e-5);
    const CieLab tabulated = ColorSpaceConversion::xyzToLab({20.654008, 12.197225, 5.136952},
                                                            {95.047, 100.0, 108.883});
    QVERIFY(std::fabs(tabulated.a - 52.637099) < 1e-5);
    QVERIFY(std::fabs(tabulated.b - 26.918141) < 1e-5);
}

void tst_ColorSpaceConversion::labXyzRoundTrip()
{
    const CieXYZ white{96.422, 100.0, 82.521};
    // Includes the dark, linear part of the CIELAB function and a metallic highlight above L* = 100.
    for (const CieLab &lab : {CieLab{41.5, 52.6, 26.9}, CieLab{3.0, 1.0, -2.0}, CieLab{118.0, -0.9, 1.6}}) {
        const CieLab back = ColorSpaceConversion::xyzToLab(ColorSpaceConversion::labToXyz(lab, white), white);
        QVERIFY(std::fabs(back.L - lab.L) < 1e-9);
        QVERIFY(std::fabs(back.a - lab.a) < 1e-9);
        QVERIFY(std::fabs(back.b - lab.b) < 1e-9);
    }
}

void tst_ColorSpaceConversion::lchRoundTrip_data()
{
    QTest::addColumn<double>("a");
    QTest::addColumn<double>("b");
    QTest::addColumn<double>("h");
    QTest::newRow("first quadrant") << 10.0 << 10.0 << 45.0;
    QTest::newRow("negative b") << 10.0 << -10.0 << 315.0;
    QTest::newRow("negative a") << -10.0 << 0.0 << 180.0;
    QTest::newRow("achromatic") << 0.0 << 0.0 << 0.0;
}

void tst_ColorSpaceConversion::lchRoundTrip()
{
    QFETCH(double, a);
    QFETCH(double, b);
    QFETCH(double, h);
    const CieLCh lch = ColorSpaceConversion::labToLCh({50, a, b});
    QVERIFY(std::fabs(lch.h - h) < 1e-9);
    QVERIFY(std::fabs(lch.C - std::hypot(a, b)) < 1e-9);
    const CieLab back = ColorSpaceConversion::lchToLab(lch);
    QVERIFY(std::fabs(back.a - a) < 1e-9);
    QVERIFY(std::fabs(back.b - b) < 1e-9);
}

void tst_ColorSpaceConversion::srgbOfWhiteBlackAndPrimaries()
{
    const CieXYZ d50{96.422, 100.0, 82.521};
    const CieXYZ d65{95.047, 100.0, 108.883};
    using Rgb = std::array<std::uint8_t, 3>;
    QCOMPARE(ColorSpaceConversion::labToSrgb({100, 0, 0}, d65), (Rgb{255, 255, 255}));
    // The white of another illuminant is adapted to display white.
    QCOMPARE(ColorSpaceConversion::labToSrgb({100, 0, 0}, d50), (Rgb{255, 255, 255}));
    QCOMPARE(ColorSpaceConversion::labToSrgb({0, 0, 0}, d65), (Rgb{0, 0, 0}));
    // sRGB red is L* 53.24, a* 80.09, b* 67.20 under D65.
    const Rgb red = ColorSpaceConversion::labToSrgb({53.2408, 80.0925, 67.2032}, d65);
    QVERIFY(red[0] >= 254 && red[1] <= 1 && red[2] <= 1);
    // A mid grey.
    const Rgb grey = ColorSpaceConversion::labToSrgb({53.585, 0, 0}, d65);
    QVERIFY(std::abs(int(grey[0]) - 128) <= 1 && grey[0] == grey[1] && grey[1] == grey[2]);
}

void tst_ColorSpaceConversion::srgbOutOfGamutKeepsHue()
{
    const CieXYZ d65{95.047, 100.0, 108.883};
    // Far outside the gamut: a very saturated green. Chroma is reduced, so it stays green and not black.
    const auto rgb = ColorSpaceConversion::labToSrgb({60, -150, 80}, d65);
    QVERIFY(rgb[1] > rgb[0] && rgb[1] > rgb[2]);
    QVERIFY(rgb[1] > 100);
    // Brighter than white: clipped to white instead of wrapping.
    const auto highlight = ColorSpaceConversion::labToSrgb({118, -0.9, 1.6}, d65);
    QVERIFY(highlight[0] >= 250 && highlight[1] >= 250 && highlight[2] >= 250);
}

void tst_ColorSpaceConversion::srgbOfNaNIsBlack()
{
    const auto rgb = ColorSpaceConversion::labToSrgb({qQNaN(), 0, 0}, {95.047, 100.0, 108.883});
    QCOMPARE(int(rgb[0]) + int(rgb[1]) + int(rgb[2]), 0);
}

void tst_ColorSpaceConversion::flopIndex_data()
{
    QTest::addColumn<double>("l15");
    QTest::addColumn<double>("l45");
    QTest::addColumn<double>("l110");
    QTest::addColumn<double>("expected");
    QTest::newRow("solid light") << 95.0 << 94.0 << 93.0 << 0.1167;
    QTest::newRow("solid") << 90.0 << 88.0 << 86.0 << 0.2666;
    QTest::newRow("silver") << 118.0 << 62.0 << 28.0 << 11.4158;
    QTest::newRow("metallic") << 130.0 << 60.0 << 20.0 << 14.6720;
    QTest::newRow("dark metallic") << 100.0 << 45.0 << 15.0 << 14.1138;
    QTest::newRow("high flop") << 140.0 << 50.0 << 12.0 << 20.3068;
    QTest::newRow("reversed noise") << 93.0 << 94.0 << 95.0 << -0.1167;
    QTest::newRow("flat") << 50.0 << 50.0 << 50.0 << 0.0;
}

void tst_ColorSpaceConversion::flopIndex()
{
    QFETCH(double, l15);
    QFETCH(double, l45);
    QFETCH(double, l110);
    QFETCH(double, expected);
    const double fi = ColorIndicesCalculator::flopIndex(l15, l45, l110);
    QVERIFY2(std::fabs(fi - expected) < 1e-4, qPrintable(QString::number(fi, 'f', 6)));
}

void tst_ColorSpaceConversion::flopIndexUndefined()
{
    QVERIFY(std::isnan(ColorIndicesCalculator::flopIndex(100, 0, 20)));
    QVERIFY(std::isnan(ColorIndicesCalculator::flopIndex(100, -1, 20)));
    QVERIFY(std::isnan(ColorIndicesCalculator::flopIndex(qQNaN(), 50, 20)));
}

QTEST_GUILESS_MAIN(tst_ColorSpaceConversion)
#include "tst_colorspaceconversion.moc"
