#include <colorimetry/spectralweights.h>

#include <colorimetry/cietables.h>

#include <mutex>

#include <algorithm>
#include <cmath>
#include <map>
#include <tuple>

namespace vexa {

namespace {

constexpr int kFirstWavelength = 360;
constexpr int kLastWavelength = 830;
constexpr std::size_t kMaxCachedGrids = 256;

/// Adds the Lagrange interpolation coefficients of the samples around position u (in units of the
/// sample interval, 0 = first sample) times `product` to `weights`.
void addInterpolated(double u, int count, const double product[3], std::vector<double> *weights)
{
    auto add = [&](int node, double coefficient) {
        for (int c = 0; c < 3; ++c)
            weights[c][std::size_t(node)] += coefficient * product[c];
    };
    if (count == 1 || u <= 0.0) {
        add(0, 1.0);
        return;
    }
    if (u >= count - 1) {
        add(count - 1, 1.0);
        return;
    }
    const int j = int(std::floor(u));
    if (u == double(j)) {
        add(j, 1.0);
        return;
    }
    int first = j;
    int last = j + 1;
    if (count >= 3) {
        if (count == 3) {
            first = 0;
            last = 2;
        } else if (j == 0) {
            last = 2;
        } else if (j == count - 2) {
            first = count - 3;
        } else {
            first = j - 1;
            last = j + 2;
        }
    }
    for (int k = first; k <= last; ++k) {
        double coefficient = 1.0;
        for (int m = first; m <= last; ++m) {
            if (m != k)
                coefficient *= (u - m) / double(k - m);
        }
        add(k, coefficient);
    }
}

using GridKey = std::tuple<QString, QString, double, double, int>;

} // namespace

QString SpectralWeights::illuminantName(const QString &text)
{
    QString name = text.trimmed().toUpper();
    if (name.startsWith(QLatin1String("FL")))
        name.remove(1, 1);
    return CieTables::illuminant(name.toLatin1().constData()) ? name : QString();
}

QString SpectralWeights::observerName(const QString &text)
{
    QString name = text.trimmed().toLower();
    for (const QString &suffix : {QStringLiteral("degrees"), QStringLiteral("degree"), QStringLiteral("deg"),
                                  QStringLiteral("\u00b0")}) {
        if (name.endsWith(suffix)) {
            name.chop(suffix.size());
            break;
        }
    }
    name = name.trimmed();
    return CieTables::observer(name.toLatin1().constData()) ? name : QString();
}

std::shared_ptr<const SpectralWeights> SpectralWeights::forGrid(const QString &illuminant, const QString &observer,
                                                                double start, double interval, int count)
{
    const QString illuminantKey = illuminantName(illuminant);
    const QString observerKey = observerName(observer);
    if (illuminantKey.isEmpty() || observerKey.isEmpty() || count < 1 || !std::isfinite(start)
        || !std::isfinite(interval) || (count > 1 && interval <= 0.0) || count > 100000)
        return nullptr;
    if (count == 1)
        interval = 1.0;

    static std::mutex mutex;
    static std::map<GridKey, std::shared_ptr<const SpectralWeights>> cache;
    const GridKey key(illuminantKey, observerKey, start, interval, count);
    {
        std::lock_guard<std::mutex> locker(mutex);
        const auto found = cache.find(key);
        if (found != cache.end())
            return found->second;
    }
    // Computed outside the lock: two threads may compute the same grid once each, which is harmless.
    std::shared_ptr<const SpectralWeights> weights = compute(illuminantKey, observerKey, start, interval, count);
    std::lock_guard<std::mutex> locker(mutex);
    if (cache.size() >= kMaxCachedGrids)
        cache.clear();
    return cache.emplace(key, weights).first->second;
}

std::shared_ptr<const SpectralWeights> SpectralWeights::compute(const QString &illuminant, const QString &observer,
                                                                double start, double interval, int count)
{
    const CieTable &power = *CieTables::illuminant(illuminant.toLatin1().constData());
    const CieTable &cmf = *CieTables::observer(observer.toLatin1().constData());

    std::shared_ptr<SpectralWeights> result(new SpectralWeights);
    std::vector<double> weights[3] = {std::vector<double>(std::size_t(count), 0.0),
                                      std::vector<double>(std::size_t(count), 0.0),
                                      std::vector<double>(std::size_t(count), 0.0)};
    // The sum runs over the illuminant's own tabulation (1 nm or 5 nm) where it overlaps the observer
    // (360-830 nm), so no illuminant value is invented by interpolation.
    double normalisation = 0.0;
    double total[3] = {0.0, 0.0, 0.0};
    double unmeasured[3] = {0.0, 0.0, 0.0};
    const double lastMeasured = start + interval * (count - 1);
    const int first = std::max(kFirstWavelength, power.firstWavelength);
    const int last = std::min(kLastWavelength, power.lastWavelength());
    for (int wavelength = first; wavelength <= last; wavelength += power.step) {
        const double s = power.value((wavelength - power.firstWavelength) / power.step, 0);
        const int row = (wavelength - cmf.firstWavelength) / cmf.step;
        const double product[3] = {s * cmf.value(row, 0), s * cmf.value(row, 1), s * cmf.value(row, 2)};
        normalisation += product[1];
        const bool outside = wavelength < start || wavelength > lastMeasured;
        for (int c = 0; c < 3; ++c) {
            total[c] += product[c];
            if (outside)
                unmeasured[c] += product[c];
        }
        addInterpolated((wavelength - start) / interval, count, product, weights);
    }
    for (int c = 0; c < 3; ++c)
        result->m_unmeasuredShare = std::max(result->m_unmeasuredShare, total[c] > 0.0 ? unmeasured[c] / total[c] : 1.0);
    const double k = 100.0 / normalisation;
    for (auto &w : weights) {
        for (double &value : w)
            value *= k;
    }
    result->m_x = std::move(weights[0]);
    result->m_y = std::move(weights[1]);
    result->m_z = std::move(weights[2]);
    const std::vector<double> ones(std::size_t(count), 1.0);
    result->m_white = result->tristimulus(ones.data());
    return result;
}

CieXYZ SpectralWeights::tristimulus(const double *reflectance) const
{
    CieXYZ xyz;
    const std::size_t n = m_x.size();
    for (std::size_t i = 0; i < n; ++i) {
        xyz.X += m_x[i] * reflectance[i];
        xyz.Y += m_y[i] * reflectance[i];
        xyz.Z += m_z[i] * reflectance[i];
    }
    return xyz;
}

} // namespace vexa
