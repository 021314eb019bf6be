// The colour plots as a host uses them: models in, scene items out, tolerance regions from
// the worker thread, settings, selection, zoom and printing.

#include "plotfixtures.h"
#include "export/dialogfixtures.h"

#include <vexa/export/widgetprinter.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/plots/absolutecolorplotab.h>
#include <vexa/plots/absolutecolorplotl.h>
#include <vexa/plots/checkgraphicsitem.h>
#include <vexa/plots/colorplotsettings.h>
#include <vexa/plots/colorplotwidget.h>
#include <vexa/plots/labcolorplotgraphicsview.h>
#include <vexa/plots/relativecolorplotab.h>
#include <vexa/plots/relativecolorplotl.h>
#include <vexa/plots/textitem.h>
#include <vexa/plots/trialgraphicsitem.h>

#include <QAction>
#include <QGraphicsItemGroup>
#include <QGraphicsPathItem>
#include <QGraphicsPolygonItem>
#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QMenu>
#include <QPointer>
#include <QPrintDialog>
#include <QPrinter>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QWheelEvent>
#include <QtTest>

#include <cmath>

using namespace vexa;

namespace {

const Geometry k45as45("45as45");
const Geometry k45as15("45as15");

struct Page
{
    std::shared_ptr<AppearanceViewDataModel> data;
    std::shared_ptr<TrialSelectionModel> selection;
    plotfixtures::SilverSample sample;
};

// A page with the silver sample, every trial active, a CIELab dE*ab tolerance of radius
// `radius` (pass; warning up to 1.5 radius) at 45as15 and 45as45.
Page makePage(double radius = 1.0, const QString &type = QStringLiteral("CIELab dE*ab"))
{
    Page page;
    page.sample = plotfixtures::silverSample();
    page.data = std::make_shared<AppearanceViewDataModel>(plotfixtures::condition());
    page.selection = std::make_shared<TrialSelectionModel>();
    page.data->setDefaultTolerances({plotfixtures::toleranceSet(
        {plotfixtures::tolerance(type, k45as15, radius, 1.0, 1.5), plotfixtures::tolerance(type, k45as45, radius, 1.0, 1.5)})});
    page.data->setStandard(page.sample.standard);
    page.data->setTrials(page.sample.trials);
    page.selection->setActiveTrials(page.sample.trials);
    page.selection->setSelectedColorGeometry(k45as45);
    return page;
}

template <typename Plot> std::unique_ptr<Plot> makePlot(std::shared_ptr<ColorPlotSettings> settings = nullptr)
{
    auto plot = std::make_unique<Plot>();
    plot->initialize(settings);
    plot->resize(500, 420);
    return plot;
}

std::unique_ptr<PlotWidget> makePlotOfKind(const QString &kind, std::shared_ptr<ColorPlotSettings> settings = nullptr)
{
    if (kind == QLatin1String("absolute ab"))
        return makePlot<AbsoluteColorPlotAB>(settings);
    if (kind == QLatin1String("relative ab"))
        return makePlot<RelativeColorPlotAB>(settings);
    if (kind == QLatin1String("absolute l"))
        return makePlot<AbsoluteColorPlotL>(settings);
    return makePlot<RelativeColorPlotL>(settings);
}

// Waits until the plot applied the answer to its newest request.
#define WAIT_FOR_SHAPE(plot)                                                                                           \
    QTRY_VERIFY_WITH_TIMEOUT((plot).toleranceShape().generation == (plot).shapeGeneration()                            \
                                 && (plot).shapeGeneration() > 0,                                                      \
                             20000)

// Pass region outline in scene coordinates.
QPolygonF sceneInner(const PlotWidget &plot)
{
    return plot.passRegionItem()->sceneTransform().map(plot.passRegionItem()->polygon());
}

} // namespace

class tst_ColorPlot : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();

    void showsNothingWithoutModels_data();
    void showsNothingWithoutModels();
    void placesTrialsAndStandard_data();
    void placesTrialsAndStandard();
    void stackingOrderFollowsActivityAndSelection();
    void selectionFollowsTheModelAndTheScene();
    void toleranceRegionAroundStandard_data();
    void toleranceRegionAroundStandard();
    void lightnessPlotShowsDeltaLInterval_data();
    void lightnessPlotShowsDeltaLInterval();
    void newestShapeWinsAfterQuickChanges_data();
    void newestShapeWinsAfterQuickChanges();
    void destroyingPlotWhileCalculatingIsSafe_data();
    void destroyingPlotWhileCalculatingIsSafe();
    void badInputGivesNoShapeAndNoMarker_data();
    void badInputGivesNoShapeAndNoMarker();
    void dynamicOrFixedGeometry_data();
    void dynamicOrFixedGeometry();
    void tintedBackgroundAndHueCircleSettings_data();
    void tintedBackgroundAndHueCircleSettings();
    void standardLabelColour_data();
    void standardLabelColour();
    void axesHaveReadableTicks_data();
    void axesHaveReadableTicks();
    void tickValues_data();
    void tickValues();
    void wheelZoomHasLowerBound_data();
    void wheelZoomHasLowerBound();
    void dragPansTheView();
    void panningWorksAtTheInitialZoom();
    void directionMarkersSitOnTheEdges();
    void directionMarkersLeaveTheTickLabelsFree_data();
    void directionMarkersLeaveTheTickLabelsFree();
    void standardLabelLeavesTheMarkersFree();
    void snapshotPrintsThroughTheDialogRunner();
    void printImageWritesPdf();
};

