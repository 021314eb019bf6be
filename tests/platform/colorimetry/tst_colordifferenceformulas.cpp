#include <colorimetry/colordifferenceformulas.h>
#include <colorimetry/colorspaceconversion.h>

#include <QtTest>

#include <cmath>

using namespace vexa;

Q_DECLARE_METATYPE(vexa::CieLab)

namespace {

// CIEDE2000 test data: G. Sharma, W. Wu, E. N. Dalal, "The CIEDE2000 color-difference formula:
// implementation notes, supplementary test data, and mathematical observations", Color Research and
// Application 30(1), 21-30 (2005), Table 1 (kL = kC = kH = 1).
struct SharmaPair
{
    double L1, a1, b1, L2, a2, b2, dE00;
};

const SharmaPair kSharmaPairs[] = {
    {50.0000, 2.6772, -79.7751, 50.0000, 0.0000, -82.7485, 2.0425},
    {50.0000, 3.1571, -77.2803, 50.0000, 0.0000, -82.7485, 2.8615},
    {50.0000, 2.8361, -74.0200, 50.0000, 0.0000, -82.7485, 3.4412},
    {50.0000, -1.3802, -84.2814, 50.0000, 0.0000, -82.7485, 1.0000},
    {50.0000, -1.1848, -84.8006, 50.0000, 0.0000, -82.7485, 1.0000},
    {50.0000, -0.9009, -85.5211, 50.0000, 0.0000, -82.7485, 1.0000},
    {50.0000, 0.0000, 0.0000, 50.0000, -1.0000, 2.0000, 2.3669},
    {50.0000, -1.0000, 2.0000, 50.0000, 0.0000, 0.0000, 2.3669},
    {50.0000, 2.4900, -0.0010, 50.0000, -2.4900, 0.0009, 7.1792},
    {50.0000, 2.4900, -0.0010, 50.0000, -2.4900, 0.0010, 7.1792},
    {50.0000, 2.4900, -0.0010, 50.0000, -2.4900, 0.0011, 7.2195},
    {50.0000, 2.4900, -0.0010, 50.0000, -2.4900, 0.0012, 7.2195},
    {50.0000, -0.0010, 2.4900, 50.0000, 0.0009, -2.4900, 4.8045},
    {50.0000, -0.0010, 2.4900, 50.0000, 0.0010, -2.4900, 4.8045},
    {50.0000, -0.0010, 2.4900, 50.0000, 0.0011, -2.4900, 4.7461},
    {50.0000, 2.5000, 0.0000, 50.0000, 0.0000, -2.5000, 4.3065},
    {50.0000, 2.5000, 0.0000, 73.0000, 25.0000, -18.0000, 27.1492},
    {50.0000, 2.5000, 0.0000, 61.0000, -5.0000, 29.0000, 22.8977},
    {50.0000, 2.5000, 0.0000, 56.0000, -27.0000, -3.0000, 31.9030},
    {50.0000, 2.5000, 0.0000, 58.0000, 24.0000, 15.0000, 19.4535},
    {50.0000, 2.5000, 0.0000, 50.0000, 3.1736, 0.5854, 1.0000},
    {50.0000, 2.5000, 0.0000, 50.0000, 3.2972, 0.0000, 1.0000},
    {50.0000, 2.5000, 0.0000, 50.0000, 1.8634, 0.5757, 1.0000},
    {50.0000, 2.5000, 0.0000, 50.0000, 3.2592, 0.3350, 1.0000},
    {60.2574, -34.0099, 36.2677, 60.4626, -34.1751, 39.4387, 1.2644},
    {63.0109, -31.0961, -5.8663, 62.8187, -29.7946, -4.0864, 1.2630},
    {61.2901, 3.7196, -5.3901, 61.4292, 2.2480, -4.9620, 1.8731},
    {35.0831, -44.1164, 3.7933, 35.0232, -40.0716, 1.5901, 1.8645},
    {22.7233, 20.0904, -46.6940, 23.0331, 14.9730, -42.5619, 2.0373},
    {36.4612, 47.8580, 18.3852, 36.2715, 50.5065, 21.2231, 1.4146},
    {90.8027, -2.0831, 1.4410, 91.1528, -1.6435, 0.0447, 1.4441},
    {90.9257, -0.5406, -0.9208, 88.6381, -0.8985, -0.7239, 1.5381},
    {6.7747, -0.2908, -2.4247, 5.8714, -0.0985, -2.2286, 0.6377},
    {2.0776, 0.0795, -1.1350, 0.9033, -0.0636, -0.5514, 0.9082},
};

} // namespace

