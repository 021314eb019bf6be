#include <vexa/graph/defaultgraphdata.h>
#include <vexa/graph/graphdatagroup.h>
#include <vexa/graph/linegraphview.h>

#include <QFontMetrics>
#include <QImage>
#include <QtTest>

#include <cmath>
#include <limits>

// The line graph widget: ranges from its series, the legend grid, the plot rectangle,
// where curves land in the painted image, the text form, and bad data.
class tst_LineGraphView : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void rangesFromSeries_data();
    void rangesFromSeries();
    void addDataAndClearReset();
    void legendLayout_data();
    void legendLayout();
    void plotRectangle_data();
    void plotRectangle();
    void curvePassesThroughMappedPixels();
    void seriesWidths();
    void cachedSeries();
    void legendOnlyFromTwoSeries_data();
    void legendOnlyFromTwoSeries();
    void xTicksSitOnWholeValues();
    void badDataIsDrawnAsFarAsMeaningful_data();
    void badDataIsDrawnAsFarAsMeaningful();
    void textForm();
};

namespace {

constexpr double NaN = std::numeric_limits<double>::quiet_NaN();

std::shared_ptr<DefaultGraphData> series(std::vector<GraphPoint> points, const std::string &name = "S",
                                         const QColor &color = Qt::red)
{
    return std::make_shared<DefaultGraphData>(points, name, color);
}

std::vector<GraphPoint> line(double x0, double y0, double x1, double y1)
{
    return {GraphPoint(x0, y0), GraphPoint(x1, y1)};
}

QImage render(LineGraphView &view)
{
    return view.grab().toImage().convertToFormat(QImage::Format_RGB32);
}

// Whether the pixel, or one of its neighbours, is close to the colour.
bool near(const QImage &image, const QPointF &at, const QColor &color, int tolerance = 60)
{
    for (int dx = -1; dx <= 1; ++dx) {
        for (int dy = -1; dy <= 1; ++dy) {
            const QPoint p(int(std::round(at.x())) + dx, int(std::round(at.y())) + dy);
            if (!image.rect().contains(p))
                continue;
            const QColor c = image.pixelColor(p);
            if (std::abs(c.red() - color.red()) + std::abs(c.green() - color.green())
                    + std::abs(c.blue() - color.blue())
                < tolerance)
                return true;
        }
    }
    return false;
}

int countColor(const QImage &image, const QRect &area, const QColor &color)
{
    int count = 0;
    for (int y = area.top(); y <= area.bottom(); ++y) {
        for (int x = area.left(); x <= area.right(); ++x) {
            const QColor c = image.pixelColor(x, y);
            if (std::abs(c.red() - color.red()) + std::abs(c.green() - color.green())
                    + std::abs(c.blue() - color.blue())
                < 60)
                ++count;
        }
    }
    return count;
}

} // namespace

void tst_LineGraphView::rangesFromSeries_data()
{
    QTest::addColumn<QString>("data");
    QTest::addColumn<double>("xMin");
    QTest::addColumn<double>("xMax");
    QTest::addColumn<double>("yMin");
    QTest::addColumn<double>("yMax");
    QTest::newRow("400 to 700") << "line" << 400.0 << 715.0 << 0.0 << 1.05;
    QTest::newRow("group members") << "group" << 400.0 << 715.0 << -1.0 << 2.15;
    QTest::newRow("not-a-number points skipped") << "nan" << 400.0 << 715.0 << 0.0 << 1.05;
    QTest::newRow("empty") << "empty" << 0.0 << 0.0 << 0.0 << 0.0;
    QTest::newRow("series without points") << "no points" << 0.0 << 0.0 << 0.0 << 0.0;
}

void tst_LineGraphView::rangesFromSeries()
{
    QFETCH(QString, data);
    QFETCH(double, xMin);
    QFETCH(double, xMax);
    QFETCH(double, yMin);
    QFETCH(double, yMax);
    LineGraphView view;
    if (data == "line" || data == "nan" || data == "group")
        view.addData(series(line(400, 0, 700, 1)));
    if (data == "nan")
        view.addData(series({GraphPoint(NaN, 5), GraphPoint(500, NaN), GraphPoint(std::numeric_limits<double>::infinity(), 0)}));
    if (data == "group") {
        auto group = std::make_shared<GraphDataGroup>("G", Qt::blue);
        group->addSubData(series(line(450, -1, 500, 2)));
        view.addData(group);
    }
    if (data == "no points")
        view.addData(series({}));
    view.calculateRanges();
    QCOMPARE(view.xAxis().min(), xMin);
    QVERIFY(std::fabs(view.xAxis().max() - xMax) < 1e-9);
    QCOMPARE(view.yAxis().min(), yMin);
    QVERIFY(std::fabs(view.yAxis().max() - yMax) < 1e-9);
}

