// Throughput of the colour computations: spectra to L*a*b* and CIEDE2000, ours beside lcms2's.
//   build-colour/bench/colorimetry/bench_colorimetry --benchmark_min_time=0.5

#include <colorimetry/colorconverter.h>
#include <colorimetry/colordifferenceformulas.h>
#include <colorimetry/colorspaceconversion.h>
#include <colorimetry/spectralweights.h>

#include <domain/reflectancespectrum.h>

#include <benchmark/benchmark.h>
#include <lcms2.h>

#include <cmath>
#include <random>
#include <vector>

using namespace vexa;

namespace {

std::vector<ReflectanceSpectrum> spectra(int count, int values, double interval)
{
    std::mt19937 random(7);
    std::uniform_real_distribution<double> level(0.05, 0.9);
    std::vector<ReflectanceSpectrum> result;
    for (int i = 0; i < count; ++i) {
        const double low = level(random);
        const double high = level(random);
        QVector<double> v;
        for (int k = 0; k < values; ++k)
            v.append(low + (high - low) * k / double(values - 1));
        result.emplace_back(v, 400.0, interval);
    }
    return result;
}

std::vector<std::pair<CieLab, CieLab>> labPairs(int count)
{
    std::mt19937 random(11);
    std::uniform_real_distribution<double> l(5.0, 95.0);
    std::uniform_real_distribution<double> ab(-80.0, 80.0);
    std::uniform_real_distribution<double> d(-3.0, 3.0);
    std::vector<std::pair<CieLab, CieLab>> result;
    for (int i = 0; i < count; ++i) {
        const CieLab s{l(random), ab(random), ab(random)};
        result.push_back({s, CieLab{s.L + d(random), s.a + d(random), s.b + d(random)}});
    }
    return result;
}

void SpectrumToLab10nm(benchmark::State &state)
{
    const auto input = spectra(1024, 31, 10.0);
    const ColorimetricCondition condition(QStringLiteral("D65"), QStringLiteral("10"));
    std::size_t i = 0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(ColorConverter::toLab(input[i++ % input.size()], condition));
    }
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(SpectrumToLab10nm);

void SpectrumToLab20nm(benchmark::State &state)
{
    const auto input = spectra(1024, 16, 20.0);
    const ColorimetricCondition condition(QStringLiteral("D50"), QStringLiteral("2"));
    std::size_t i = 0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(ColorConverter::toLab(input[i++ % input.size()], condition));
    }
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(SpectrumToLab20nm);

void SpectrumToLabWeightsOnly(benchmark::State &state)
{
    // The core without the domain objects: cached weights, sum, XYZ → L*a*b*.
    const auto weights = SpectralWeights::forGrid(QStringLiteral("D65"), QStringLiteral("10"), 400.0, 10.0, 31);
    const auto input = spectra(1024, 31, 10.0);
    std::vector<std::vector<double>> raw;
    for (const auto &s : input) {
        const QVector<double> v = s.spectralValues();
        raw.emplace_back(v.begin(), v.end());
    }
    std::size_t i = 0;
    for (auto _ : state) {
        const CieXYZ xyz = weights->tristimulus(raw[i++ % raw.size()].data());
        benchmark::DoNotOptimize(ColorSpaceConversion::xyzToLab(xyz, weights->whitePoint()));
    }
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(SpectrumToLabWeightsOnly);

void DeltaE2000Ours(benchmark::State &state)
{
    const auto pairs = labPairs(4096);
    std::size_t i = 0;
    for (auto _ : state) {
        const auto &p = pairs[i++ % pairs.size()];
        benchmark::DoNotOptimize(ColorDifferenceFormulas::ciede2000(p.first, p.second, 1.0, 1.0, 1.0));
    }
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(DeltaE2000Ours);

void DeltaE2000Lcms2(benchmark::State &state)
{
    const auto pairs = labPairs(4096);
    std::vector<std::pair<cmsCIELab, cmsCIELab>> cms;
    for (const auto &p : pairs)
        cms.push_back({cmsCIELab{p.first.L, p.first.a, p.first.b}, cmsCIELab{p.second.L, p.second.a, p.second.b}});
    std::size_t i = 0;
    for (auto _ : state) {
        const auto &p = cms[i++ % cms.size()];
        benchmark::DoNotOptimize(cmsCIE2000DeltaE(&p.first, &p.second, 1.0, 1.0, 1.0));
    }
    state.SetItemsProcessed(state.iterations());
}
BENCHMARK(DeltaE2000Lcms2);

} // namespace

BENCHMARK_MAIN();