class tst_ColorDifferenceFormulas : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void ciede2000Sharma_data();
    void ciede2000Sharma();
    void referenceVectors_data();
    void referenceVectors();
    void extremeColourScienceVectors();
    void signedComponents();
    void din99Coordinates();
    void din99TextileFactors();
    void partsRebuildTotal_data();
    void partsRebuildTotal();
    void degenerateColoursStayFinite_data();
    void degenerateColoursStayFinite();
    void hueWrapsAroundZero();
};

void tst_ColorDifferenceFormulas::ciede2000Sharma_data()
{
    QTest::addColumn<CieLab>("lab1");
    QTest::addColumn<CieLab>("lab2");
    QTest::addColumn<double>("expected");
    int pair = 1;
    for (const SharmaPair &p : kSharmaPairs) {
        QTest::addRow("pair %d", pair++) << CieLab{p.L1, p.a1, p.b1} << CieLab{p.L2, p.a2, p.b2} << p.dE00;
    }
}

void tst_ColorDifferenceFormulas::ciede2000Sharma()
{
    QFETCH(CieLab, lab1);
    QFETCH(CieLab, lab2);
    QFETCH(double, expected);
    const double forward = ColorDifferenceFormulas::ciede2000(lab1, lab2, 1, 1, 1).dE;
    const double backward = ColorDifferenceFormulas::ciede2000(lab2, lab1, 1, 1, 1).dE;
    QVERIFY2(std::fabs(forward - expected) < 1e-4, qPrintable(QString::number(forward, 'f', 6)));
    QVERIFY2(std::fabs(backward - expected) < 1e-4, qPrintable(QString::number(backward, 'f', 6)));
}

void tst_ColorDifferenceFormulas::referenceVectors_data()
{
    QTest::addColumn<CieLab>("standard");
    QTest::addColumn<CieLab>("trial");
    QTest::addColumn<double>("dEab");
    QTest::addColumn<double>("dE94ga");
    QTest::addColumn<double>("dE94tx");
    QTest::addColumn<double>("cmc21");
    QTest::addColumn<double>("cmc11");
    QTest::addColumn<double>("dE00");
    QTest::addColumn<double>("dE99");
    QTest::addColumn<double>("dE99o");
    QTest::newRow("blue") << CieLab{50, 2.6772, -79.7751} << CieLab{50, 0, -82.7485} << 4.0011 << 1.3950 << 1.4230
                          << 1.7387 << 1.7387 << 2.0425 << 1.4721 << 1.7678;
    QTest::newRow("large") << CieLab{50, 2.5, 0} << CieLab{73, 25, -18} << 36.8680 << 34.6892 << 28.2503 << 37.9233
                           << 42.1088 << 27.1492 << 24.6178 << 31.3217;
    QTest::newRow("green") << CieLab{60.2574, -34.0099, 36.2677} << CieLab{60.4626, -34.1751, 39.4387} << 3.1819
                           << 1.3910 << 1.3897 << 1.4205 << 1.4282 << 1.2644 << 1.1772 << 1.7105;
    QTest::newRow("greyish") << CieLab{61.2901, 3.7196, -5.3901} << CieLab{61.4292, 2.2480, -4.9620} << 1.5389
                             << 1.2980 << 1.2884 << 1.7656 << 1.7684 << 1.8731 << 1.2508 << 1.9604;
    QTest::newRow("light") << CieLab{90.9257, -0.5406, -0.9208} << CieLab{88.6381, -0.8985, -0.7239} << 2.3238
                           << 2.3226 << 1.2123 << 0.9901 << 1.7026 << 1.5381 << 1.6137 << 2.0944;
    QTest::newRow("dark") << CieLab{6.7747, -0.2908, -2.4247} << CieLab{5.8714, -0.0985, -2.2286} << 0.9441
                          << 0.9385 << 0.5182 << 0.9528 << 1.8032 << 0.6377 << 1.3903 << 1.1234;
}