void tst_LineGraphView::addDataAndClearReset()
{
    LineGraphView view;
    view.addData(series(line(0, 0, 1, 1)));
    view.calculateRanges();
    view.showInfo("note");
    QCOMPARE(view.info(), std::string("note"));
    view.addData(series(line(0, 0, 2, 2)));
    QVERIFY(!view.xAxis().hasRange());
    QVERIFY(!view.yAxis().hasRange());
    QVERIFY(view.info().empty());
    QCOMPARE(view.data().size(), size_t(2));

    view.addData(nullptr);
    QCOMPARE(view.data().size(), size_t(2));

    view.calculateRanges();
    view.showInfo("note");
    view.clear();
    QVERIFY(view.data().empty());
    QVERIFY(!view.xAxis().hasRange());
    QVERIFY(view.info().empty());
}

void tst_LineGraphView::legendLayout_data()
{
    QTest::addColumn<int>("seriesCount");
    QTest::addColumn<int>("fittingColumns"); // width = 40 + fittingColumns × column width + extra
    QTest::addColumn<int>("extra");
    QTest::addColumn<int>("columns");
    QTest::addColumn<int>("rows");
    QTest::newRow("one series: no legend") << 1 << 3 << 0 << 0 << 0;
    QTest::newRow("two series, room for three") << 2 << 3 << 0 << 3 << 1;
    QTest::newRow("two series, exactly two") << 2 << 2 << 0 << 2 << 1;
    QTest::newRow("two series, a pixel short of two") << 2 << 2 << -1 << 1 << 2;
    QTest::newRow("two series, room for one") << 2 << 1 << 5 << 1 << 2;
    QTest::newRow("seven series, three columns") << 7 << 3 << 0 << 3 << 3;
    QTest::newRow("seven series, a pixel short of three") << 7 << 3 << -1 << 2 << 4;
    QTest::newRow("seven series, narrower than a column") << 7 << 0 << 10 << 1 << 7;
    QTest::newRow("twelve series, one row") << 12 << 12 << 0 << 12 << 1;
    QTest::newRow("twelve series, five columns") << 12 << 5 << 3 << 5 << 3;
}

void tst_LineGraphView::legendLayout()
{
    QFETCH(int, seriesCount);
    QFETCH(int, fittingColumns);
    QFETCH(int, extra);
    QFETCH(int, columns);
    QFETCH(int, rows);
    LineGraphView view;
    const QFontMetrics metrics(view.font());
    int widest = 0;
    for (int i = 0; i < seriesCount; ++i) {
        const std::string name = i == 1 ? "The longest series name" : "Series " + std::to_string(i);
        widest = std::max(widest, metrics.horizontalAdvance(QString::fromStdString(name)));
        view.addData(series(line(0, 0, 1, 1), name));
    }
    const int columnWidth = widest + 40;
    const QSize size(40 + fittingColumns * columnWidth + extra, 400);
    const LineGraphView::LegendLayout legend = view.legendLayout(metrics, size);
    QCOMPARE(legend.columns, columns);
    QCOMPARE(legend.rows, rows);
    if (rows > 0) {
        QCOMPARE(legend.columnWidth, columnWidth);
        QCOMPARE(legend.rowHeight, int(1.5 * metrics.height()));
        QCOMPARE(legend.top, 400 - 10 - legend.rowHeight * rows);
    }
}

void tst_LineGraphView::plotRectangle_data()
{
    QTest::addColumn<int>("seriesCount");
    QTest::newRow("without legend") << 1;
    QTest::newRow("with legend") << 2;
}