void tst_ColorPlot::initTestCase()
{
    QVERIFY(ToleranceFactory::toleranceFactory());
    plotfixtures::registerRule(QStringLiteral("Test slow circle"), [](double, double da, double db) {
        return plotfixtures::slowly(std::hypot(da, db) <= 1.0 ? 1 : 3);
    });
    plotfixtures::registerRule(QStringLiteral("Test slow circle 2"), [](double, double da, double db) {
        return plotfixtures::slowly(std::hypot(da, db) <= 2.0 ? 1 : 3);
    });
}

void tst_ColorPlot::showsNothingWithoutModels_data()
{
    QTest::addColumn<QString>("kind");
    QTest::newRow("absolute ab") << "absolute ab";
    QTest::newRow("relative l") << "relative l";
}

void tst_ColorPlot::showsNothingWithoutModels()
{
    QFETCH(QString, kind);
    auto plot = makePlotOfKind(kind);
    QVERIFY(plot->trialItems().isEmpty());
    plot->setModels(nullptr, nullptr);
    plot->refreshAll();
    plot->onTrialSelected();
    plot->onGeometrySelected();
    QVERIFY(plot->trialItems().isEmpty());
    QVERIFY(!plot->standardItem());
    QVERIFY(!plot->passRegionItem());
}

void tst_ColorPlot::placesTrialsAndStandard_data()
{
    QTest::addColumn<QString>("kind");
    QTest::newRow("absolute ab") << "absolute ab";
    QTest::newRow("relative ab") << "relative ab";
    QTest::newRow("absolute l") << "absolute l";
    QTest::newRow("relative l") << "relative l";
}

void tst_ColorPlot::placesTrialsAndStandard()
{
    QFETCH(QString, kind);
    Page page = makePage();
    auto plot = makePlotOfKind(kind);
    plot->setModels(page.data, page.selection);
    QCOMPARE(plot->trialItems().size(), 20);
    QVERIFY(plot->standardItem());
    const bool relative = kind.startsWith(QLatin1String("relative"));
    const bool ab = kind.endsWith(QLatin1String("ab"));
    const LabValue &s = *plot->standardLab();
    const QPointF expectedStandard = ab ? (relative ? QPointF(0, 0) : QPointF(-0.6, 1.9))
                                        : QPointF(0, relative ? 0.0 : -62.0);
    QCOMPARE(plot->standardItem()->pos(), expectedStandard);
    // The axes show values (absolute) or differences (relative) around the standard.
    const QVector<double> vertical = plot->verticalTicks();
    QVERIFY(!vertical.isEmpty());
    const double verticalCentre = relative ? 0.0 : (ab ? s.b() : s.l());
    QVERIFY(vertical.first() < verticalCentre && vertical.last() > verticalCentre);
    if (ab) {
        const double horizontalCentre = relative ? 0.0 : s.a();
        QVERIFY(plot->horizontalTicks().first() < horizontalCentre && plot->horizontalTicks().last() > horizontalCentre);
    }
    if (relative)
        QVERIFY(vertical.contains(0.0));
    for (TrialGraphicsItem *item : plot->trialItems()) {
        QCOMPARE(item->geometry(), k45as45);
        const auto lab = page.data->appearanceValueToLab(item->trial()->appearanceValues(), k45as45);
        QVERIFY(lab);
        if (ab) {
            QCOMPARE(item->markerShape(), TrialGraphicsItem::Shape::Circle);
            const QPointF expected = relative ? QPointF(lab->a() - s.a(), -(lab->b() - s.b())) : QPointF(lab->a(), -lab->b());
            QVERIFY(std::abs(item->pos().x() - expected.x()) < 1e-9);
            QVERIFY(std::abs(item->pos().y() - expected.y()) < 1e-9);
        } else {
            QCOMPARE(item->markerShape(), TrialGraphicsItem::Shape::Bar);
            QVERIFY(std::abs(item->pos().y() + (lab->l() - (relative ? s.l() : 0.0))) < 1e-9);
            QVERIFY(std::abs(item->pos().x()) <= 1.0);
        }
        // Every marker lies inside the frame.
        QVERIFY(plot->frameItem()->rect().contains(item->pos()));
    }
}

void tst_ColorPlot::stackingOrderFollowsActivityAndSelection()
{
    Page page = makePage();
    const auto &trials = page.sample.trials;
    page.selection->setActiveTrials({trials[3], trials[4], trials[5]});
    page.selection->setSelectedTrial(trials[4]);
    auto plot = makePlot<AbsoluteColorPlotAB>();
    plot->setModels(page.data, page.selection);
    for (TrialGraphicsItem *item : plot->trialItems()) {
        const bool active = page.selection->isActive(item->trial());
        QCOMPARE(item->isEnabled(), active);
        if (item->trial() == trials[4]) {
            QVERIFY(item->isSelected());
            QCOMPARE(item->zValue(), 2.0);
        } else {
            QVERIFY(!item->isSelected());
            QCOMPARE(item->zValue(), active ? 1.0 : 0.0);
        }
    }
    QCOMPARE(plot->standardLabel()->zValue(), 10.0);
    QVERIFY(plot->standardItem()->zValue() > 2.0);
    QVERIFY(plot->backgroundItem()->zValue() < 0.0);

    // Toggling activity updates enabled state without rebuilding the items.
    TrialGraphicsItem *first = plot->trialItem(trials[0]);
    page.selection->toggleActiveTrial(trials[0]);
    QCOMPARE(plot->trialItem(trials[0]), first);
    QVERIFY(first->isEnabled());
    QCOMPARE(first->zValue(), 1.0);
}

