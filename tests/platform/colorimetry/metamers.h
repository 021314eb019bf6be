#pragma once

// Metameric pairs for tests: a spectrum plus a metameric black has the same X, Y and Z
// under one condition and, as a rule, different ones under any other.

#include <colorimetry/spectralweights.h>

#include <domain/colorimetriccondition.h>

#include <QVector>

#include <array>
#include <cmath>

namespace metamers {

// A wave of the given amplitude projected off the condition's three weighting vectors of
// the grid: it adds nothing to X, Y and Z. Empty for a grid the weights do not cover.
inline QVector<double> metamericBlack(double start, double interval, int count,
                                      const vexa::ColorimetricCondition &condition, double amplitude = 0.15)
{
    const auto weights =
        vexa::SpectralWeights::forGrid(condition.illuminant(), condition.observer(), start, interval, count);
    if (!weights)
        return {};
    const std::array<const std::vector<double> *, 3> w{&weights->weightsX(), &weights->weightsY(),
                                                       &weights->weightsZ()};
    QVector<double> wave(count);
    for (int i = 0; i < count; ++i)
        wave[i] = amplitude * std::sin(i * 0.75);
    // Least squares: a = (WᵀW)⁻¹ Wᵀ wave, then black = wave − W a.
    double g[3][3];
    double c[3];
    for (int r = 0; r < 3; ++r) {
        c[r] = 0.0;
        for (int i = 0; i < count; ++i)
            c[r] += (*w[size_t(r)])[size_t(i)] * wave[i];
        for (int k = 0; k < 3; ++k) {
            g[r][k] = 0.0;
            for (int i = 0; i < count; ++i)
                g[r][k] += (*w[size_t(r)])[size_t(i)] * (*w[size_t(k)])[size_t(i)];
        }
    }
    auto det = [](double m[3][3]) {
        return m[0][0] * (m[1][1] * m[2][2] - m[1][2] * m[2][1]) - m[0][1] * (m[1][0] * m[2][2] - m[1][2] * m[2][0])
            + m[0][2] * (m[1][0] * m[2][1] - m[1][1] * m[2][0]);
    };
    const double d = det(g);
    double a[3];
    for (int k = 0; k < 3; ++k) { // Cramer's rule
        double m[3][3];
        for (int r = 0; r < 3; ++r)
            for (int j = 0; j < 3; ++j)
                m[r][j] = j == k ? c[r] : g[r][j];
        a[k] = det(m) / d;
    }
    for (int i = 0; i < count; ++i)
        for (int k = 0; k < 3; ++k)
            wave[i] -= a[k] * (*w[size_t(k)])[size_t(i)];
    return wave;
}

// The values plus a metameric black under the condition.
inline QVector<double> metamer(const QVector<double> &values, double start, double interval,
                               const vexa::ColorimetricCondition &condition, double amplitude = 0.15)
{
    QVector<double> result = values;
    const QVector<double> black = metamericBlack(start, interval, values.size(), condition, amplitude);
    for (int i = 0; i < black.size(); ++i)
        result[i] += black[i];
    return result;
}

} // namespace metamers