void tst_LineGraphView::plotRectangle()
{
    QFETCH(int, seriesCount);
    LineGraphView view;
    view.resize(500, 300);
    view.setXAxis(Axis(0.0, 100.0, "x"));
    view.setYAxis(Axis(0.0, 1.0, "y"));
    for (int i = 0; i < seriesCount; ++i)
        view.addData(series(line(0, 0, 100, 1), "S" + std::to_string(i)));
    render(view);

    const QFontMetrics metrics(view.font());
    // y labels 0.000 … 1.000; x labels 0 … 100 (step 20).
    int widestY = 0;
    for (const char *label : {"0.000", "0.200", "0.400", "0.600", "0.800", "1.000"})
        widestY = std::max(widestY, metrics.horizontalAdvance(QString::fromLatin1(label)));
    const LineGraphView::LegendLayout legend = view.legendLayout(metrics, view.size());
    const int bottom = (seriesCount > 1 ? legend.top : 300 - 10) - 30;
    const int right = 500 - 10 - (metrics.horizontalAdvance(QStringLiteral("100")) + 1) / 2;
    const QRect plot = view.plotRect();
    QCOMPARE(plot.left(), widestY + 10);
    QCOMPARE(plot.top(), 15);
    QCOMPARE(plot.y() + plot.height(), bottom);
    QCOMPARE(plot.x() + plot.width(), right);
}

void tst_LineGraphView::curvePassesThroughMappedPixels()
{
    LineGraphView view;
    view.resize(420, 320);
    view.setXAxis(Axis(0.0, 100.0));
    view.setYAxis(Axis(0.0, 10.0));
    view.setCurveWidth(3.0);
    view.addData(series(line(0, 0, 100, 10), "diagonal", QColor(220, 0, 0)));
    const QImage image = render(view);
    const QRect plot = view.plotRect();
    QVERIFY(plot.width() > 100 && plot.height() > 100);

    // Value → pixel: left + (v − min) × width / span; y grows upwards from the bottom.
    const QPointF quarter = view.toPixel(25, 2.5);
    QCOMPARE(quarter.x(), plot.x() + 0.25 * plot.width());
    QCOMPARE(quarter.y(), plot.y() + plot.height() - 0.25 * plot.height());
    QVERIFY(near(image, quarter, QColor(220, 0, 0)));
    QVERIFY(near(image, view.toPixel(75, 7.5), QColor(220, 0, 0)));
    // Off the line there is no curve colour.
    QVERIFY(!near(image, view.toPixel(25, 7.5), QColor(220, 0, 0), 150));
    QVERIFY(!near(image, view.toPixel(75, 2.5), QColor(220, 0, 0), 150));
}

// One series drawn wider than the rest: 2.5 pixels beside its line is still its colour.
void tst_LineGraphView::seriesWidths()
{
    LineGraphView view;
    view.resize(420, 320);
    view.setXAxis(Axis(0.0, 10.0));
    view.setYAxis(Axis(0.0, 10.0));
    const QColor red(220, 0, 0);
    const QColor blue(0, 0, 220);
    view.addData(series(line(0, 3, 10, 3), "thin", red));
    view.addData(series(line(0, 7, 10, 7), "wide", blue));
    QCOMPARE(view.curveWidth(), 1.0);
    view.setCurveWidth(2.0);
    view.setCurveWidth(1, 8.0);
    view.setCurveWidth(0, -1.0); // refused
    view.setCurveWidth(std::numeric_limits<double>::quiet_NaN());
    QCOMPARE(view.curveWidth(0), 2.0);
    QCOMPARE(view.curveWidth(1), 8.0);
    const QImage image = render(view);
    const QPointF thin = view.toPixel(5, 3);
    const QPointF wide = view.toPixel(5, 7);
    QVERIFY(near(image, thin, red));
    QVERIFY(near(image, wide, blue));
    QVERIFY(!near(image, thin + QPointF(0, 3.5), red, 150));
    QVERIFY(near(image, wide + QPointF(0, 2.5), blue));
    view.clear();
    QCOMPARE(view.curveWidth(1), 2.0);
}