void tst_ColorDifferenceFormulas::referenceVectors()
{
    QFETCH(CieLab, standard);
    QFETCH(CieLab, trial);
    QFETCH(double, dEab);
    QFETCH(double, dE94ga);
    QFETCH(double, dE94tx);
    QFETCH(double, cmc21);
    QFETCH(double, cmc11);
    QFETCH(double, dE00);
    QFETCH(double, dE99);
    QFETCH(double, dE99o);
    auto check = [](const char *what, double actual, double expected) {
        if (std::fabs(actual - expected) > 1e-4)
            QFAIL(qPrintable(QStringLiteral("%1: %2, expected %3").arg(what).arg(actual, 0, 'f', 6).arg(expected)));
    };
    using F = ColorDifferenceFormulas;
    check("dE*ab", F::cie76(standard, trial).dE, dEab);
    check("dE94 graphic arts", F::cie94(standard, trial, 1, 1, 1).dE, dE94ga);
    check("dE94 textiles", F::cie94(standard, trial, 2, 1, 1, 0.048, 0.014).dE, dE94tx);
    check("CMC 2:1", F::cmc(standard, trial, 2, 1).dE, cmc21);
    check("CMC 1:1", F::cmc(standard, trial, 1, 1).dE, cmc11);
    check("dE00", F::ciede2000(standard, trial, 1, 1, 1).dE, dE00);
    check("dE99", F::din99(standard, trial, 1, 1).dE, dE99);
    check("dE99o", F::din99o(standard, trial, 1, 1).dE, dE99o);
}

void tst_ColorDifferenceFormulas::extremeColourScienceVectors()
{
    using F = ColorDifferenceFormulas;
    const CieLab s{100, 21.57210357, 272.22819350};
    const CieLab t{100, 426.67945353, 72.39590835};
    QVERIFY(std::fabs(F::cie76(s, t).dE - 451.7133020) < 1e-6);
    QVERIFY(std::fabs(F::cie94(s, t, 1, 1, 1).dE - 83.7792255) < 1e-6);
    QVERIFY(std::fabs(F::cie94(s, t, 2, 1, 1, 0.048, 0.014).dE - 88.3355531) < 1e-6);
    QVERIFY(std::fabs(F::cmc(s, t, 2, 1).dE - 172.7047713) < 1e-6);
    QVERIFY(std::fabs(F::ciede2000(s, t, 1, 1, 1).dE - 94.0356490) < 1e-6);
    const CieLab s2{48.99183622, -0.10561667, 400.65619925};
    const CieLab t2{50.65907324, -0.11671910, 402.82235718};
    QVERIFY(std::fabs(F::cmc(s2, t2, 2, 1).dE - 0.8996999) < 1e-6);
}

void tst_ColorDifferenceFormulas::signedComponents()
{
    using F = ColorDifferenceFormulas;
    const auto green = F::cie76({60.2574, -34.0099, 36.2677}, {60.4626, -34.1751, 39.4387});
    QVERIFY(std::fabs(green.lightness - 0.2052) < 1e-4);
    QVERIFY(std::fabs(green.chroma - 2.4663) < 1e-4);
    QVERIFY(std::fabs(green.hue - (-2.0000)) < 1e-4);
    const auto blue = F::cie76({50, 2.6772, -79.7751}, {50, 0, -82.7485});
    QVERIFY(std::fabs(blue.chroma - 2.9285) < 1e-4);
    QVERIFY(std::fabs(blue.hue - (-2.7263)) < 1e-4);
    // Swapping standard and trial flips every signed part.
    const auto back = F::cie76({50, 0, -82.7485}, {50, 2.6772, -79.7751});
    QVERIFY(std::fabs(back.hue + blue.hue) < 1e-12);
    QVERIFY(std::fabs(back.chroma + blue.chroma) < 1e-12);
}

void tst_ColorDifferenceFormulas::din99Coordinates()
{
    const CieLab din = ColorDifferenceFormulas::toDin99({41.52787529, 52.63858304, 26.92317922}, 1, 1);
    QVERIFY(std::fabs(din.L - 53.22872) < 1e-5); // 105.51 as in DIN 6176
    QVERIFY(std::fabs(din.a - 28.41635) < 1e-5);
    QVERIFY(std::fabs(din.b - 3.89840) < 1e-5);
    const double pair25 = ColorDifferenceFormulas::din99({60.2574, -34.0099, 36.2677},
                                                         {60.4626, -34.1751, 39.4387}, 1, 1).dE;
    QVERIFY(std::fabs(pair25 - 1.1772166) < 1e-6);
}

void tst_ColorDifferenceFormulas::din99TextileFactors()
{
    const double dE = ColorDifferenceFormulas::din99({90.9257, -0.5406, -0.9208}, {88.6381, -0.8985, -0.7239}, 2, 0.5)
                          .dE;
    QVERIFY2(std::fabs(dE - 0.8599) < 1e-4, qPrintable(QString::number(dE, 'f', 6)));
}

