#include "trialselectionmodel.h"

#include "geometryfilter.h"
#include "sameobjects_p.h"

#include <colorimetry/colorconverter.h>
#include <colorimetry/colordifferencecalculator.h>
#include <domain/appearancevalues.h>
#include <domain/colorimetriccondition.h>
#include <domain/labvalue.h>
#include <domain/reflectancespectrum.h>
#include <domain/tagdefinition.h>
#include <domain/tagvalue.h>
#include <domain/trial.h>

#include <cmath>
#include <map>

namespace vexa {

namespace {

const Geometry &defaultColorGeometry()
{
    static const Geometry g(Geometry::ANGLE_45as45);
    return g;
}

const Geometry &defaultTextureGeometry()
{
    static const Geometry g(Geometry::ANGLE_15as15);
    return g;
}

// The median is judged under one fixed condition, whatever the page shows.
ColorimetricCondition medianCondition()
{
    ColorimetricCondition condition;
    condition.setIlluminant(QStringLiteral("D65"));
    condition.setObserver(QStringLiteral("10"));
    return condition;
}

} // namespace

TrialSelectionModel::TrialSelectionModel()
    : m_selectedColorGeometry(Geometry::ANGLE_45as45)
    , m_selectedTextureGeometry(Geometry::ANGLE_15as15)
    , m_selectedStandardGeometry(Geometry::ANGLE_45as45)
{
}

TrialSelectionModel::TrialSelectionModel(const TrialSelectionModel &other)
    : QObject(nullptr)
    , m_activeTrials(other.m_activeTrials)
    , m_selectedTrial(other.m_selectedTrial)
    , m_groupProperty(other.m_groupProperty)
    , m_colorGeometryFilter(other.m_colorGeometryFilter)
    , m_selectedColorGeometry(other.m_selectedColorGeometry)
    , m_textureGeometryFilter(other.m_textureGeometryFilter)
    , m_selectedTextureGeometry(other.m_selectedTextureGeometry)
    , m_selectedStandardGeometry(other.m_selectedStandardGeometry)
{
}

TrialSelectionModel::~TrialSelectionModel() = default;

bool TrialSelectionModel::isActive(const std::shared_ptr<Trial> &trial) const
{
    for (const auto &t : m_activeTrials) {
        if (t.get() == trial.get())
            return true;
    }
    return false;
}

std::multimap<std::shared_ptr<TagValue>, std::shared_ptr<Trial>> TrialSelectionModel::activeTrialsByGroup() const
{
    std::multimap<std::shared_ptr<TagValue>, std::shared_ptr<Trial>> groups;
    for (const auto &trial : m_activeTrials) {
        if (!trial)
            continue;
        std::shared_ptr<TagValue> key;
        if (m_groupProperty)
            key = trial->tagValue(*m_groupProperty);
        groups.emplace(key, trial);
    }
    return groups;
}

void TrialSelectionModel::setSelectedTrial(const std::shared_ptr<Trial> &trial)
{
    if (trial.get() == m_selectedTrial.get())
        return;
    m_selectedTrial = trial;
    Q_EMIT sgTrialSelectionChanged();
}

void TrialSelectionModel::setActiveTrials(const std::vector<std::shared_ptr<Trial>> &trials, bool force)
{
    if (!force && sameObjects(trials, m_activeTrials))
        return;
    m_activeTrials = trials;
    Q_EMIT sgActiveTrialsChanged();

    if (m_activeTrials.empty()) {
        if (m_selectedTrial) {
            m_selectedTrial.reset();
            Q_EMIT sgTrialSelectionChanged();
        }
        return;
    }
    if (m_selectedTrial.get() == m_activeTrials.front().get())
        return;
    m_selectedTrial = m_activeTrials.front();
    Q_EMIT sgTrialSelectionChanged();
}

void TrialSelectionModel::toggleActiveTrial(const std::shared_ptr<Trial> &trial)
{
    for (auto it = m_activeTrials.begin(); it != m_activeTrials.end(); ++it) {
        if (it->get() == trial.get()) {
            m_activeTrials.erase(it);
            Q_EMIT sgActiveTrialsChanged();
            return;
        }
    }
    m_activeTrials.push_back(trial);
    Q_EMIT sgActiveTrialsChanged();
}

void TrialSelectionModel::clearTrials()
{
    m_activeTrials.clear();
    if (m_selectedTrial) {
        m_selectedTrial.reset();
        Q_EMIT sgTrialSelectionChanged();
    }
}

void TrialSelectionModel::clear()
{
    clearTrials();
}

void TrialSelectionModel::setGroupProperty(const std::shared_ptr<TagDefinition> &tagDefinition)
{
    m_groupProperty = tagDefinition;
    Q_EMIT sgActiveTrialsChanged();
}

void TrialSelectionModel::setSelectedColorGeometry(const Geometry &geometry)
{
    if (!(geometry != m_selectedColorGeometry))
        return;
    m_selectedColorGeometry = geometry;
    Q_EMIT sgColorGeometrySelectionChanged();
}

void TrialSelectionModel::setSelectedTextureGeometry(const Geometry &geometry)
{
    if (!(geometry != m_selectedTextureGeometry))
        return;
    m_selectedTextureGeometry = geometry;
    Q_EMIT sgTextureGeometrySelectionChanged();
}

void TrialSelectionModel::setSelectedStandardGeometry(const Geometry &geometry)
{
    if (!(geometry != m_selectedStandardGeometry))
        return;
    m_selectedStandardGeometry = geometry;
    Q_EMIT sgStandardGeometryChanged(m_selectedStandardGeometry);
}

void TrialSelectionModel::setColorGeometryFilter(const std::set<Geometry> &filter)
{
    if (filter == m_colorGeometryFilter)
        return;
    m_colorGeometryFilter = filter;
    m_selectedColorGeometry = filter.size() == 1 ? *filter.begin() : defaultColorGeometry();
    Q_EMIT sgColorGeometrySelectionChanged();
    Q_EMIT sgColorGeometryFilterChanged();
}

void TrialSelectionModel::setTextureGeometryFilter(const std::set<Geometry> &filter)
{
    if (filter == m_textureGeometryFilter)
        return;
    m_textureGeometryFilter = filter;
    m_selectedTextureGeometry = filter.size() == 1 ? *filter.begin() : defaultTextureGeometry();
    Q_EMIT sgTextureGeometrySelectionChanged();
    Q_EMIT sgTextureGeometryFilterChanged();
}

std::shared_ptr<AppearanceValues> TrialSelectionModel::getMedianAppearanceValue(
    const std::vector<std::shared_ptr<Trial>> &trials) const
{
    if (trials.empty())
        return nullptr;
    const ColorimetricCondition condition = medianCondition();
    const std::set<Geometry> geometries = GeometryFilter(m_colorGeometryFilter).geometries(trials);

    // Mean pass: componentwise sums per geometry, divided by the number of trials that took part.
    struct Sum {
        double l = 0, a = 0, b = 0;
    };
    std::map<Geometry, Sum> mean;
    int participating = 0;
    for (const auto &trial : trials) {
        if (!trial || !trial->appearanceValues())
            continue;
        ++participating;
        for (const Geometry &g : geometries) {
            const LabValue lab = ColorConverter::toLabValue(*trial->appearanceValues(), g, condition);
            if (!lab.isValid())
                continue;
            Sum &s = mean[g];
            s.l += lab.l();
            s.a += lab.a();
            s.b += lab.b();
        }
    }
    if (participating == 0)
        return nullptr;
    std::map<Geometry, LabValue> meanLab;
    for (const auto &[g, s] : mean) {
        const double n = static_cast<double>(participating);
        meanLab.emplace(g, LabValue(s.l / n, s.a / n, s.b / n, condition));
    }

    // Distance pass: the trial with the smallest mean CIEDE2000 to the mean colour; ties keep the earlier.
    double bestDistance = 1000.0;
    std::shared_ptr<Trial> best;
    for (const auto &trial : trials) {
        if (!trial || !trial->appearanceValues())
            continue;
        double sum = 0;
        int counted = 0;
        for (const auto &[g, meanValue] : meanLab) {
            const LabValue lab = ColorConverter::toLabValue(*trial->appearanceValues(), g, condition);
            if (!lab.isValid())
                continue;
            sum += ColorDifferenceCalculator::Default_DE(QStringLiteral("CIE2000"), meanValue, lab, 1.0, 1.0, 1.0);
            ++counted;
        }
        if (counted == 0)
            continue;
        const double distance = sum / counted;
        if (distance < bestDistance) {
            bestDistance = distance;
            best = trial;
        }
    }
    if (!best)
        return nullptr;
    auto copy = std::dynamic_pointer_cast<AppearanceValues>(best->appearanceValues()->deepCopy());
    if (copy)
        copy->setName(best->appearanceValues()->name());
    return copy;
}

std::shared_ptr<AppearanceValues> TrialSelectionModel::getActiveTrialsMedianAppearanceValue() const
{
    return getMedianAppearanceValue(m_activeTrials);
}

std::shared_ptr<AppearanceValues> TrialSelectionModel::averagedTrialMeasurements(
    const std::vector<std::shared_ptr<Trial>> &trials) const
{
    if (trials.empty())
        return nullptr;

    // Texture values are never averaged: they are the median trial's.
    std::vector<std::shared_ptr<TextureValues>> texture;
    if (const auto median = getMedianAppearanceValue(trials))
        texture = median->textureValues();
    // Per position of the colour values: the layout fixed by the first trial that has a
    // spectrum there, the elementwise sum and how many spectra went into it. A spectrum whose
    // layout differs from the position's is left out rather than read out of bounds.
    struct Accumulator {
        ColorPhysicalCondition condition;
        double start = 0;
        double interval = 0;
        QVector<double> sum;
        int count = 0;
    };
    std::vector<Accumulator> positions;
    size_t layoutSize = 0;
    bool layoutFixed = false;

    for (const auto &trial : trials) {
        if (!trial || !trial->appearanceValues())
            continue;
        const auto &colorValues = trial->appearanceValues()->colorValues();
        if (!layoutFixed) {
            layoutFixed = true;
            layoutSize = colorValues.size();
            positions.resize(layoutSize);
        }
        for (size_t k = 0; k < colorValues.size() && k < layoutSize; ++k) {
            const auto spectral = std::dynamic_pointer_cast<SpectralValues>(colorValues[k]);
            if (!spectral)
                continue;
            const QVector<double> values = spectral->spectralValues();
            Accumulator &acc = positions[k];
            if (acc.count == 0) {
                acc.condition = spectral->physicalCondition();
                acc.start = spectral->startWavelength();
                acc.interval = spectral->wavelengthInterval();
                acc.sum = QVector<double>(values.size(), 0.0);
            } else if (values.size() != acc.sum.size() || spectral->startWavelength() != acc.start
                       || spectral->wavelengthInterval() != acc.interval
                       || spectral->physicalCondition().geometry() != acc.condition.geometry()) {
                continue;
            }
            for (int i = 0; i < values.size(); ++i)
                acc.sum[i] += values[i];
            ++acc.count;
        }
    }

    std::vector<std::shared_ptr<ColorValues>> averaged;
    for (const Accumulator &acc : positions) {
        if (acc.count == 0)
            continue;
        QVector<double> mean = acc.sum;
        for (double &v : mean)
            v /= static_cast<double>(acc.count);
        auto spectrum = std::make_shared<ReflectanceSpectrum>();
        spectrum->setSpectralValues(mean);
        spectrum->setPhysicalCondition(acc.condition);
        spectrum->setStartWavelength(acc.start);
        spectrum->setWavelengthInterval(acc.interval);
        averaged.push_back(spectrum);
    }
    auto result = std::make_shared<AppearanceValues>();
    result->setColorValues(averaged);
    result->setTextureValues(texture);
    return result;
}

std::shared_ptr<AppearanceValues> TrialSelectionModel::averagedActiveTrialMeasurements() const
{
    return averagedTrialMeasurements(m_activeTrials);
}

} // namespace vexa