void tst_ColorPlot::selectionFollowsTheModelAndTheScene()
{
    Page page = makePage();
    const auto &trials = page.sample.trials;
    auto plot = makePlot<RelativeColorPlotAB>();
    plot->setModels(page.data, page.selection);

    page.selection->setSelectedTrial(trials[7]);
    QVERIFY(plot->trialItem(trials[7])->isSelected());
    QCOMPARE(plot->trialItem(trials[7])->zValue(), 2.0);
    QCOMPARE(plot->scene()->selectedItems().size(), 1);

    // A click in the scene selects the trial in the model, and the old item steps back.
    QSignalSpy spy(page.selection.get(), &TrialSelectionModel::sgTrialSelectionChanged);
    plot->scene()->clearSelection();
    plot->trialItem(trials[2])->setSelected(true);
    QCOMPARE(page.selection->selectedTrial(), trials[2]);
    QCOMPARE(spy.count(), 1);
    QVERIFY(!plot->trialItem(trials[7])->isSelected());
    QCOMPARE(plot->trialItem(trials[7])->zValue(), 1.0);
    QCOMPARE(plot->trialItem(trials[2])->zValue(), 2.0);

    // Clicking on nothing keeps the model's selection.
    plot->scene()->clearSelection();
    QCOMPARE(page.selection->selectedTrial(), trials[2]);
    QVERIFY(plot->trialItem(trials[2])->isSelected());
}

void tst_ColorPlot::toleranceRegionAroundStandard_data()
{
    QTest::addColumn<QString>("kind");
    QTest::addColumn<double>("radius");
    QTest::newRow("absolute r=1") << "absolute ab" << 1.0;
    QTest::newRow("relative r=1") << "relative ab" << 1.0;
    QTest::newRow("relative r=0.4") << "relative ab" << 0.4;
    QTest::newRow("absolute r=3") << "absolute ab" << 3.0;
}

void tst_ColorPlot::toleranceRegionAroundStandard()
{
    QFETCH(QString, kind);
    QFETCH(double, radius);
    Page page = makePage(radius);
    auto plot = makePlotOfKind(kind);
    QSignalSpy applied(plot.get(), &PlotWidget::sgToleranceShapeApplied);
    plot->setModels(page.data, page.selection);
    WAIT_FOR_SHAPE(*plot);
    QVERIFY(!applied.isEmpty());
    QCOMPARE(applied.last().at(0).value<quint64>(), plot->shapeGeneration());
    QVERIFY(plot->passRegionItem());
    QVERIFY(plot->warningBandItem());
    QCOMPARE(plot->passRegionItem()->parentItem(), plot->toleranceGroup());
    QCOMPARE(plot->passRegionItem()->brush().color(), QColor(0, 145, 77, 40));
    QCOMPARE(plot->warningBandItem()->brush().color(), QColor(242, 224, 0, 40));
    QVERIFY(plot->warningBandItem()->pen().isCosmetic());
    const QPointF centre = plot->standardItem()->pos();
    for (const QPointF &p : sceneInner(*plot))
        QVERIFY(std::abs(std::hypot(p.x() - centre.x(), p.y() - centre.y()) - radius) < 0.01);
    // The band lies between 1 and 1.5 radii, in scene coordinates.
    const QPainterPath band = plot->warningBandItem()->sceneTransform().map(plot->warningBandItem()->path());
    QVERIFY(band.contains(centre + QPointF(1.25 * radius, 0)));
    QVERIFY(band.contains(centre + QPointF(0, -1.25 * radius)));
    QVERIFY(!band.contains(centre + QPointF(0.5 * radius, 0)));
    // The whole region is shown.
    QVERIFY(plot->frameItem()->rect().contains(band.boundingRect()));
}

void tst_ColorPlot::lightnessPlotShowsDeltaLInterval_data()
{
    QTest::addColumn<QString>("kind");
    QTest::newRow("absolute l") << "absolute l";
    QTest::newRow("relative l") << "relative l";
}

void tst_ColorPlot::lightnessPlotShowsDeltaLInterval()
{
    QFETCH(QString, kind);
    Page page = makePage(1.2);
    auto plot = makePlotOfKind(kind);
    plot->setModels(page.data, page.selection);
    WAIT_FOR_SHAPE(*plot);
    QVERIFY(plot->toleranceShape().valid);
    QVERIFY(std::abs(plot->toleranceShape().passHigh - 1.2) < 0.01);
    QVERIFY(std::abs(plot->toleranceShape().passLow + 1.2) < 0.01);
    QVERIFY(std::abs(plot->toleranceShape().warningHigh - 1.8) < 0.01);
    const QRectF inner = sceneInner(*plot).boundingRect();
    const double y = plot->standardItem()->pos().y();
    QVERIFY(std::abs(inner.top() - (y - 1.2)) < 0.01);
    QVERIFY(std::abs(inner.bottom() - (y + 1.2)) < 0.01);
    QVERIFY(std::abs(inner.left() - plot->frameItem()->rect().left()) < 1e-9);
    QVERIFY(std::abs(inner.right() - plot->frameItem()->rect().right()) < 1e-9);
}

void tst_ColorPlot::newestShapeWinsAfterQuickChanges_data()
{
    QTest::addColumn<QString>("change");
    QTest::newRow("standard") << "standard";
    QTest::newRow("geometry") << "geometry";
}