// A cached layer looks like the drawn series and is drawn anew only when what it shows changes.
void tst_LineGraphView::cachedSeries()
{
    auto layer = std::make_shared<GraphDataGroup>("layer", Qt::gray);
    for (int i = 0; i < 20; ++i)
        layer->addSubData(series(line(0, i * 0.4, 10, 10 - i * 0.3), "", QColor(90, 100, 130, 90)));
    auto top = series(line(0, 5, 10, 5), "top", Qt::red);
    LineGraphView plain;
    LineGraphView cached;
    for (LineGraphView *view : {&plain, &cached}) {
        view->resize(400, 300);
        view->addData(layer);
        view->addData(top);
    }
    cached.setSeriesCached(0);
    QVERIFY(cached.isSeriesCached(0) && !cached.isSeriesCached(1));
    const QImage expected = render(plain);
    QImage image = render(cached);
    QCOMPARE(cached.cachedSeriesRenderCount(), 1);
    int differing = 0;
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x)
            differing += image.pixel(x, y) != expected.pixel(x, y);
    QVERIFY2(differing < image.width() * image.height() / 200, qPrintable(QString::number(differing)));

    render(cached);
    QCOMPARE(cached.cachedSeriesRenderCount(), 1);
    // The same object again after clear(): still the same drawing.
    cached.clear();
    cached.addData(layer);
    cached.addData(top);
    cached.setSeriesCached(0);
    render(cached);
    QCOMPARE(cached.cachedSeriesRenderCount(), 1);
    // Another size, other ranges, another width, another object: drawn anew.
    cached.resize(420, 300);
    render(cached);
    QCOMPARE(cached.cachedSeriesRenderCount(), 2);
    cached.setYAxis(Axis(0.0, 20.0));
    render(cached);
    QCOMPARE(cached.cachedSeriesRenderCount(), 3);
    cached.setCurveWidth(0, 2.0);
    render(cached);
    QCOMPARE(cached.cachedSeriesRenderCount(), 4);
    cached.clear();
    cached.addData(series(line(0, 0, 10, 10)));
    cached.setSeriesCached(0);
    render(cached);
    QCOMPARE(cached.cachedSeriesRenderCount(), 5);
    cached.setSeriesCached(0, false);
    render(cached);
    QCOMPARE(cached.cachedSeriesRenderCount(), 5);
}

void tst_LineGraphView::legendOnlyFromTwoSeries_data()
{
    QTest::addColumn<int>("seriesCount");
    QTest::newRow("one series") << 1;
    QTest::newRow("two series") << 2;
    QTest::newRow("three series") << 3;
}

void tst_LineGraphView::legendOnlyFromTwoSeries()
{
    QFETCH(int, seriesCount);
    LineGraphView view;
    view.resize(600, 300);
    const QColor colours[] = {QColor(220, 0, 0), QColor(0, 150, 0), QColor(0, 0, 220)};
    for (int i = 0; i < seriesCount; ++i)
        view.addData(series(line(0, i, 10, i + 1), "Series " + std::to_string(i), colours[i]));
    const QImage image = render(view);
    const QRect plot = view.plotRect();
    // Below the x labels lies only the legend.
    const QRect below(0, plot.y() + plot.height() + 28, view.width(), view.height() - (plot.y() + plot.height() + 28));
    const LineGraphView::LegendLayout legend = view.legendLayout(QFontMetrics(view.font()), view.size());
    for (int i = 0; i < seriesCount; ++i) {
        const int found = countColor(image, below, colours[i]);
        if (seriesCount < 2) {
            QCOMPARE(found, 0);
            continue;
        }
        QVERIFY2(found > 0, qPrintable(QString::number(i)));
        // The legend's line runs from x + 20 to x + 35 at the row's centre.
        const int x = (i % legend.columns) * legend.columnWidth;
        const double centre = legend.top + (i / legend.columns) * legend.rowHeight + legend.rowHeight / 2.0;
        QVERIFY(near(image, QPointF(x + 27, centre), colours[i]));
        QVERIFY(!near(image, QPointF(x + 10, centre), colours[i]));
    }
}

// x ticks and the y axis line sit on whole x values: ticks at 0.6 and 0.8 are marked at 0.
void tst_LineGraphView::xTicksSitOnWholeValues()
{
    LineGraphView view;
    view.resize(400, 300);
    view.setXAxis(Axis(0.5, 1.5));
    view.setYAxis(Axis(0.0, 1.0));
    QCOMPARE(Axis::ticks(0.5, 1.5).size(), size_t(5)); // 0.6 … 1.4 by 0.2
    const QImage image = render(view);
    const QRect plot = view.plotRect();
    const int markY = plot.y() + plot.height() + 3;
    auto dark = [&](double x) {
        const QColor c = image.pixelColor(int(std::floor(x)), markY);
        return c.lightness() < 160;
    };
    QVERIFY(dark(view.toPixel(1.0, 0).x()));   // ticks 1.0, 1.2, 1.4
    QVERIFY(!dark(view.toPixel(0.6, 0).x()));  // would be here without the truncation
    QVERIFY(!dark(view.toPixel(1.2, 0).x()));
}

