#pragma once

// Small measured objects for the component library's tests: smooth reflectance
// spectra (400-700 nm, 10 nm) at a few geometries, trials and standards around them.

#include <domain/appearancevalues.h>
#include <domain/geometry.h>
#include <domain/reflectancespectrum.h>
#include <domain/standard.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>

#include <QStringList>

#include <cmath>
#include <memory>

namespace fixtures {

// A smooth spectrum: a base level, one Gaussian peak, scaled for the geometry so that the
// near-specular angles are brighter (metallic flop).
inline std::shared_ptr<vexa::ReflectanceSpectrum> spectrum(const vexa::Geometry &geometry, double base,
                                                           double peakNm, double peakHeight, double scale = 1.0)
{
    QVector<double> values;
    for (int nm = 400; nm <= 700; nm += 10)
        values << scale * (base + peakHeight * std::exp(-std::pow((nm - peakNm) / 40.0, 2)));
    auto s = std::make_shared<vexa::ReflectanceSpectrum>();
    s->setSpectralValues(values);
    s->setStartWavelength(400);
    s->setWavelengthInterval(10);
    s->setGeometry(geometry);
    return s;
}

inline double flopScale(const vexa::Geometry &g)
{
    return 1.6 - g.getAspecular() / 100.0;
}

inline std::shared_ptr<vexa::AppearanceValues> appearance(const QStringList &geometries, double base,
                                                          double peakNm = 550, double peakHeight = 0.3,
                                                          const QString &name = QString())
{
    auto values = std::make_shared<vexa::AppearanceValues>();
    std::vector<std::shared_ptr<vexa::ColorValues>> colorValues;
    for (const QString &text : geometries) {
        const vexa::Geometry g(text);
        colorValues.push_back(spectrum(g, base, peakNm, peakHeight, flopScale(g)));
    }
    values->setColorValues(colorValues);
    values->setName(name);
    return values;
}

inline QStringList threeAngles()
{
    return {QStringLiteral("45as15"), QStringLiteral("45as45"), QStringLiteral("45as110")};
}

inline std::shared_ptr<vexa::Trial> trial(const QString &name, double base, const QStringList &geometries = threeAngles(),
                                          double peakNm = 550)
{
    auto t = std::make_shared<vexa::Trial>();
    t->setName(name);
    t->setAppearanceValues(appearance(geometries, base, peakNm, 0.3, name));
    return t;
}

inline std::shared_ptr<vexa::Standard> standard(const QString &name, double base,
                                                const QStringList &geometries = threeAngles())
{
    auto s = std::make_shared<vexa::Standard>();
    s->setName(name);
    s->setAppearanceValues(appearance(geometries, base, 550, 0.3, name));
    return s;
}

inline std::shared_ptr<vexa::ToleranceSet> toleranceSet(const QString &name, const QStringList &geometries)
{
    auto set = std::make_shared<vexa::ToleranceSet>();
    set->setName(name);
    std::vector<std::shared_ptr<vexa::Tolerance>> tolerances;
    for (const QString &g : geometries) {
        auto t = std::make_shared<vexa::Tolerance>();
        t->setToleranceType(QStringLiteral("CIELab dE*ab"));
        t->setGeometry(g.isEmpty() ? QString() : vexa::Geometry(g).toString());
        tolerances.push_back(t);
    }
    set->setTolerances(tolerances);
    return set;
}

} // namespace fixtures