void tst_ColorPlot::newestShapeWinsAfterQuickChanges()
{
    QFETCH(QString, change);
    Page page = makePage();
    const Geometry geometries[] = {k45as15, k45as45, k45as15, k45as45, k45as15};
    // Slow tolerances of radius 1 at 45as15 and 2 at 45as45, and five standards apart: each
    // change makes a different region, and each calculation is still running at the next.
    std::vector<std::shared_ptr<Standard>> standards;
    for (int i = 0; i < 5; ++i)
        standards.push_back(plotfixtures::labStandard(QStringLiteral("S%1").arg(i), 50, 5.0 * i, -3.0 * i));
    page.data->setDefaultTolerances({plotfixtures::toleranceSet(
        {plotfixtures::tolerance(QStringLiteral("Test slow circle"), k45as15),
         plotfixtures::tolerance(QStringLiteral("Test slow circle 2"), k45as45)})});
    auto plot = makePlot<AbsoluteColorPlotAB>();
    plot->setModels(page.data, page.selection);
    QSignalSpy applied(plot.get(), &PlotWidget::sgToleranceShapeApplied);
    for (int i = 0; i < 5; ++i) {
        if (change == QLatin1String("standard"))
            page.data->setStandard(standards[i]);
        else
            page.selection->setSelectedColorGeometry(geometries[i]);
    }
    WAIT_FOR_SHAPE(*plot);
    // Only the newest answer was applied, and it shows the last standard and geometry.
    for (const auto &arguments : applied)
        QCOMPARE(arguments.at(0).value<quint64>(), plot->shapeGeneration());
    const QPointF centre = plot->standardItem()->pos();
    const double expectedRadius = change == QLatin1String("standard") ? 2.0 : 1.0;
    if (change == QLatin1String("standard"))
        QCOMPARE(centre, QPointF(20.0, 12.0));
    QCOMPARE(plot->shownGeometry(), change == QLatin1String("standard") ? k45as45 : k45as15);
    for (const QPointF &p : sceneInner(*plot))
        QVERIFY2(std::abs(std::hypot(p.x() - centre.x(), p.y() - centre.y()) - expectedRadius) < 0.01,
                 qPrintable(QStringLiteral("%1,%2").arg(p.x()).arg(p.y())));
}

void tst_ColorPlot::destroyingPlotWhileCalculatingIsSafe_data()
{
    QTest::addColumn<QString>("kind");
    QTest::newRow("absolute ab") << "absolute ab";
    QTest::newRow("relative l") << "relative l";
}

void tst_ColorPlot::destroyingPlotWhileCalculatingIsSafe()
{
    QFETCH(QString, kind);
    Page page = makePage();
    page.data->setDefaultTolerances({plotfixtures::toleranceSet(
        {plotfixtures::tolerance(QStringLiteral("Test slow circle"), k45as45)})});
    for (int round = 0; round < 3; ++round) {
        auto plot = makePlotOfKind(kind);
        plot->setModels(page.data, page.selection);
        QTRY_VERIFY(plot->workerThread()->startedCalculations() >= 1);
        page.data->setStandard(plotfixtures::labStandard(QStringLiteral("Other"), 40, 1, 1));
        page.data->setStandard(page.sample.standard);
        plot.reset();
        QCoreApplication::processEvents();
    }
    // The models outlive the plots and can still be changed.
    page.data->setStandard(nullptr);
    QCoreApplication::processEvents();
}

void tst_ColorPlot::badInputGivesNoShapeAndNoMarker_data()
{
    QTest::addColumn<int>("defect");
    QTest::newRow("no standard") << 0;
    QTest::newRow("standard without the geometry") << 1;
    QTest::newRow("NaN standard") << 2;
    QTest::newRow("no tolerance") << 3;
    QTest::newRow("NaN trial") << 4;
    QTest::newRow("invalid geometry selected") << 5;
}

void tst_ColorPlot::badInputGivesNoShapeAndNoMarker()
{
    QFETCH(int, defect);
    Page page = makePage();
    int expectedTrials = 20;
    bool expectStandard = false;
    switch (defect) {
    case 0:
        page.data->setStandard(nullptr);
        expectedTrials = 0;
        break;
    case 1:
        page.data->setStandard(plotfixtures::labStandard(QStringLiteral("Only 15"), 50, 0, 0, {QStringLiteral("45as15")}));
        expectedTrials = 0;
        break;
    case 2:
        page.data->setStandard(plotfixtures::labStandard(QStringLiteral("NaN"), qQNaN(), 0, 0));
        expectedTrials = 0;
        break;
    case 3:
        page.data->setDefaultTolerances({});
        expectStandard = true;
        break;
    case 4: {
        auto trials = page.sample.trials;
        trials.push_back(plotfixtures::labTrial(QStringLiteral("NaN"), 50, qQNaN(), 1));
        trials.push_back(nullptr);
        page.data->setTrials(trials);
        expectStandard = true;
        break;
    }
    case 5:
        page.selection->setSelectedColorGeometry(Geometry());
        expectedTrials = 0;
        break;
    }
    auto plot = makePlot<AbsoluteColorPlotAB>();
    plot->setModels(page.data, page.selection);
    QCOMPARE(plot->trialItems().size(), expectedTrials);
    QCOMPARE(plot->standardItem() != nullptr, expectStandard || defect == 4);
    if (defect == 4) {
        WAIT_FOR_SHAPE(*plot);
        QVERIFY(plot->passRegionItem());
        return;
    }
    QCoreApplication::processEvents();
    QVERIFY(!plot->passRegionItem());
    QVERIFY(!plot->warningBandItem());
    QVERIFY(!plot->toleranceShape().valid);
}

void tst_ColorPlot::dynamicOrFixedGeometry_data()
{
    QTest::addColumn<QString>("setting");
    QTest::addColumn<QString>("selected");
    QTest::addColumn<QString>("expected");
    QTest::newRow("dynamic follows 45as15") << "Dynamic" << "45as15" << "45as15";
    QTest::newRow("dynamic follows 45as110") << "Dynamic" << "45as110" << "45as110";
    QTest::newRow("fixed 45as110 ignores 45as15") << "45as110" << "45as15" << "45as110";
    QTest::newRow("fixed 45as45 ignores 45as110") << "45as45" << "45as110" << "45as45";
}

