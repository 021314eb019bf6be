// The spectral view at scale. Painting: 200 spectra of 401 points (380-780 nm by 1 nm) on
// a 1200 × 600 view, beside the raw reference: the same curves, already mapped to pixels,
// drawn by QPainter::drawPolyline with the same pen into the same image. Selection: a page
// of 1,000 active trials at six geometries; one step selects the next trial and paints the
// spectral plot, the spectral value table and the metamerism readout, beside the raw
// reference of painting the same curves of 31 points (the active trials' layer, which the
// plot keeps while only the selection changes). The parts of a step and a change of
// geometry (every curve drawn anew) are measured too.
//
// Run: build/bench/vexa/bench_graph (offscreen by default). One 60 Hz frame is 16.7 ms.

#include "fixtures.h"

#include <vexa/graph/metamerismview.h>
#include <vexa/graph/spectralplotwidget.h>
#include <vexa/graph/spectralvaluetablemodel.h>
#include <vexa/graph/spectralview.h>
#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>

#include <benchmark/benchmark.h>

#include <QApplication>
#include <QHeaderView>
#include <QImage>
#include <QPainter>
#include <QTableView>

#include <cmath>
#include <memory>
#include <vector>

using namespace vexa;

namespace {

const QSize ViewSize(1200, 600);
constexpr int Spectra = 200;
constexpr int Points = 401;
constexpr int Trials = 1000;

std::shared_ptr<ReflectanceSpectrum> smoothSpectrum(int n)
{
    QVector<double> values;
    values.reserve(Points);
    for (int i = 0; i < Points; ++i) {
        const double nm = 380 + i;
        values << 0.1 + 0.02 * (n % 17) + 0.5 * std::exp(-std::pow((nm - 450 - n) / 50.0, 2));
    }
    auto spectrum = std::make_shared<ReflectanceSpectrum>(values, 380, 1);
    spectrum->setGeometry(Geometry("45as45"));
    return spectrum;
}

SpectralView &spectraView()
{
    static SpectralView *view = [] {
        auto *v = new SpectralView;
        v->resize(ViewSize);
        for (int n = 0; n < Spectra; ++n)
            v->addSpectralData(smoothSpectrum(n), n == 0 ? 0 : 1 + n % 3);
        return v;
    }();
    return *view;
}

void BM_PaintSpectra(benchmark::State &state)
{
    SpectralView &view = spectraView();
    view.setCurveWidth(state.range(0) / 10.0);
    QImage image(ViewSize, QImage::Format_ARGB32_Premultiplied);
    for (auto _ : state) {
        view.render(&image);
        benchmark::DoNotOptimize(image.constBits());
    }
    state.counters["segments"] = Spectra * (Points - 1);
}

// The curves only, mapped to pixels beforehand, with the view's pen and clip.
void BM_PaintSpectraRawQPainter(benchmark::State &state)
{
    SpectralView &view = spectraView();
    view.setCurveWidth(state.range(0) / 10.0);
    QImage image(ViewSize, QImage::Format_ARGB32_Premultiplied);
    view.render(&image); // lays out the plot rectangle
    std::vector<QPolygonF> curves;
    std::vector<QColor> colours;
    for (const auto &data : view.data()) {
        QPolygonF polygon;
        for (const GraphPoint &p : data->points())
            polygon << view.toPixel(p.x(), p.y());
        curves.push_back(polygon);
        colours.push_back(data->color());
    }
    for (auto _ : state) {
        image.fill(Qt::white);
        QPainter painter(&image);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setClipRect(view.plotRect());
        for (size_t i = 0; i < curves.size(); ++i) {
            painter.setPen(QPen(colours[i], view.curveWidth(), Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
            painter.drawPolyline(curves[i]);
        }
        painter.end();
        benchmark::DoNotOptimize(image.constBits());
    }
}

struct Page
{
    std::shared_ptr<AppearanceViewDataModel> data = std::make_shared<AppearanceViewDataModel>(ColorimetricCondition());
    std::shared_ptr<TrialSelectionModel> selection = std::make_shared<TrialSelectionModel>();
    std::vector<std::shared_ptr<Trial>> trials;
    SpectralPlotWidget plot;
    SpectralValueTableModel model;
    QTableView table;
    MetamerismView metamerism;

    Page()
    {
        QStringList geometries;
        for (const Geometry &g : Geometry::geometries(GeometrySet::MultiAngle))
            geometries << g.toString();
        data->setStandard(fixtures::standard(QStringLiteral("STD"), 0.20, geometries));
        for (int i = 0; i < Trials; ++i)
            trials.push_back(fixtures::trial(QStringLiteral("T%1").arg(i), 0.19 + 0.02 * (i % 100) / 100.0, geometries,
                                             540 + i % 20));
        data->setTrials(trials);
        selection->setActiveTrials(trials);
        plot.resize(1100, 480);
        table.setModel(&model);
        table.horizontalHeader()->setDefaultSectionSize(84);
        table.resize(700, 300);
        metamerism.resize(400, 300);
        plot.setModels(data, selection);
        model.setModels(data, selection);
        metamerism.setModels(data, selection);
    }
};

Page &page()
{
    static Page *p = new Page;
    return *p;
}

void BM_SelectTrialAndPaint1000(benchmark::State &state)
{
    Page &p = page();
    QImage plotImage(p.plot.size(), QImage::Format_ARGB32_Premultiplied);
    QImage tableImage(p.table.size(), QImage::Format_ARGB32_Premultiplied);
    QImage metamerismImage(p.metamerism.size(), QImage::Format_ARGB32_Premultiplied);
    size_t next = 1;
    for (auto _ : state) {
        p.selection->setSelectedTrial(p.trials[next]);
        next = (next + 7) % p.trials.size();
        p.plot.render(&plotImage);
        p.table.render(&tableImage);
        p.metamerism.render(&metamerismImage);
        benchmark::DoNotOptimize(plotImage.constBits());
    }
}

// The same 1,001 curves of 31 points, mapped beforehand, drawn into an image of the plot's size.
void BM_PaintCurves1000RawQPainter(benchmark::State &state)
{
    Page &p = page();
    SpectralView *view = p.plot.view();
    QImage image(view->size(), QImage::Format_ARGB32_Premultiplied);
    view->render(&image);
    std::vector<QPolygonF> curves;
    for (const auto &series : view->data()) {
        for (const auto &member : series->subData()) {
            QPolygonF polygon;
            for (const GraphPoint &pt : member->points())
                polygon << view->toPixel(pt.x(), pt.y());
            curves.push_back(polygon);
        }
    }
    for (auto _ : state) {
        image.fill(Qt::white);
        QPainter painter(&image);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(QPen(QColor(90, 100, 130, 90), view->curveWidth(), Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        for (const QPolygonF &c : curves)
            painter.drawPolyline(c);
        painter.end();
        benchmark::DoNotOptimize(image.constBits());
    }
    state.counters["curves"] = double(curves.size());
}

// The parts of a selection step.
void BM_SelectTrialOnly1000(benchmark::State &state)
{
    Page &p = page();
    size_t next = 1;
    for (auto _ : state) {
        p.selection->setSelectedTrial(p.trials[next]);
        next = (next + 7) % p.trials.size();
    }
}

template <typename Widget> void paintOne(benchmark::State &state, Widget Page::*widget)
{
    Page &p = page();
    QWidget &w = p.*widget;
    QImage image(w.size(), QImage::Format_ARGB32_Premultiplied);
    for (auto _ : state) {
        w.render(&image);
        benchmark::DoNotOptimize(image.constBits());
    }
}

// Another geometry: every curve and the table are built and drawn anew.
void BM_SelectGeometryAndPaint1000(benchmark::State &state)
{
    Page &p = page();
    QImage plotImage(p.plot.size(), QImage::Format_ARGB32_Premultiplied);
    QImage tableImage(p.table.size(), QImage::Format_ARGB32_Premultiplied);
    const Geometry geometries[] = {Geometry("45as15"), Geometry("45as45")};
    int next = 0;
    for (auto _ : state) {
        p.selection->setSelectedColorGeometry(geometries[next]);
        next = 1 - next;
        p.plot.render(&plotImage);
        p.table.render(&tableImage);
        benchmark::DoNotOptimize(plotImage.constBits());
    }
}

} // namespace

// The argument is the curves' pen width in tenths of a pixel.
BENCHMARK(BM_PaintSpectra)->Arg(10)->Arg(15)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_PaintSpectraRawQPainter)->Arg(10)->Arg(15)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_SelectTrialAndPaint1000)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_PaintCurves1000RawQPainter)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_SelectTrialOnly1000)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(paintOne, PlotCached1000, &Page::plot)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(paintOne, Table1000, &Page::table)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(paintOne, Metamerism, &Page::metamerism)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_SelectGeometryAndPaint1000)->Unit(benchmark::kMillisecond);

int main(int argc, char **argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 1;
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
