#include "fixtures.h"

#include <vexa/graph/graphdatagroup.h>
#include <vexa/graph/spectralgraphdata.h>
#include <vexa/graph/spectralview.h>

#include <domain/labvalue.h>

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QImage>
#include <QMenu>
#include <QPointer>
#include <QtTest>

#include <cmath>
#include <limits>

using namespace vexa;

// Spectra on the line graph: their points and colours, the groups per measurement, the
// spectrum behind the first curve, the copied text and bad spectra.
class tst_SpectralView : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void points_data();
    void points();
    void colorByIndex_data();
    void colorByIndex();
    void axes();
    void addSpectralData();
    void didAddSpectralData();
    void backgroundUnderTheFirstCurve();
    void curvesOverTheBackground();
    void copyAsText();
    void contextMenuDiesWithTheView();
    void badSpectra_data();
    void badSpectra();
};

namespace {

constexpr double NaN = std::numeric_limits<double>::quiet_NaN();

std::shared_ptr<ReflectanceSpectrum> spectrum(const QVector<double> &values, double start, double interval,
                                              const QString &geometry = QStringLiteral("45as45"))
{
    auto s = std::make_shared<ReflectanceSpectrum>(values, start, interval);
    s->setGeometry(Geometry(geometry));
    return s;
}

QVector<double> flat(int count, double value)
{
    return QVector<double>(count, value);
}

QImage render(SpectralView &view)
{
    return view.grab().toImage().convertToFormat(QImage::Format_RGB32);
}

} // namespace

void tst_SpectralView::points_data()
{
    QTest::addColumn<QVector<double>>("values");
    QTest::addColumn<double>("start");
    QTest::addColumn<double>("interval");
    QTest::addColumn<QVector<double>>("xs");
    QVector<double> xs31;
    for (int nm = 400; nm <= 700; nm += 10)
        xs31 << nm;
    QTest::newRow("400 nm, 10 nm, 31 values") << flat(31, 0.5) << 400.0 << 10.0 << xs31;
    // Whole nanometres: start and interval are truncated before they are multiplied.
    QTest::newRow("fractional grid") << flat(3, 0.5) << 400.7 << 10.5 << QVector<double>{400, 410, 420};
    QTest::newRow("one value") << flat(1, 0.5) << 550.0 << 10.0 << QVector<double>{550};
    QTest::newRow("no values") << QVector<double>() << 400.0 << 10.0 << QVector<double>();
    QTest::newRow("descending") << flat(3, 0.5) << 700.0 << -10.0 << QVector<double>{700, 690, 680};
    QTest::newRow("not-a-number start") << flat(3, 0.5) << NaN << 10.0 << QVector<double>();
    QTest::newRow("start beyond the integers") << flat(3, 0.5) << 1e12 << 10.0 << QVector<double>();
}

void tst_SpectralView::points()
{
    QFETCH(QVector<double>, values);
    QFETCH(double, start);
    QFETCH(double, interval);
    QFETCH(QVector<double>, xs);
    const SpectralGraphData data(spectrum(values, start, interval), 1);
    QCOMPARE(int(data.points().size()), xs.size());
    for (int i = 0; i < xs.size(); ++i) {
        QCOMPARE(data.points()[size_t(i)].x(), xs[i]);
        QCOMPARE(data.points()[size_t(i)].y(), values[i]);
    }
    QVERIFY(data.name().empty());
    QVERIFY(data.subData().empty());

    const SpectralGraphData none(nullptr, 0);
    QVERIFY(none.points().empty());
}

void tst_SpectralView::colorByIndex_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<QColor>("color");
    QTest::newRow("-1") << -1 << QColor(0, 0, 0);
    QTest::newRow("0") << 0 << QColor(0, 0, 0);
    QTest::newRow("1") << 1 << QColor(50, 50, 250);
    QTest::newRow("2") << 2 << QColor(50, 250, 50);
    QTest::newRow("3") << 3 << QColor(250, 50, 50);
    QTest::newRow("7") << 7 << QColor(250, 50, 50);
}

void tst_SpectralView::colorByIndex()
{
    QFETCH(int, index);
    QFETCH(QColor, color);
    const SpectralGraphData data(spectrum(flat(2, 0.5), 400, 10), index);
    QCOMPARE(data.color(), color);
    QCOMPARE(data.color().alpha(), 255);
}

