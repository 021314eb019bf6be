// Snapshots of the colour plots on the silver sample with "CIEDE2000" and "CIELab(+/-)"
// tolerance regions. With VEXA_PLOT_SNAPSHOT_DIR set, the images are written there as PNG
// (docs/images/plot-*.png are made this way).

#include "plotfixtures.h"

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/plots/absolutecolorplotab.h>
#include <vexa/plots/absolutecolorplotl.h>
#include <vexa/plots/checkgraphicsitem.h>
#include <vexa/plots/colorplotsettings.h>
#include <vexa/plots/colorplotwidget.h>
#include <vexa/plots/relativecolorplotab.h>
#include <vexa/plots/relativecolorplotl.h>
#include <vexa/plots/zoomgraphicsview.h>

#include <QDir>
#include <QGraphicsPolygonItem>
#include <QtTest>

using namespace vexa;

class tst_ColorPlotSnapshots : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void snapshot_data();
    void snapshot();
};

void tst_ColorPlotSnapshots::initTestCase()
{
    QVERIFY(ToleranceFactory::toleranceFactory());
}

void tst_ColorPlotSnapshots::snapshot_data()
{
    QTest::addColumn<QString>("reference");
    QTest::addColumn<QString>("type");
    QTest::addColumn<bool>("hueCircle");
    QTest::addColumn<QString>("file");
    QTest::newRow("absolute dE2000") << "absolute" << "CIEDE2000" << true << "plot-absolute-de2000.png";
    QTest::newRow("relative dE2000") << "relative" << "CIEDE2000" << false << "plot-relative-de2000.png";
    QTest::newRow("absolute Lab box") << "absolute" << "CIELab(+/-)" << false << "plot-absolute-labbox.png";
    QTest::newRow("relative Lab box") << "relative" << "CIELab(+/-)" << false << "plot-relative-labbox.png";
}

void tst_ColorPlotSnapshots::snapshot()
{
    QFETCH(QString, reference);
    QFETCH(QString, type);
    QFETCH(bool, hueCircle);
    QFETCH(QString, file);

    const auto sample = plotfixtures::silverSample();
    auto data = std::make_shared<AppearanceViewDataModel>(plotfixtures::condition());
    auto selection = std::make_shared<TrialSelectionModel>();
    std::vector<std::shared_ptr<Tolerance>> tolerances;
    for (const QString &g : plotfixtures::geometries())
        tolerances.push_back(plotfixtures::tolerance(type, Geometry(g)));
    data->setDefaultTolerances({plotfixtures::toleranceSet(tolerances)});
    data->setStandard(sample.standard);
    data->setTrials(sample.trials);
    auto active = sample.trials;
    active.erase(active.begin() + 16, active.begin() + 19); // three inactive trials
    selection->setActiveTrials(active);
    selection->setSelectedColorGeometry(Geometry("45as45"));
    selection->setSelectedTrial(sample.trials[5]);

    auto settings = std::make_shared<ColorPlotSettings>(true, QStringLiteral("plot"), QStringLiteral("Plot"));
    settings->setShowHueCircle(hueCircle);
    ColorPlotWidget widget;
    PlotWidget *ab = nullptr;
    PlotWidget *l = nullptr;
    if (reference == QLatin1String("absolute")) {
        auto *abPlot = new AbsoluteColorPlotAB;
        abPlot->initialize(settings);
        auto *lPlot = new AbsoluteColorPlotL;
        lPlot->initialize(settings);
        ab = abPlot;
        l = lPlot;
    } else {
        auto *abPlot = new RelativeColorPlotAB;
        abPlot->initialize(settings);
        auto *lPlot = new RelativeColorPlotL;
        lPlot->initialize(settings);
        ab = abPlot;
        l = lPlot;
    }
    widget.initialize(ab, l);
    widget.resize(600, 440);
    widget.setModels(data, selection);
    widget.show();
    QVERIFY(QTest::qWaitForWindowExposed(&widget));
    for (PlotWidget *plot : {ab, l})
        QTRY_VERIFY_WITH_TIMEOUT(plot->toleranceShape().generation == plot->shapeGeneration()
                                     && plot->toleranceShape().valid,
                                 20000);
    QVERIFY(ab->passRegionItem());
    QVERIFY(l->passRegionItem());

    const QImage image = widget.snapshot();
    QCOMPARE(image.size(), widget.size() * widget.devicePixelRatioF());
    // The standard sits in the middle of the pass region: its pixel is not plain white.
    const QPoint standardPixel = ab->view()->mapFromScene(ab->standardItem()->pos()) + ab->view()->pos();
    QVERIFY(image.pixelColor(standardPixel + QPoint(12, 12)) != QColor(Qt::white));

    const QString dir = qEnvironmentVariable("VEXA_PLOT_SNAPSHOT_DIR");
    if (!dir.isEmpty()) {
        QVERIFY(QDir().mkpath(dir));
        QVERIFY(image.convertToFormat(QImage::Format_RGB888).save(QDir(dir).filePath(file), "PNG", 9));
    }
}

QTEST_MAIN(tst_ColorPlotSnapshots)
#include "tst_colorplotsnapshots.moc"
