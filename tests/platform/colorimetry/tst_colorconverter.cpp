#include <colorimetry/colorconverter.h>

#include <domain/appearancevalues.h>
#include <domain/geometry.h>
#include <domain/reflectancespectrum.h>

#include <QtTest>

#include <cmath>

using namespace vexa;

namespace {

std::shared_ptr<ReflectanceSpectrum> spectrumAt(const char *geometry, const QVector<double> &values,
                                                double start = 400.0, double interval = 10.0)
{
    auto spectrum = std::make_shared<ReflectanceSpectrum>(values, start, interval);
    spectrum->setGeometry(Geometry(geometry));
    return spectrum;
}

} // namespace

class tst_ColorConverter : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void perfectWhiteEveryCondition_data();
    void perfectWhiteEveryCondition();
    void gridsAndStartsAgree_data();
    void gridsAndStartsAgree();
    void unusableSpectraGiveEmptyValues_data();
    void unusableSpectraGiveEmptyValues();
    void gridsOutsideTheVisibleGiveNoColour_data();
    void gridsOutsideTheVisibleGiveNoColour();
    void highlightsAreNotClipped();
    void toLabValuePicksTheGeometry();
    void toLabValueUsesStoredLabOfSameCondition();
    void lchRoundTripKeepsConditions();
    void displayColours();
};

void tst_ColorConverter::perfectWhiteEveryCondition_data()
{
    QTest::addColumn<ColorimetricCondition>("condition");
    for (const ColorimetricCondition &condition : ColorimetricCondition::availableConditions())
        QTest::newRow(qPrintable(condition.toString())) << condition;
}

void tst_ColorConverter::perfectWhiteEveryCondition()
{
    QFETCH(ColorimetricCondition, condition);
    const ReflectanceSpectrum white(QVector<double>(31, 1.0), 400.0, 10.0);
    const LabValue lab = ColorConverter::toLab(white, condition);
    QCOMPARE(lab.l(), 100.0);
    QCOMPARE(lab.a(), 0.0);
    QCOMPARE(lab.b(), 0.0);
    QCOMPARE(lab.colorimetricCondition(), condition);
    const XYZValue xyz = ColorConverter::toXYZ(white, condition);
    const XYZValue reference = ColorConverter::whitePoint(condition);
    QVERIFY(std::fabs(xyz.x() - reference.x()) < 1e-9);
    QVERIFY(std::fabs(xyz.z() - reference.z()) < 1e-9);
}

void tst_ColorConverter::gridsAndStartsAgree_data()
{
    QTest::addColumn<double>("start");
    QTest::addColumn<double>("interval");
    QTest::addColumn<int>("count");
    QTest::newRow("400-700/20") << 400.0 << 20.0 << 16;
    QTest::newRow("380-780/10") << 380.0 << 10.0 << 41;
    QTest::newRow("420-700/10") << 420.0 << 10.0 << 29;
    QTest::newRow("360-830/5") << 360.0 << 5.0 << 95;
}

void tst_ColorConverter::gridsAndStartsAgree()
{
    QFETCH(double, start);
    QFETCH(double, interval);
    QFETCH(int, count);
    // A smooth orange reflectance; the reference is the same curve at 400-700/10.
    auto r = [](double nm) { return 0.08 + 0.6 / (1.0 + std::exp(-(nm - 580.0) / 15.0)); };
    QVector<double> reference;
    for (int i = 0; i < 31; ++i)
        reference.append(r(400.0 + 10.0 * i));
    QVector<double> values;
    for (int i = 0; i < count; ++i)
        values.append(r(start + interval * i));
    const ColorimetricCondition d65(QStringLiteral("D65"), QStringLiteral("10"));
    const LabValue expected = ColorConverter::toLab(ReflectanceSpectrum(reference, 400.0, 10.0), d65);
    const LabValue actual = ColorConverter::toLab(ReflectanceSpectrum(values, start, interval), d65);
    QVERIFY(actual.isValid());
    QVERIFY2(std::fabs(actual.l() - expected.l()) < 0.3 && std::fabs(actual.a() - expected.a()) < 0.6
                 && std::fabs(actual.b() - expected.b()) < 0.6,
             qPrintable(actual.toString() + " vs " + expected.toString()));
    QVERIFY(actual.a() > 20.0 && actual.b() > 20.0); // orange
}

void tst_ColorConverter::unusableSpectraGiveEmptyValues_data()
{
    QTest::addColumn<QVector<double>>("values");
    QTest::addColumn<double>("interval");
    QTest::addColumn<QString>("illuminant");
    QTest::newRow("empty") << QVector<double>() << 10.0 << "D65";
    QTest::newRow("NaN") << QVector<double>{0.5, qQNaN(), 0.5} << 10.0 << "D65";
    QTest::newRow("infinite") << QVector<double>{0.5, qInf(), 0.5} << 10.0 << "D65";
    QTest::newRow("zero interval") << QVector<double>{0.5, 0.5, 0.5} << 0.0 << "D65";
    QTest::newRow("unknown illuminant") << QVector<double>{0.5, 0.5, 0.5} << 10.0 << "D93";
}

void tst_ColorConverter::unusableSpectraGiveEmptyValues()
{
    QFETCH(QVector<double>, values);
    QFETCH(double, interval);
    QFETCH(QString, illuminant);
    const ReflectanceSpectrum spectrum(values, 400.0, interval);
    const ColorimetricCondition condition(illuminant, QStringLiteral("10"));
    QVERIFY(!ColorConverter::toLab(spectrum, condition).isValid());
    QVERIFY(!ColorConverter::toLCh(spectrum, condition).isValid());
    QVERIFY(!ColorConverter::toXYZ(spectrum, condition).isValid());
}