void tst_ColorPlot::dynamicOrFixedGeometry()
{
    QFETCH(QString, setting);
    QFETCH(QString, selected);
    QFETCH(QString, expected);
    Page page = makePage();
    auto settings = std::make_shared<ColorPlotSettings>(true, QStringLiteral("plot"), QStringLiteral("Plot"));
    QVERIFY(settings->setGeometry(setting));
    auto plot = makePlot<AbsoluteColorPlotAB>(settings);
    plot->setModels(page.data, page.selection);
    page.selection->setSelectedColorGeometry(Geometry(selected));
    QCOMPARE(plot->shownGeometry(), Geometry(expected));
    const Geometry shown(expected);
    const auto standardLab = page.data->standardAsLabValue(shown);
    QCOMPARE(plot->standardLab()->l(), standardLab->l());
    for (TrialGraphicsItem *item : plot->trialItems())
        QCOMPARE(item->geometry(), shown);
}

void tst_ColorPlot::tintedBackgroundAndHueCircleSettings_data()
{
    QTest::addColumn<bool>("useDefaults");
    QTest::addColumn<bool>("tinted");
    QTest::addColumn<bool>("hueCircle");
    QTest::newRow("defaults: tinted, no hue circle") << true << true << false;
    QTest::newRow("plain with hue circle") << false << false << true;
    QTest::newRow("both") << false << true << true;
}

void tst_ColorPlot::tintedBackgroundAndHueCircleSettings()
{
    QFETCH(bool, useDefaults);
    QFETCH(bool, tinted);
    QFETCH(bool, hueCircle);
    Page page = makePage();
    auto settings = std::make_shared<ColorPlotSettings>(true, QStringLiteral("plot"), QStringLiteral("Plot"));
    if (!useDefaults) {
        settings->setShowTintedBackground(tinted);
        settings->setShowHueCircle(hueCircle);
    }
    auto plot = makePlot<AbsoluteColorPlotAB>(settings);
    plot->setModels(page.data, page.selection);
    QCOMPARE(plot->backgroundItem() != nullptr, tinted);
    QCOMPARE(plot->hueCircleItem() != nullptr, hueCircle);
    QCOMPARE(plot->chromaLineItem() != nullptr, hueCircle);
    if (tinted) {
        QCOMPARE(plot->backgroundItem()->childItems().size(), 180);
        QVERIFY(plot->backgroundItem()->flags() & QGraphicsItem::ItemClipsChildrenToShape);
    }
    if (hueCircle) {
        // The hue circle passes through the standard, around the achromatic point.
        auto *ellipse = qgraphicsitem_cast<QGraphicsEllipseItem *>(plot->hueCircleItem());
        QVERIFY(ellipse);
        const QRectF circle = ellipse->rect();
        QVERIFY(std::abs(circle.center().x()) < 0.01 && std::abs(circle.center().y()) < 0.01);
        QVERIFY(std::abs(circle.width() / 2 - std::hypot(0.6, 1.9)) < 0.01);
    }
    // Switching the background off in the settings removes it.
    settings->setShowTintedBackground(false);
    plot->settingsChanged();
    QVERIFY(!plot->backgroundItem());
}

void tst_ColorPlot::standardLabelColour_data()
{
    QTest::addColumn<QColor>("background");
    QTest::addColumn<QColor>("expected");
    QTest::newRow("lightness exactly 0.5 (red): white") << QColor(255, 0, 0) << QColor(Qt::white);
    QTest::newRow("lightness exactly 0.5 (teal): white") << QColor(0, 200, 55) << QColor(Qt::white);
    QTest::newRow("just above 0.5: black") << QColor(128, 128, 128) << QColor(Qt::black);
    QTest::newRow("just below 0.5: white") << QColor(127, 127, 127) << QColor(Qt::white);
    QTest::newRow("light grey: black") << QColor(200, 200, 200) << QColor(Qt::black);
    QTest::newRow("dark blue: white") << QColor(20, 30, 120) << QColor(Qt::white);
    QTest::newRow("yellow: black") << QColor(250, 240, 60) << QColor(Qt::black);
}

void tst_ColorPlot::standardLabelColour()
{
    QFETCH(QColor, background);
    QFETCH(QColor, expected);
    QCOMPARE(PlotWidget::labelColorFor(background), expected);

    // The label of a light standard reads black on the standard's own colour.
    Page page = makePage();
    auto plot = makePlot<AbsoluteColorPlotAB>();
    plot->setModels(page.data, page.selection);
    QVERIFY(plot->standardLabel()->isVisible());
    QCOMPARE(plot->standardLabel()->text(), QStringLiteral("Silver metallic"));
    QCOMPARE(plot->standardLabel()->textColor(), QColor(Qt::black));
    QCOMPARE(plot->standardLabel()->pos(), plot->standardItem()->pos());
    page.data->setStandard(plotfixtures::labStandard(QStringLiteral("Navy"), 20, 10, -40));
    QCOMPARE(plot->standardLabel()->textColor(), QColor(Qt::white));
}

void tst_ColorPlot::axesHaveReadableTicks_data()
{
    QTest::addColumn<QString>("kind");
    QTest::addColumn<double>("radius");
    QTest::newRow("absolute ab, small") << "absolute ab" << 0.5;
    QTest::newRow("relative ab, large") << "relative ab" << 6.0;
    QTest::newRow("absolute l") << "absolute l" << 1.0;
    QTest::newRow("relative l") << "relative l" << 1.0;
}

