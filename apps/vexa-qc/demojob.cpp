#include "demojob.h"

#include <domain/appearancevalues.h>
#include <domain/qcjob.h>
#include <domain/reflectancespectrum.h>
#include <domain/trial.h>

#include <random>

namespace vexa {

void enlargeJob(LoadedJob &job, int trials)
{
    if (!job.job)
        return;
    std::vector<std::shared_ptr<Trial>> all = job.job->trials();
    const std::vector<std::shared_ptr<Trial>> originals = all;
    if (originals.empty() || int(all.size()) >= trials)
        return;
    std::mt19937 random(20261125);
    std::normal_distribution<double> scatter(0.0, 0.012);
    for (int n = int(all.size()); n < trials; ++n) {
        const auto &original = originals[size_t(n) % originals.size()];
        auto copy = std::dynamic_pointer_cast<Trial>(original ? original->deepCopy() : nullptr);
        if (!copy || !copy->appearanceValues())
            continue;
        copy->setName(QStringLiteral("%1 #%2").arg(original->name()).arg(n / int(originals.size()) + 1));
        // One lightness factor and one spectral tilt per copy, the same at every geometry: the
        // copy reads as another panel of the same batch.
        const double gain = 1.0 + scatter(random);
        const double tilt = scatter(random);
        for (const auto &values : copy->appearanceValues()->colorValues()) {
            auto spectrum = std::dynamic_pointer_cast<ReflectanceSpectrum>(values);
            if (!spectrum)
                continue;
            QVector<double> reflectance = spectrum->spectralValues();
            for (int i = 0; i < reflectance.size(); ++i) {
                const double wavelength = spectrum->startWavelength() + i * spectrum->wavelengthInterval();
                reflectance[i] *= gain * (1.0 + tilt * (wavelength - 550.0) / 150.0);
            }
            spectrum->setSpectralValues(reflectance);
        }
        all.push_back(copy);
    }
    job.job->setTrials(all);
}

} // namespace vexa