void tst_SpectralView::axes()
{
    SpectralView view;
    QCOMPARE(view.xAxis().name(), std::string("nm"));
    QVERIFY(view.xAxis().isFixed());
    QCOMPARE(*view.xAxis().fixedMin(), 400.0);
    QCOMPARE(*view.xAxis().fixedMax(), 700.0);
    QCOMPARE(view.yAxis().name(), std::string("R"));
    QCOMPARE(*view.yAxis().fixedMin(), 0.0);
    QVERIFY(!view.yAxis().fixedMax());

    view.addSpectralData(spectrum({0.2, 0.6, 0.4}, 380, 200), 0);
    view.calculateRanges();
    QCOMPARE(view.xAxis().min(), 400.0);
    QCOMPARE(view.xAxis().max(), 700.0);
    QCOMPARE(view.yAxis().min(), 0.0);
    QVERIFY(std::fabs(view.yAxis().max() - 0.62) < 1e-12); // 0.6 + 5 % of 0.4
}

void tst_SpectralView::addSpectralData()
{
    SpectralView view;
    const auto s = spectrum(flat(31, 0.5), 400, 10);
    view.addSpectralData(s, 2);
    QCOMPARE(view.data().size(), size_t(1));
    const auto data = std::dynamic_pointer_cast<SpectralGraphData>(view.data().front());
    QVERIFY(data);
    QCOMPARE(data->spectrum(), s);
    QCOMPARE(data->colorIndex(), 2);

    view.addSpectralData(nullptr, 0);
    QCOMPARE(view.data().size(), size_t(1));
}

void tst_SpectralView::didAddSpectralData()
{
    SpectralView view;
    QVERIFY(!view.didAddSpectralData(nullptr, 1, Qt::blue));
    QVERIFY(view.data().empty());

    auto values = fixtures::appearance(fixtures::threeAngles(), 0.2, 550, 0.3, QStringLiteral("T1"));
    auto lab = std::make_shared<LabValue>(50.0, 1.0, 2.0);
    lab->setGeometry(Geometry("45as45"));
    auto colorValues = values->colorValues();
    colorValues.push_back(lab); // not a spectrum: left out
    values->setColorValues(colorValues);

    QVERIFY(view.didAddSpectralData(values, 1, QColor(10, 20, 30)));
    QCOMPARE(view.data().size(), size_t(1));
    const auto group = std::dynamic_pointer_cast<GraphDataGroup>(view.data().front());
    QVERIFY(group);
    QCOMPARE(group->name(), std::string("T1"));
    QCOMPARE(group->color(), QColor(10, 20, 30));
    QVERIFY(group->points().empty());
    QCOMPARE(group->subData().size(), size_t(3));
    for (const auto &member : group->subData()) {
        const auto curve = std::dynamic_pointer_cast<SpectralGraphData>(member);
        QVERIFY(curve);
        QCOMPARE(curve->color(), QColor(50, 50, 250));
        QCOMPARE(curve->points().size(), size_t(31));
    }
}

// The spectrum's colours fill the plot behind the first series: bluish at 450 nm, reddish
// at 650 nm; without any series the plot stays plain.
void tst_SpectralView::backgroundUnderTheFirstCurve()
{
    QVERIFY(!SpectralView::backgroundImage().isNull());
    SpectralView view;
    view.resize(500, 320);
    QImage image = render(view);
    const QColor plain = image.pixelColor(view.plotRect().center());

    view.addSpectralData(spectrum(flat(31, 0.05), 400, 10), 0);
    image = render(view);
    const QPointF blue = view.toPixel(450, view.yAxis().max() * 0.5);
    const QPointF red = view.toPixel(650, view.yAxis().max() * 0.5);
    const QColor atBlue = image.pixelColor(blue.toPoint());
    const QColor atRed = image.pixelColor(red.toPoint());
    QVERIFY2(atBlue.blue() > atBlue.red() + 20, qPrintable(atBlue.name()));
    QVERIFY2(atRed.red() > atRed.blue() + 20, qPrintable(atRed.name()));
    QVERIFY(atBlue != plain && atRed != plain);
    // The whole plot rectangle, not only below the curve.
    const QColor top = image.pixelColor(view.toPixel(650, view.yAxis().max() * 0.95).toPoint());
    QVERIFY2(top.red() > top.blue(), qPrintable(top.name()));
}

void tst_SpectralView::curvesOverTheBackground()
{
    SpectralView view;
    view.resize(500, 320);
    view.setCurveWidth(3.0);
    view.addSpectralData(spectrum(flat(31, 0.5), 400, 10), 0);  // black
    view.addSpectralData(spectrum(flat(31, 0.25), 400, 10), 1); // blue
    const QImage image = render(view);
    const QColor black = image.pixelColor(view.toPixel(550, 0.5).toPoint());
    QVERIFY2(black.lightness() < 60, qPrintable(black.name()));
    const QColor blue = image.pixelColor(view.toPixel(550, 0.25).toPoint());
    QVERIFY2(blue.blue() > 200 && blue.red() < 110, qPrintable(blue.name()));
}

