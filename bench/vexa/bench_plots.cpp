// Tolerance boundaries of the colour plots: the inner (pass) and the outer (warning) boundary
// of each ellipsoid and box tolerance type, with both refinement strategies, around a silver
// metallic and a saturated blue standard.
//
//   build-plots/bench/vexa/bench_plots --benchmark_min_time=0.2

#include "plots/plotfixtures.h"

#include <vexa/plots/angledifferencetoleranceshapecalculator.h>
#include <vexa/plots/dividingtoleranceshapecalculator.h>
#include <vexa/plots/workerthread.h>

#include <benchmark/benchmark.h>

#include <QCoreApplication>

using namespace vexa;

namespace {

const Geometry kGeometry("45as45");

const char *const kTypes[] = {"CIELab(+/-)", "CIELCh(+/-)", "CIELab dE*ab", "CIE94",
                              "CMC(l:c)",    "CIEDE2000",   "DIN99",        "DIN99o"};

struct Standard
{
    const char *name;
    double l, a, b;
};
const Standard kStandards[] = {{"silver", 62.0, -0.6, -1.9}, {"blue", 32.0, -2.0, -38.0}};

template <typename Calculator> void boundary(benchmark::State &state, const char *type, Standard standard, int accepted)
{
    ToleranceFactory::toleranceFactory();
    auto values = plotfixtures::labAppearance(standard.l, standard.a, standard.b);
    auto lab = std::make_shared<LabValue>(standard.l, standard.a, standard.b, plotfixtures::condition());
    lab->setGeometry(kGeometry);
    auto tolerance = plotfixtures::tolerance(QString::fromLatin1(type), kGeometry);
    int vertices = 0;
    int evaluations = 0;
    for (auto _ : state) {
        Calculator calculator(values, lab, tolerance, accepted);
        const QPolygonF shape = calculator.calculateShape();
        benchmark::DoNotOptimize(shape.data());
        vertices = shape.size();
        evaluations = calculator.evaluationCount();
    }
    state.counters["vertices"] = vertices;
    state.counters["probes"] = evaluations;
}

void wholeShape(benchmark::State &state, const char *type, Standard standard)
{
    ToleranceFactory::toleranceFactory();
    ToleranceShapeRequest request;
    request.standardValues = plotfixtures::labAppearance(standard.l, standard.a, standard.b);
    auto lab = std::make_shared<LabValue>(standard.l, standard.a, standard.b, plotfixtures::condition());
    lab->setGeometry(kGeometry);
    request.standardLab = lab;
    request.tolerance = plotfixtures::tolerance(QString::fromLatin1(type), kGeometry);
    request.useAngleDifference = QString::fromLatin1(type).contains(QLatin1String("(+/-)"));
    for (auto _ : state) {
        const ToleranceShape shape = WorkerThread::computeShape(request);
        benchmark::DoNotOptimize(shape.valid);
    }
}

void registerAll()
{
    for (const Standard &standard : kStandards) {
        for (const char *type : kTypes) {
            for (int accepted : {1, 2}) {
                const std::string suffix = std::string(type) + "/" + standard.name + (accepted == 1 ? "/inner" : "/outer");
                benchmark::RegisterBenchmark(("Dividing/" + suffix).c_str(),
                                             [type, standard, accepted](benchmark::State &s) {
                                                 boundary<DividingToleranceShapeCalculator>(s, type, standard, accepted);
                                             })
                    ->Unit(benchmark::kMillisecond)
                    ->UseRealTime();
                benchmark::RegisterBenchmark(("AngleDifference/" + suffix).c_str(),
                                             [type, standard, accepted](benchmark::State &s) {
                                                 boundary<AngleDifferenceToleranceShapeCalculator>(s, type, standard,
                                                                                                   accepted);
                                             })
                    ->Unit(benchmark::kMillisecond)
                    ->UseRealTime();
            }
            benchmark::RegisterBenchmark((std::string("PlotShape/") + type + "/" + standard.name).c_str(),
                                         [type, standard](benchmark::State &s) { wholeShape(s, type, standard); })
                ->Unit(benchmark::kMillisecond)
                ->UseRealTime();
        }
    }
}

} // namespace

int main(int argc, char **argv)
{
    QCoreApplication app(argc, argv);
    registerAll();
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 1;
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