void tst_ColorPlot::axesHaveReadableTicks()
{
    QFETCH(QString, kind);
    QFETCH(double, radius);
    Page page = makePage(radius);
    auto plot = makePlotOfKind(kind);
    plot->setModels(page.data, page.selection);
    WAIT_FOR_SHAPE(*plot);
    plot->show();
    QVERIFY(QTest::qWaitForWindowExposed(plot.get()));
    const bool ab = kind.endsWith(QLatin1String("ab"));
    QVERIFY(plot->verticalTicks().size() >= 3 && plot->verticalTicks().size() <= 11);
    if (ab)
        QVERIFY(plot->horizontalTicks().size() >= 3 && plot->horizontalTicks().size() <= 11);
    else
        QVERIFY(plot->horizontalTicks().isEmpty());
    // Labels are distinct along each axis, and none overlaps another on screen.
    QStringList texts;
    QStringList horizontalTexts;
    QList<QRect> onScreen;
    for (TextItem *label : plot->tickLabels()) {
        QVERIFY(!label->text().isEmpty());
        (texts.size() < plot->verticalTicks().size() ? texts : horizontalTexts) << label->text();
        const QRect r = label->deviceTransform(plot->view()->viewportTransform()).mapRect(label->boundingRect()).toRect();
        for (const QRect &other : onScreen)
            QVERIFY2(!r.adjusted(1, 1, -1, -1).intersects(other), qPrintable(label->text()));
        onScreen << r;
        // And it is inside the viewport.
        QVERIFY2(plot->view()->viewport()->rect().adjusted(-2, -2, 2, 2).contains(r), qPrintable(label->text()));
    }
    QCOMPARE(texts.size(), plot->verticalTicks().size());
    QCOMPARE(horizontalTexts.size(), plot->horizontalTicks().size());
    QCOMPARE(QSet<QString>(texts.begin(), texts.end()).size(), texts.size());
    QCOMPARE(QSet<QString>(horizontalTexts.begin(), horizontalTexts.end()).size(), horizontalTexts.size());
}

void tst_ColorPlot::tickValues_data()
{
    QTest::addColumn<double>("min");
    QTest::addColumn<double>("max");
    QTest::addColumn<QVector<double>>("expected");
    QTest::newRow("-1..1") << -1.0 << 1.0 << QVector<double>{-1.0, -0.5, 0.0, 0.5, 1.0};
    QTest::newRow("-2.6..1.4") << -2.6 << 1.4 << QVector<double>{-2.0, -1.0, 0.0, 1.0};
    QTest::newRow("55..65") << 55.0 << 65.0 << QVector<double>{56.0, 58.0, 60.0, 62.0, 64.0};
    QTest::newRow("empty range") << 3.0 << 3.0 << QVector<double>{};
}

void tst_ColorPlot::tickValues()
{
    QFETCH(double, min);
    QFETCH(double, max);
    QFETCH(QVector<double>, expected);
    const QVector<double> ticks = PlotWidget::tickValues(min, max, 5);
    QCOMPARE(ticks.size(), expected.size());
    for (int i = 0; i < ticks.size(); ++i)
        QVERIFY(std::abs(ticks.at(i) - expected.at(i)) < 1e-12);
    QCOMPARE(PlotWidget::tickLabel(-0.0000001, 0.5), QStringLiteral("0.0"));
    QCOMPARE(PlotWidget::tickLabel(2.5, 2.5), QStringLiteral("2.5"));
    QCOMPARE(PlotWidget::tickLabel(60, 2), QStringLiteral("60"));
}

void tst_ColorPlot::wheelZoomHasLowerBound_data()
{
    QTest::addColumn<QList<int>>("deltas");
    QTest::addColumn<double>("expectedZoom");
    QTest::newRow("one notch in") << QList<int>{120} << std::pow(1.0015, 120);
    QTest::newRow("out from the start is refused") << QList<int>{-120} << 1.0;
    QTest::newRow("in and out again") << QList<int>{120, -120} << 1.0;
    QTest::newRow("in, then too far out") << QList<int>{40, -120} << std::pow(1.0015, 40);
    QTest::newRow("small step out to 0.98 is allowed") << QList<int>{-13} << std::pow(1.0015, -13);
    QTest::newRow("step out to 0.97 is refused") << QList<int>{-21} << 1.0;
}