void tst_ColorConverter::gridsOutsideTheVisibleGiveNoColour_data()
{
    QTest::addColumn<double>("start");
    QTest::addColumn<double>("interval");
    QTest::addColumn<int>("count");
    QTest::addColumn<bool>("coloured");
    QTest::newRow("near infrared 900-1000") << 900.0 << 10.0 << 11 << false;
    QTest::newRow("ultraviolet 200-350") << 200.0 << 10.0 << 16 << false;
    QTest::newRow("one value at 550") << 550.0 << 10.0 << 1 << false;
    QTest::newRow("450-650") << 450.0 << 10.0 << 21 << false;
    QTest::newRow("red end 600-830") << 600.0 << 10.0 << 24 << false;
    QTest::newRow("400-700") << 400.0 << 10.0 << 31 << true;
    QTest::newRow("420-700") << 420.0 << 10.0 << 29 << true;
    QTest::newRow("380-780") << 380.0 << 10.0 << 41 << true;
    QTest::newRow("300-1100 (beyond both ends)") << 300.0 << 10.0 << 81 << true;
}

void tst_ColorConverter::gridsOutsideTheVisibleGiveNoColour()
{
    QFETCH(double, start);
    QFETCH(double, interval);
    QFETCH(int, count);
    QFETCH(bool, coloured);
    // A grey 50 % reflector: a grid that misses the visible must not read as a plausible grey.
    const ReflectanceSpectrum spectrum(QVector<double>(count, 0.5), start, interval);
    for (const char *condition : {"D65/10", "A/2", "F11/10"}) {
        const ColorimetricCondition c = ColorimetricCondition::fromString(condition);
        QCOMPARE(ColorConverter::toLab(spectrum, c).isValid(), coloured);
        QCOMPARE(ColorConverter::toXYZ(spectrum, c).isValid(), coloured);
    }
}

void tst_ColorConverter::highlightsAreNotClipped()
{
    const ReflectanceSpectrum highlight(QVector<double>(31, 1.6), 400.0, 10.0);
    const LabValue lab = ColorConverter::toLab(highlight, ColorimetricCondition());
    QVERIFY(lab.l() > 115.0);
}

void tst_ColorConverter::toLabValuePicksTheGeometry()
{
    AppearanceValues values;
    values.addColorValues(spectrumAt("45as15", QVector<double>(31, 0.9)));
    values.addColorValues(spectrumAt("45as110", QVector<double>(31, 0.05)));
    const ColorimetricCondition condition;
    const LabValue lab15 = ColorConverter::toLabValue(values, Geometry("45as15"), condition);
    const LabValue lab110 = ColorConverter::toLabValue(values, Geometry("45as110"), condition);
    QVERIFY(lab15.isValid() && lab110.isValid());
    QVERIFY(lab15.l() > 90.0 && lab110.l() < 30.0);
    QCOMPARE(lab15.physicalCondition().geometryValue(), Geometry("45as15"));
    QVERIFY(!ColorConverter::toLabValue(values, Geometry("45as45"), condition).isValid());
    QVERIFY(!ColorConverter::toLabValue(values, Geometry(), condition).isValid());
}

void tst_ColorConverter::toLabValueUsesStoredLabOfSameCondition()
{
    const ColorimetricCondition d65(QStringLiteral("D65"), QStringLiteral("10"));
    auto lab = std::make_shared<LabValue>(50.0, 10.0, -5.0, d65);
    lab->setGeometry(Geometry("45as45"));
    AppearanceValues values;
    values.addColorValues(lab);
    const LabValue same = ColorConverter::toLabValue(values, Geometry("45as45"), d65);
    QCOMPARE(same.l(), 50.0);
    QCOMPARE(same.b(), -5.0);
    // A stored L*a*b* of another condition cannot be converted without the spectrum.
    const ColorimetricCondition a2(QStringLiteral("A"), QStringLiteral("2"));
    QVERIFY(!ColorConverter::toLabValue(values, Geometry("45as45"), a2).isValid());
}

void tst_ColorConverter::lchRoundTripKeepsConditions()
{
    const ColorimetricCondition f11(QStringLiteral("F11"), QStringLiteral("2"));
    LabValue lab(40.0, -20.0, -20.0, f11);
    lab.setGeometry(Geometry("45as25"));
    const LChValue lch = ColorConverter::toLCh(lab);
    QVERIFY(std::fabs(lch.h() - 225.0) < 1e-9);
    QCOMPARE(lch.colorimetricCondition(), f11);
    const LabValue back = ColorConverter::toLab(lch);
    QVERIFY(std::fabs(back.a() + 20.0) < 1e-9 && std::fabs(back.b() + 20.0) < 1e-9);
    QCOMPARE(back.physicalCondition().geometryValue(), Geometry("45as25"));
    QVERIFY(!ColorConverter::toLCh(LabValue()).isValid());
}

void tst_ColorConverter::displayColours()
{
    for (const ColorimetricCondition &condition : ColorimetricCondition::availableConditions()) {
        const RGBValue white = ColorConverter::toRGB(LabValue(100.0, 0.0, 0.0, condition));
        QVERIFY2(white.R() >= 254 && white.G() >= 254 && white.B() >= 254, qPrintable(condition.toString()));
    }
    const RGBValue invalid = ColorConverter::toRGB(LabValue());
    QCOMPARE(invalid, RGBValue(0, 0, 0));
    const XYZValue d65white = ColorConverter::whitePoint(ColorimetricCondition());
    QCOMPARE(ColorConverter::toRGB(d65white), RGBValue(255, 255, 255));
}

QTEST_GUILESS_MAIN(tst_ColorConverter)
#include "tst_colorconverter.moc"
