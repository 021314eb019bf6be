// Snapshots of the spectral views on a blue solid with a metameric trial and on a green
// metallic at three geometries. With VEXA_GRAPH_SNAPSHOT_DIR set, the images are written
// there as PNG (docs/images/spectral-*.png are made this way).

#include "../../platform/colorimetry/metamers.h"
#include "fixtures.h"

#include <vexa/graph/metamerismview.h>
#include <vexa/graph/spectralplotwidget.h>
#include <vexa/graph/spectralview.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <QDir>
#include <QTableWidget>
#include <QVBoxLayout>
#include <QtTest>

#include <cmath>

using namespace vexa;

class tst_SpectralSnapshots : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void metamericTrial();
    void allGeometries();

private:
    void save(QWidget &widget, const QString &file);
};

namespace {

const ColorimetricCondition D65(QStringLiteral("D65"), QStringLiteral("10"));

// A blue solid: a low base with a peak at 460 nm, barely changing with the angle.
QVector<double> blue(double lightness, double shiftNm)
{
    QVector<double> values;
    for (int nm = 400; nm <= 700; nm += 10)
        values << lightness * (0.11 + 0.34 * std::exp(-std::pow((nm - 460 - shiftNm) / 45.0, 2))
                               + 0.25 / (1.0 + std::exp(-(nm - 680.0) / 12.0)));
    return values;
}

std::shared_ptr<AppearanceValues> measurement(const QString &name, const QVector<double> &values)
{
    auto appearance = std::make_shared<AppearanceValues>();
    appearance->setName(name);
    std::vector<std::shared_ptr<ColorValues>> spectra;
    for (const char *g : {"45as15", "45as45", "45as110"}) {
        auto s = std::make_shared<ReflectanceSpectrum>(values, 400, 10);
        s->setGeometry(Geometry(g));
        spectra.push_back(s);
    }
    appearance->setColorValues(spectra);
    return appearance;
}

std::shared_ptr<Trial> trial(const QString &name, const QVector<double> &values)
{
    auto t = std::make_shared<Trial>();
    t->setName(name);
    t->setAppearanceValues(measurement(name, values));
    return t;
}

} // namespace

void tst_SpectralSnapshots::save(QWidget &widget, const QString &file)
{
    const QImage image = widget.grab().toImage();
    QVERIFY(!image.isNull());
    const QString dir = qEnvironmentVariable("VEXA_GRAPH_SNAPSHOT_DIR");
    if (!dir.isEmpty())
        QVERIFY(image.save(QDir(dir).filePath(file)));
}

void tst_SpectralSnapshots::metamericTrial()
{
    auto data = std::make_shared<AppearanceViewDataModel>(D65);
    auto selection = std::make_shared<TrialSelectionModel>();
    auto standard = std::make_shared<Standard>();
    standard->setName(QStringLiteral("Blue solid"));
    standard->setAppearanceValues(measurement(standard->name(), blue(1.0, 0)));
    std::vector<std::shared_ptr<Trial>> trials{
        trial(QStringLiteral("Blue B1"), blue(1.04, 0)), trial(QStringLiteral("Blue B2"), blue(0.97, 4)),
        trial(QStringLiteral("Blue B3"), blue(1.0, -5)),
        trial(QStringLiteral("Blue B4 (other pigment)"), metamers::metamer(blue(1.0, 0), 400, 10, D65, 0.09))};
    data->setStandard(standard);
    data->setTrials(trials);
    selection->setActiveTrials(trials);
    selection->setSelectedTrial(trials.back());

    QWidget page;
    page.resize(900, 640);
    auto *layout = new QVBoxLayout(&page);
    auto *plot = new SpectralPlotWidget(&page);
    auto *metamerism = new MetamerismView(&page);
    layout->addWidget(plot, 3);
    layout->addWidget(metamerism, 1);
    plot->setModels(data, selection);
    metamerism->setModels(data, selection);

    QCOMPARE(plot->view()->data().size(), size_t(3));
    for (double v : trials.back()->appearanceValues()->reflectanceAt(Geometry("45as45"))->spectralValues())
        QVERIFY(v > 0.0);
    // The pair matches under D65 and parts under the spiky F11 (columns: ΔE D65, A, F11; MI A, F11).
    const int row = 1; // 45as45
    QCOMPARE(metamerism->table()->verticalHeaderItem(row)->text(), QStringLiteral("45as45"));
    QVERIFY(metamerism->valueAt(row, 0) < 0.01);
    QVERIFY(metamerism->valueAt(row, 2) > 1.0);
    QVERIFY(std::fabs(metamerism->valueAt(row, 4) - metamerism->valueAt(row, 2)) < 0.01);
    save(page, QStringLiteral("spectral-metamerism.png"));
}

void tst_SpectralSnapshots::allGeometries()
{
    auto data = std::make_shared<AppearanceViewDataModel>(D65);
    auto selection = std::make_shared<TrialSelectionModel>();
    data->setStandard(fixtures::standard(QStringLiteral("Green metallic"), 0.20));
    data->setTrials({fixtures::trial(QStringLiteral("Green G1"), 0.21, fixtures::threeAngles(), 565)});
    selection->setActiveTrials(data->trials());

    SpectralPlotWidget plot;
    plot.resize(900, 480);
    plot.setModels(data, selection);
    plot.setScope(SpectralScope::AllGeometries);
    QCOMPARE(plot.view()->data().size(), size_t(3));
    save(plot, QStringLiteral("spectral-all-geometries.png"));
}

QTEST_MAIN(tst_SpectralSnapshots)
#include "tst_spectralsnapshots.moc"