void tst_SpectralView::copyAsText()
{
    SpectralView view;
    auto standard = std::make_shared<AppearanceValues>();
    standard->setName(QStringLiteral("STD"));
    standard->setColorValues({spectrum({0.1, 0.2, 0.3}, 400, 10, QStringLiteral("45as15")),
                              spectrum({0.4, 0.5}, 410, 10, QStringLiteral("45as45"))});
    QVERIFY(view.didAddSpectralData(standard, 0, Qt::black));
    view.addSpectralData(spectrum({0.25}, 400, 10, QStringLiteral("45as110")), 3);

    const QString expected = QStringLiteral("nm\tSTD 45as15\tSTD 45as45\t45as110\n"
                                            "400\t0.1\t\t0.25\n"
                                            "410\t0.2\t0.4\t\n"
                                            "420\t0.3\t0.5\t\n");
    QCOMPARE(view.copyText(), expected);
    QVERIFY(view.contextMenu()->actions().contains(view.copyAction()));
    QApplication::clipboard()->clear();
    view.copyAction()->trigger();
    QCOMPARE(QApplication::clipboard()->text(), expected);
}

void tst_SpectralView::contextMenuDiesWithTheView()
{
    auto *view = new SpectralView;
    QPointer<QMenu> menu(view->contextMenu());
    QVERIFY(menu);
    QCOMPARE(menu->parent(), view);
    delete view;
    QVERIFY(!menu);
}

void tst_SpectralView::badSpectra_data()
{
    QTest::addColumn<QVector<double>>("values");
    QTest::addColumn<double>("start");
    QTest::addColumn<double>("interval");
    QTest::addColumn<double>("drawnAt"); // a wavelength where the curve must show; 0 for none
    QVector<double> withNaN = flat(31, 0.4);
    withNaN[15] = NaN;
    QTest::newRow("no values") << QVector<double>() << 400.0 << 10.0 << 0.0;
    QTest::newRow("one value") << flat(1, 0.4) << 550.0 << 10.0 << 550.0;
    QTest::newRow("NaN in the middle") << withNaN << 400.0 << 10.0 << 450.0;
    QTest::newRow("all NaN") << flat(31, NaN) << 400.0 << 10.0 << 0.0;
    QTest::newRow("short of 400 and 700") << flat(27, 0.4) << 420.0 << 10.0 << 500.0;
    QTest::newRow("360 to 830") << flat(48, 0.4) << 360.0 << 10.0 << 600.0;
    QTest::newRow("zero interval") << flat(5, 0.4) << 500.0 << 0.0 << 500.0;
    QTest::newRow("outside the axis") << flat(10, 0.4) << 800.0 << 10.0 << 0.0;
    QTest::newRow("all zero") << flat(31, 0.0) << 400.0 << 10.0 << 0.0;
    QTest::newRow("negative values") << flat(31, -0.2) << 400.0 << 10.0 << 0.0;
}

void tst_SpectralView::badSpectra()
{
    QFETCH(QVector<double>, values);
    QFETCH(double, start);
    QFETCH(double, interval);
    QFETCH(double, drawnAt);
    SpectralView view;
    view.resize(500, 320);
    view.setCurveWidth(3.0);
    view.addSpectralData(spectrum(flat(31, 0.8), 400, 10), 2); // a good green curve first
    view.addSpectralData(spectrum(values, start, interval), 1); // blue
    const QImage image = render(view);
    QCOMPARE(image.size(), view.size());
    QVERIFY(view.yAxis().max() >= 0.8);
    const QColor good = image.pixelColor(view.toPixel(550, 0.8).toPoint());
    QVERIFY2(good.green() > 180 && good.red() < 120, qPrintable(good.name()));
    if (drawnAt > 0) {
        const QColor c = image.pixelColor(view.toPixel(drawnAt, 0.4).toPoint());
        QVERIFY2(c.blue() > 180 && c.red() < 120, qPrintable(c.name()));
    }
    if (values.size() == 31 && std::isnan(values[15]) && !std::isnan(values[0])) {
        const QColor gap = image.pixelColor(view.toPixel(550, 0.4).toPoint());
        QVERIFY2(!(gap.blue() > 180 && gap.red() < 120), qPrintable(gap.name()));
    }
}

QTEST_MAIN(tst_SpectralView)
#include "tst_spectralview.moc"
