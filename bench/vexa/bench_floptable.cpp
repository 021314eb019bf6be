// The flop table at scale: 1,000 trials at the six 45° geometries against one standard
// with a flop tolerance. Measures the data pass of the model (cold: every flop index and
// verdict computed; warm: from the cache) beside the same work done directly, and what a
// trial selection costs the widget: the selection and a repaint of the table, beside a bare
// repaint.
//
// Run: build/bench/vexa/bench_floptable (offscreen by default).

#include "tables/tablefixtures.h"

#include <vexa/tables/floptablemodel.h>
#include <vexa/tables/floptablewidget.h>

#include <colorimetry/colorconverter.h>
#include <colorimetry/colorindicescalculator.h>
#include <domain/labvalue.h>

#include <benchmark/benchmark.h>

#include <QApplication>
#include <QCheckBox>
#include <QTableView>

#include <memory>
#include <vector>

using namespace vexa;

namespace {

constexpr int kTrials = 1000;

struct Page
{
    tablefixtures::Page page;
    std::shared_ptr<GeneralSettings> general = std::make_shared<GeneralSettings>();
    std::shared_ptr<Tolerance> flop;

    Page()
    {
        QStringList geometries;
        for (const Geometry &g : Geometry::geometries(GeometrySet::MultiAngle))
            geometries << g.toString();
        page.standard = fixtures::standard(QStringLiteral("STD"), 0.20, geometries);
        flop = ToleranceFactory::toleranceFactory()->createTolerance(QStringLiteral("Flop Index(+/-)"), Geometry());
        auto set = std::make_shared<ToleranceSet>();
        set->setName(QStringLiteral("Flop"));
        set->setTolerances({flop});
        page.standard->setToleranceSets({set});
        for (int i = 0; i < kTrials; ++i)
            page.trials.push_back(fixtures::trial(QStringLiteral("T%1").arg(i), 0.19 + 0.02 * (i % 100) / 100.0,
                                                  geometries, 540 + i % 20));
        page.data->setStandard(page.standard);
        page.data->setTrials(page.trials);
    }
};

Page &page()
{
    static Page instance;
    return instance;
}

// Every cell's DisplayRole and BackgroundRole, as a view and an export read them.
void readAll(const FlopTableModel &model)
{
    for (int r = 0; r < model.rowCount(); ++r) {
        for (int c = 0; c < model.columnCount(); ++c) {
            const QModelIndex index = model.index(r, c);
            benchmark::DoNotOptimize(index.data(Qt::DisplayRole));
            benchmark::DoNotOptimize(index.data(Qt::BackgroundRole));
        }
    }
}

void BM_FlopDataPassCold(benchmark::State &state)
{
    FlopTableModel model(page().general);
    model.setModels(page().page.data, page().page.selection);
    for (auto _ : state) {
        model.refresh(); // forgets every computed value
        readAll(model);
    }
    state.counters["rows"] = model.rowCount();
}

// The same flop indices and verdicts computed directly, without a model.
void BM_RawFlopIndicesAndVerdicts(benchmark::State &state)
{
    const ColorimetricCondition condition(QStringLiteral("D65"), QStringLiteral("10"));
    const Geometry g15(Geometry::ANGLE_45as15), g45(Geometry::ANGLE_45as45), g110(Geometry::ANGLE_45as110);
    const auto &standard = *page().page.standard->appearanceValues();
    for (auto _ : state) {
        const double s = ColorIndicesCalculator::FlopIndex(ColorConverter::toLabValue(standard, g15, condition),
                                                           ColorConverter::toLabValue(standard, g45, condition),
                                                           ColorConverter::toLabValue(standard, g110, condition));
        for (const auto &trial : page().page.trials) {
            const auto &values = *trial->appearanceValues();
            const double t = ColorIndicesCalculator::FlopIndex(ColorConverter::toLabValue(values, g15, condition),
                                                               ColorConverter::toLabValue(values, g45, condition),
                                                               ColorConverter::toLabValue(values, g110, condition));
            benchmark::DoNotOptimize(t - s);
            benchmark::DoNotOptimize(page().flop->status(values, standard, condition));
        }
    }
}

void BM_FlopDataPassWarm(benchmark::State &state)
{
    FlopTableModel model(page().general);
    model.setModels(page().page.data, page().page.selection);
    readAll(model);
    for (auto _ : state)
        readAll(model);
}

// The least a model can do for the same cells: variants of values already computed.
void BM_RawVariantsOfCachedValues(benchmark::State &state)
{
    std::vector<double> values(size_t(kTrials + 1) * 2, 7.25);
    const QString name = QStringLiteral("T123");
    for (auto _ : state) {
        for (size_t i = 0; i < values.size(); i += 2) {
            benchmark::DoNotOptimize(QVariant(name));
            benchmark::DoNotOptimize(QVariant(values[i]));
            benchmark::DoNotOptimize(QVariant(values[i + 1]));
            benchmark::DoNotOptimize(QVariant(QColor(0, 145, 77)));
        }
    }
}

struct ShownWidget
{
    FlopTableWidget widget{page().general};
    ShownWidget(bool selectedTrialOnly)
    {
        widget.setModels(page().page.data, page().page.selection);
        widget.selectedTrialOnlyBox()->setChecked(selectedTrialOnly);
        widget.resize(420, 600);
        widget.show();
        QApplication::processEvents();
        widget.tableView()->viewport()->repaint();
    }
};

// Selecting a trial far down the list (the view scrolls to it), then painting.
void selectAndPaint(benchmark::State &state, bool selectedTrialOnly)
{
    ShownWidget shown(selectedTrialOnly);
    auto &selection = *page().page.selection;
    int i = 0;
    for (auto _ : state) {
        selection.setSelectedTrial(page().page.trials[size_t((i * 397) % kTrials)]);
        shown.widget.tableView()->viewport()->repaint();
        ++i;
    }
    selection.setSelectedTrial(nullptr);
}

void BM_SelectTrialAndPaint(benchmark::State &state)
{
    selectAndPaint(state, false);
}

void BM_SelectTrialAndPaintSelectedOnly(benchmark::State &state)
{
    selectAndPaint(state, true);
}

// Everything forgotten (new trials, another illuminant), then the visible rows computed
// again, laid out and painted.
void BM_RefreshAndPaint(benchmark::State &state)
{
    ShownWidget shown(false);
    for (auto _ : state) {
        shown.widget.settingsChanged();
        QApplication::processEvents();
        shown.widget.tableView()->viewport()->repaint();
    }
}

void BM_RawRepaint(benchmark::State &state)
{
    ShownWidget shown(false);
    for (auto _ : state)
        shown.widget.tableView()->viewport()->repaint();
}

} // namespace

BENCHMARK(BM_FlopDataPassCold)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RawFlopIndicesAndVerdicts)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_FlopDataPassWarm)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RawVariantsOfCachedValues)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_SelectTrialAndPaint)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_SelectTrialAndPaintSelectedOnly)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RefreshAndPaint)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RawRepaint)->Unit(benchmark::kMillisecond);

int main(int argc, char **argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    ToleranceFactory::toleranceFactory();
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