void tst_ColorDifferenceFormulas::partsRebuildTotal_data()
{
    QTest::addColumn<int>("formula");
    QTest::newRow("CIE76") << 0;
    QTest::newRow("CIE94") << 1;
    QTest::newRow("CMC") << 2;
    QTest::newRow("DIN99") << 3;
    QTest::newRow("DIN99o") << 4;
}

void tst_ColorDifferenceFormulas::partsRebuildTotal()
{
    QFETCH(int, formula);
    using F = ColorDifferenceFormulas;
    for (const SharmaPair &p : kSharmaPairs) {
        const CieLab s{p.L1, p.a1, p.b1};
        const CieLab t{p.L2, p.a2, p.b2};
        F::Result r;
        switch (formula) {
        case 0: r = F::cie76(s, t); break;
        case 1: r = F::cie94(s, t, 1.5, 1, 1); break;
        case 2: r = F::cmc(s, t, 2, 1); break;
        case 3: r = F::din99(s, t, 1, 1); break;
        default: r = F::din99o(s, t, 1, 1); break;
        }
        const double rebuilt = std::sqrt(r.lightness * r.lightness + r.chroma * r.chroma + r.hue * r.hue);
        QVERIFY2(std::fabs(rebuilt - r.dE) < 1e-9 * std::max(1.0, r.dE),
                 qPrintable(QStringLiteral("%1 vs %2").arg(rebuilt).arg(r.dE)));
    }
}

void tst_ColorDifferenceFormulas::degenerateColoursStayFinite_data()
{
    QTest::addColumn<CieLab>("standard");
    QTest::addColumn<CieLab>("trial");
    QTest::newRow("both black") << CieLab{0, 0, 0} << CieLab{0, 0, 0};
    QTest::newRow("black vs colour") << CieLab{0, 0, 0} << CieLab{0, 3, -4};
    QTest::newRow("grey vs grey") << CieLab{50, 0, 0} << CieLab{52, 0, 0};
    QTest::newRow("opposite hues") << CieLab{50, 10, 0} << CieLab{50, -10, 0};
}

void tst_ColorDifferenceFormulas::degenerateColoursStayFinite()
{
    QFETCH(CieLab, standard);
    QFETCH(CieLab, trial);
    using F = ColorDifferenceFormulas;
    for (const F::Result &r : {F::cie76(standard, trial), F::cie94(standard, trial, 1, 1, 1),
                               F::cmc(standard, trial, 2, 1), F::ciede2000(standard, trial, 1, 1, 1),
                               F::din99(standard, trial, 1, 1), F::din99o(standard, trial, 1, 1)}) {
        QVERIFY(std::isfinite(r.dE) && std::isfinite(r.lightness) && std::isfinite(r.chroma) && std::isfinite(r.hue));
        QVERIFY(r.dE >= 0.0);
    }
    // Black against a chromatic colour: lcms2's CMC answers 0 when both L* are 0, ours must not.
    QVERIFY(F::cmc({0, 0, 0}, {0, 3, -4}, 1, 1).dE > 0.0);
}

void tst_ColorDifferenceFormulas::hueWrapsAroundZero()
{
    using C = ColorSpaceConversion;
    // Hues 359° and 1° are 2° apart, counter-clockwise from the first to the second.
    const double r = 20.0;
    auto point = [r](double degrees) {
        const double rad = degrees * M_PI / 180.0;
        return CieLab{50, r * std::cos(rad), r * std::sin(rad)};
    };
    const CieLab h359 = point(359.0);
    const CieLab h1 = point(1.0);
    QVERIFY(std::fabs(C::hueDifference(359.0, 1.0) - 2.0) < 1e-12);
    QVERIFY(std::fabs(C::hueDifference(1.0, 359.0) + 2.0) < 1e-12);
    QCOMPARE(C::hueDifference(0.0, 180.0), 180.0);
    const double dH = ColorDifferenceFormulas::cie76(h359, h1).hue;
    QVERIFY(std::fabs(dH - 2.0 * r * std::sin(M_PI / 180.0)) < 1e-9);
    QVERIFY(ColorDifferenceFormulas::ciede2000(h359, h1, 1, 1, 1).dE < 1.0);
    QVERIFY(ColorDifferenceFormulas::cmc(h359, h1, 1, 1).dE < 2.0);
    // A tiny negative b* must not give a hue of exactly 360.
    const double h = C::labToLCh({50, 1.0, -1e-18}).h;
    QVERIFY(h >= 0.0 && h < 360.0);
    QCOMPARE(C::hueAngle(0.0, 0.0), 0.0);
}

QTEST_GUILESS_MAIN(tst_ColorDifferenceFormulas)
#include "tst_colordifferenceformulas.moc"