void tst_ColorPlot::wheelZoomHasLowerBound()
{
    QFETCH(QList<int>, deltas);
    QFETCH(double, expectedZoom);
    Page page = makePage();
    auto plot = makePlot<AbsoluteColorPlotAB>();
    plot->setModels(page.data, page.selection);
    plot->show();
    QVERIFY(QTest::qWaitForWindowExposed(plot.get()));
    ZoomGraphicsView *view = plot->view();
    const QPoint at = view->viewport()->rect().center() + QPoint(40, -30);
    const QPointF sceneAt = view->mapToScene(at);
    for (int delta : deltas) {
        QWheelEvent wheel(QPointF(at), QPointF(view->viewport()->mapToGlobal(at)), QPoint(), QPoint(0, delta),
                          Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
        QApplication::sendEvent(view->viewport(), &wheel);
    }
    QVERIFY(std::abs(view->zoom() - expectedZoom) < 1e-9);
    // The scene point under the cursor stays there (within a pixel).
    const QPointF back = view->mapFromScene(sceneAt);
    if (expectedZoom > 1.0)
        QVERIFY(std::abs(back.x() - at.x()) <= 1.5 && std::abs(back.y() - at.y()) <= 1.5);
    QVERIFY(!view->setZoom(0.97));
    QVERIFY(view->setZoom(2.0));
    QCOMPARE(view->zoom(), 2.0);
}

namespace {

// A middle-button drag on the view's viewport from `from` by `by` pixels.
void dragWithMiddleButton(ZoomGraphicsView *view, const QPoint &from, const QPoint &by)
{
    QTest::mousePress(view->viewport(), Qt::MiddleButton, Qt::NoModifier, from);
    QMouseEvent move(QEvent::MouseMove, QPointF(from + by), Qt::NoButton, Qt::MiddleButton, Qt::NoModifier);
    QApplication::sendEvent(view->viewport(), &move);
    QTest::mouseRelease(view->viewport(), Qt::MiddleButton, Qt::NoModifier, from + by);
}

} // namespace

void tst_ColorPlot::dragPansTheView()
{
    Page page = makePage();
    auto plot = makePlot<RelativeColorPlotAB>();
    plot->setModels(page.data, page.selection);
    plot->show();
    QVERIFY(QTest::qWaitForWindowExposed(plot.get()));
    ZoomGraphicsView *view = plot->view();
    QVERIFY(view->setZoom(4.0));
    const QPoint start = view->viewport()->rect().center();
    const QPointF before = view->mapToScene(start);
    dragWithMiddleButton(view, start + QPoint(0, 60), QPoint(-30, -20));
    const QPointF after = view->mapToScene(start);
    // The content moved with the cursor: the view now looks 30 px right and 20 px down of before.
    const double scale = view->transform().m11();
    QVERIFY2(std::abs((after.x() - before.x()) * scale - 30) <= 1.5, qPrintable(QString::number((after.x() - before.x()) * scale)));
    QVERIFY(std::abs((after.y() - before.y()) * scale - 20) <= 1.5);
}

void tst_ColorPlot::panningWorksAtTheInitialZoom()
{
    Page page = makePage();
    auto plot = makePlot<AbsoluteColorPlotAB>();
    plot->setModels(page.data, page.selection);
    plot->show();
    QVERIFY(QTest::qWaitForWindowExposed(plot.get()));
    ZoomGraphicsView *view = plot->view();
    QCOMPARE(view->zoom(), 1.0);
    const QPointF fitCentre = view->fitRect().center();
    auto drag = [view](const QPoint &by) { dragWithMiddleButton(view, view->viewport()->rect().center(), by); };
    const QPoint middle = view->viewport()->rect().center();
    const QPointF before = view->mapToScene(middle);
    drag(QPoint(-40, 25));
    const double scale = view->transform().m11();
    const QPointF after = view->mapToScene(middle);
    QVERIFY2(std::abs((after.x() - before.x()) * scale - 40) <= 1.5, qPrintable(QString::number((after.x() - before.x()) * scale)));
    QVERIFY(std::abs((after.y() - before.y()) * view->transform().m22() + 25) <= 1.5);

    // Zoomed out a little and back: still free to move, and back to the middle by dragging back.
    QVERIFY(view->zoomBy(0.98, QPointF(middle)));
    QVERIFY(view->zoomBy(1.0 / 0.98, QPointF(middle)));
    QVERIFY(std::abs(view->zoom() - 1.0) < 1e-9);
    drag(QPoint(40, -25));
    const QPointF centred = view->centre();
    QVERIFY2(std::abs(centred.x() - fitCentre.x()) * scale <= 2.0 && std::abs(centred.y() - fitCentre.y()) * scale <= 2.0,
             qPrintable(QStringLiteral("%1,%2 vs %3,%4").arg(centred.x()).arg(centred.y()).arg(fitCentre.x()).arg(fitCentre.y())));
    // The view cannot be dragged off into nothing: the centre stays within the pan area.
    for (int i = 0; i < 20; ++i)
        drag(QPoint(200, 0));
    QVERIFY(view->panArea().contains(view->centre()));
    view->resetZoom();
    QVERIFY(std::abs(view->centre().x() - fitCentre.x()) * scale <= 1.5);
    QVERIFY(std::abs(view->mapToScene(view->freeArea().center().toPoint()).x() - fitCentre.x()) * scale <= 1.5);
}

void tst_ColorPlot::directionMarkersLeaveTheTickLabelsFree_data()
{
    QTest::addColumn<QSize>("size");
    QTest::newRow("500x420") << QSize(500, 420);
    QTest::newRow("700x450") << QSize(700, 450);
    QTest::newRow("square 400") << QSize(400, 400);
    QTest::newRow("tall 380x600") << QSize(380, 600);
    QTest::newRow("wide 1000x380") << QSize(1000, 380);
}

void tst_ColorPlot::directionMarkersLeaveTheTickLabelsFree()
{
    QFETCH(QSize, size);
    Page page = makePage();
    auto plot = makePlot<AbsoluteColorPlotAB>();
    plot->resize(size);
    plot->setModels(page.data, page.selection);
    plot->show();
    QVERIFY(QTest::qWaitForWindowExposed(plot.get()));
    auto *view = qobject_cast<LabColorPlotGraphicsView *>(plot->view());
    QVERIFY(view);
    QVERIFY(!plot->tickLabels().isEmpty());
    for (const QRectF &bar : view->directionMarkerRects()) {
        const QRectF barPixels = view->mapFromScene(bar).boundingRect();
        for (const TextItem *label : plot->tickLabels()) {
            // The labels keep their pixel size: their rectangle is in viewport pixels around their anchor.
            const QRectF labelPixels = label->boundingRect().translated(view->mapFromScene(label->pos()));
            QVERIFY2(!barPixels.intersects(labelPixels),
                     qPrintable(QStringLiteral("bar %1,%2 %3x%4 covers the label \"%5\"")
                                    .arg(barPixels.x()).arg(barPixels.y()).arg(barPixels.width())
                                    .arg(barPixels.height()).arg(label->text())));
        }
    }
}

void tst_ColorPlot::standardLabelLeavesTheMarkersFree()
{
    Page page = makePage();
    auto plot = makePlot<AbsoluteColorPlotAB>();
    plot->setModels(page.data, page.selection);
    plot->show();
    QVERIFY(QTest::qWaitForWindowExposed(plot.get()));
    TextItem *label = plot->standardLabel();
    QVERIFY(label && label->isVisible());
    QCOMPARE(label->acceptedMouseButtons(), Qt::NoButton); // clicks reach the markers under it
    QVERIFY(label->background().color().alpha() < 255);    // and a marker under it still shows
    QVERIFY(label->zValue() > 2);
    ZoomGraphicsView *view = plot->view();
    // Crowd the side where the label goes first (up and to the right of the standard) with markers.
    const QPointF anchor = view->mapFromScene(label->pos());
    const QRectF upRight(anchor + QPointF(8, -22), QSizeF(40, 14));
    // The other trials go far from the standard, to the frame's corner.
    for (TrialGraphicsItem *item : plot->trialItems())
        item->setPos(plot->frameItem()->rect().topLeft() + QPointF(1, 1));
    int crowded = 0;
    for (TrialGraphicsItem *item : plot->trialItems()) {
        if (crowded == 6)
            break;
        const QPointF target = upRight.topLeft() + QPointF(6.0 * crowded, 7.0 * (crowded % 2));
        item->setPos(view->mapToScene(target.toPoint()));
        ++crowded;
    }
    QCOMPARE(crowded, 6);
    view->setZoom(1.2); // any change of the view places the label again
    const QRectF labelRect = label->boundingRect().translated(view->mapFromScene(label->pos()));
    for (TrialGraphicsItem *item : plot->trialItems())
        QVERIFY2(!labelRect.contains(view->mapFromScene(item->pos())), qPrintable(item->trial()->name()));
}

void tst_ColorPlot::directionMarkersSitOnTheEdges()
{
    Page page = makePage();
    auto plot = makePlot<AbsoluteColorPlotAB>();
    plot->setModels(page.data, page.selection);
    plot->show();
    QVERIFY(QTest::qWaitForWindowExposed(plot.get()));
    auto *view = qobject_cast<LabColorPlotGraphicsView *>(plot->view());
    QVERIFY(view);
    const QVector<QRectF> bars = view->directionMarkerRects();
    QCOMPARE(bars.size(), 4);
    const QRectF visible = view->mapToScene(view->viewport()->rect().adjusted(0, 0, -10, -10)).boundingRect();
    QVERIFY(std::abs(bars[0].center().x() - visible.left()) < 1e-9);   // -a* green
    QVERIFY(std::abs(bars[1].center().x() - visible.right()) < 1e-9);  // +a* red
    QVERIFY(std::abs(bars[2].center().y() - visible.top()) < 1e-9);    // +b* yellow
    QVERIFY(std::abs(bars[3].center().y() - visible.bottom()) < 1e-9); // -b* blue
    QVERIFY(std::abs(bars[0].width() - visible.width() / 100) < 1e-9);
    QVERIFY(std::abs(bars[0].height() - visible.height() / 4) < 1e-9);
    QVERIFY(std::abs(bars[2].width() - visible.width() / 4) < 1e-9);
    QVERIFY(std::abs(bars[2].center().x() - visible.center().x()) < 1e-9);
}

void tst_ColorPlot::snapshotPrintsThroughTheDialogRunner()
{
    Page page = makePage();
    page.selection->setSelectedTrial(page.sample.trials[1]);
    QWidget host;
    auto *widget = new ColorPlotWidget(&host);
    auto *ab = new AbsoluteColorPlotAB;
    ab->initialize(nullptr);
    auto *l = new AbsoluteColorPlotL;
    l->initialize(nullptr);
    widget->initialize(ab, l);
    widget->setModels(page.data, page.selection);
    widget->resize(700, 450);
    QCOMPARE(ab->parentWidget(), widget);
    QCOMPARE(widget->printSnapshotAction()->text(), QStringLiteral("Print Snapshot"));
    QVERIFY(widget->contextMenu()->actions().contains(widget->printSnapshotAction()));
    QCOMPARE(l->view()->horizontalScrollBarPolicy(), Qt::ScrollBarAlwaysOff);

    // The snapshot goes through the same seam as every printed widget: no dialog opens.
    QTemporaryDir dir;
    const QString pdf = dir.filePath(QStringLiteral("snapshot.pdf"));
    bool decorationsRestored = false;
    PrintToPdf print(pdf, [&](QDialog &) { decorationsRestored = !ab->isPreparedForPrinting(); });
    // The context menu's action prints.
    widget->printSnapshotAction()->trigger();
    QCOMPARE(print.shown, 1);
    QCOMPARE(print.title, QStringLiteral("Print Visual"));
    QCOMPARE(print.parent, &host);
    QVERIFY(decorationsRestored); // the snapshot is taken before the dialog is asked
    QVERIFY(QFileInfo(pdf).size() > 500);

    ab->prepareForPrinting();
    QVERIFY(ab->scene()->selectedItems().isEmpty());
    ab->finishedPrinting();
    QVERIFY(ab->trialItem(page.sample.trials[1])->isSelected());

    // A context-menu request on a plot opens the menu (without blocking).
    Q_EMIT ab->customContextMenuRequested(QPoint(10, 10));
    QTRY_VERIFY(widget->contextMenu()->isVisible());
    widget->contextMenu()->hide();
}

void tst_ColorPlot::printImageWritesPdf()
{
    QTemporaryDir dir;
    QVERIFY(dir.isValid());
    QPrinter printer(QPrinter::ScreenResolution);
    printer.setOutputFormat(QPrinter::PdfFormat);
    const QString file = dir.filePath(QStringLiteral("snapshot.pdf"));
    printer.setOutputFileName(file);
    QImage image(300, 200, QImage::Format_RGB32);
    image.fill(Qt::darkCyan);
    QVERIFY(WidgetPrinter::render(image, printer));
    QVERIFY(QFileInfo(file).size() > 500);
    QVERIFY(!WidgetPrinter::render(QImage(), printer));
    RunDialogs cancel([](QDialog &) { return int(QDialog::Rejected); });
    QVERIFY(!WidgetPrinter::printImage(image, nullptr));
}

QTEST_MAIN(tst_ColorPlot)
#include "tst_colorplot.moc"
