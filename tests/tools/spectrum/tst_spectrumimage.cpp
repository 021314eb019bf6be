#include "spectrumimage.h"

#include <vexa/graph/spectralview.h>

#include <QColor>
#include <QImage>
#include <QtTest>

#include <cmath>

using namespace vexa;

// The spectral view's background is what the renderer draws from the CIE tables: the
// committed image matches a fresh rendering, and its columns run through the hues of
// the spectrum from violet at 400 nm to red at 700 nm, paler at the top.
class tst_SpectrumImage : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void committedImageIsTheRendering();
    void resourceIsTheCommittedImage();
    void huesFollowTheWavelength_data();
    void huesFollowTheWavelength();
    void paleAtTheTop();
    void badSizes();
};

namespace {

QImage committed()
{
    return QImage(QStringLiteral(VEXA_SOURCE_DIR "/vexa/resources/graph/Spectrum.png"))
        .convertToFormat(QImage::Format_ARGB32);
}

int maxChannelDifference(const QImage &a, const QImage &b)
{
    int worst = 0;
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x) {
            const QRgb p = a.pixel(x, y);
            const QRgb q = b.pixel(x, y);
            worst = std::max({worst, std::abs(qRed(p) - qRed(q)), std::abs(qGreen(p) - qGreen(q)),
                              std::abs(qBlue(p) - qBlue(q)), std::abs(qAlpha(p) - qAlpha(q))});
        }
    }
    return worst;
}

} // namespace

void tst_SpectrumImage::committedImageIsTheRendering()
{
    const QImage file = committed();
    QVERIFY2(!file.isNull(), "vexa/resources/graph/Spectrum.png is missing: run tools/spectrum/render.sh");
    const QImage rendered = SpectrumImage::render();
    QCOMPARE(file.size(), rendered.size());
    // Rounding may differ by one step between compilers; anything more means the image is stale.
    QVERIFY2(maxChannelDifference(file, rendered) <= 1, "stale image: run tools/spectrum/render.sh");
}

void tst_SpectrumImage::resourceIsTheCommittedImage()
{
    const QImage resource = SpectralView::backgroundImage().convertToFormat(QImage::Format_ARGB32);
    QCOMPARE(resource.size(), committed().size());
    QCOMPARE(maxChannelDifference(resource, committed()), 0);
}

void tst_SpectrumImage::huesFollowTheWavelength_data()
{
    QTest::addColumn<double>("nm");
    QTest::addColumn<int>("hue");
    QTest::addColumn<int>("tolerance");
    QTest::newRow("violet 410") << 410.0 << 260 << 20;
    QTest::newRow("blue 465") << 465.0 << 237 << 20;
    QTest::newRow("cyan 490") << 490.0 << 185 << 15;
    QTest::newRow("green 530") << 530.0 << 140 << 20;
    QTest::newRow("yellow 570") << 570.0 << 60 << 12;
    QTest::newRow("orange 590") << 590.0 << 18 << 10;
    QTest::newRow("red 650") << 650.0 << 0 << 10;
}

void tst_SpectrumImage::huesFollowTheWavelength()
{
    QFETCH(double, nm);
    QFETCH(int, hue);
    QFETCH(int, tolerance);
    const QImage image = SpectrumImage::render();
    const int column = int(std::lround((nm - 400.0) / 300.0 * (image.width() - 1)));
    QCOMPARE(SpectrumImage::wavelengthOfColumn(column, image.width()), nm);
    const QColor c = image.pixelColor(column, image.height() - 1);
    const int distance = std::abs(c.hue() - hue) % 360;
    QVERIFY2(std::min(distance, 360 - distance) <= tolerance, qPrintable(QString::number(c.hue())));
}

void tst_SpectrumImage::paleAtTheTop()
{
    const QImage image = SpectrumImage::render();
    for (int column : {0, 100, 200, 300}) {
        const QColor top = image.pixelColor(column, 0);
        const QColor bottom = image.pixelColor(column, image.height() - 1);
        QVERIFY(top.hsvSaturation() < bottom.hsvSaturation());
        QVERIFY(top.hsvSaturation() > 0);
        QCOMPARE(top.alpha(), 255);
    }
}

void tst_SpectrumImage::badSizes()
{
    QVERIFY(SpectrumImage::render(0, 10).isNull());
    QVERIFY(SpectrumImage::render(10, -1).isNull());
    QCOMPARE(SpectrumImage::render(1, 1).size(), QSize(1, 1));
}

QTEST_MAIN(tst_SpectrumImage)
#include "tst_spectrumimage.moc"