void tst_LineGraphView::badDataIsDrawnAsFarAsMeaningful_data()
{
    QTest::addColumn<QString>("kind");
    QTest::newRow("lone point") << "lone";
    QTest::newRow("gap") << "gap";
    QTest::newRow("no points") << "empty";
    QTest::newRow("huge values") << "huge";
    QTest::newRow("not-a-number axis") << "nan axis";
    QTest::newRow("reversed axis") << "reversed";
    QTest::newRow("group inside itself") << "cycle";
    QTest::newRow("too small to plot") << "tiny";
}

void tst_LineGraphView::badDataIsDrawnAsFarAsMeaningful()
{
    QFETCH(QString, kind);
    LineGraphView view;
    view.resize(kind == "tiny" ? QSize(30, 20) : QSize(400, 300));
    view.setCurveWidth(3.0);
    view.setXAxis(Axis(0.0, 10.0));
    view.setYAxis(Axis(0.0, 10.0));
    const QColor red(220, 0, 0);
    std::shared_ptr<GraphDataGroup> cycle;
    if (kind == "lone" || kind == "tiny")
        view.addData(series({GraphPoint(5, 5)}, "S", red));
    if (kind == "gap")
        view.addData(series({GraphPoint(1, 1), GraphPoint(2, 2), GraphPoint(3, NaN), GraphPoint(4, 4), GraphPoint(5, 5)},
                            "S", red));
    if (kind == "empty")
        view.addData(series({}));
    if (kind == "huge")
        view.addData(series({GraphPoint(5, 5), GraphPoint(1e300, -1e300), GraphPoint(-1e300, 1e300)}, "S", red));
    if (kind == "nan axis")
        view.setYAxis(Axis(NaN, NaN));
    if (kind == "reversed")
        view.setYAxis(Axis(10.0, 0.0));
    if (kind == "cycle") {
        cycle = std::make_shared<GraphDataGroup>("G", red);
        cycle->addSubData(series(line(0, 0, 10, 10), "", red));
        cycle->addSubData(cycle);
        view.addData(cycle);
    }
    const QImage image = render(view);
    QCOMPARE(image.size(), view.size());
    if (kind == "lone")
        QVERIFY(near(image, view.toPixel(5, 5), red));
    if (kind == "gap") {
        QVERIFY(near(image, view.toPixel(1.5, 1.5), red));
        QVERIFY(near(image, view.toPixel(4.5, 4.5), red));
        QVERIFY(!near(image, view.toPixel(3, 3), red, 150)); // the gap
    }
    if (kind == "cycle") {
        QVERIFY(near(image, view.toPixel(5, 5), red));
        QVERIFY(!view.dataText().empty()); // terminates as well
        view.clear();
        cycle.reset(); // the group keeps itself alive; that is the caller's business
    }
}

void tst_LineGraphView::textForm()
{
    LineGraphView view;
    view.setXAxis(Axis(400.0, 700.0, "nm"));
    view.addData(series({GraphPoint(410, 0.2), GraphPoint(400, 0.125)}, "A"));
    auto group = std::make_shared<GraphDataGroup>("G", Qt::blue);
    group->addSubData(series({GraphPoint(400, 0.3), GraphPoint(420, NaN)}, ""));
    group->addSubData(series({GraphPoint(410, 0.5)}, ""));
    group->addSubData(series({GraphPoint(NaN, 0.9)}, "named"));
    view.addData(group);
    view.addData(series({GraphPoint(400, 0.125), GraphPoint(410, 0.2)}, "A")); // A again: written once
    QCOMPARE(QString::fromStdString(view.dataText()), QStringLiteral("nm\tA\tG (1)\tG (2)\tnamed\n"
                                                                      "400\t0.125\t0.3\t\t\n"
                                                                      "410\t0.2\t\t0.5\t\n"
                                                                      "420\t\t\t\t\n"));
    view.clear();
    view.setXAxis(Axis(Axis::Automatic, Axis::Automatic));
    QCOMPARE(QString::fromStdString(view.dataText()), QStringLiteral("x\n"));
}

QTEST_MAIN(tst_LineGraphView)
#include "tst_linegraphview.moc"
