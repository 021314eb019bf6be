#include <sampledata/sampledata.h>

#include <domain/appearancevalues.h>
#include <domain/colorant.h>
#include <domain/colorantrestriction.h>
#include <domain/folder.h>
#include <domain/formula.h>
#include <domain/formulationsettings.h>
#include <domain/geometry.h>
#include <domain/ingredient.h>
#include <domain/qcjob.h>
#include <domain/qcjobtemplate.h>
#include <domain/recipetrial.h>
#include <domain/reflectancespectrum.h>
#include <domain/rgbvalue.h>
#include <domain/standard.h>
#include <domain/texturephysicalcondition.h>
#include <domain/texturescalevaluesdirectional.h>
#include <domain/texturevalues.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>

#include <colorimetry/colorconverter.h>
#include <domain/colorimetriccondition.h>
#include <domain/tolerancevalue.h>
#include <tolerances/tolerancefactory.h>

#include <utilities/timestamp.h>

#include <store/objectcodec.h>
#include <store/objectstore.h>

#include <QUuid>

#include <algorithm>
#include <cmath>
#include <type_traits>
#include <random>

namespace vexa {

namespace {

// std::mt19937 is specified exactly; the std:: distributions are not, so the
// generator draws its numbers itself.
class Random
{
public:
    explicit Random(unsigned seed)
        : m_engine(seed)
    {
    }
    double uniform() { return double(m_engine()) / 4294967296.0; } // [0, 1)
    double uniform(double from, double to) { return from + (to - from) * uniform(); }
    double normal() // Box-Muller
    {
        const double u1 = 1.0 - uniform();
        const double u2 = uniform();
        return std::sqrt(-2.0 * std::log(u1)) * std::cos(2.0 * M_PI * u2);
    }
    QString id() // a deterministic UUID text, so that two runs write identical bytes
    {
        QByteArray bytes(16, '\0');
        for (int i = 0; i < 16; i += 4) {
            const quint32 v = m_engine();
            for (int k = 0; k < 4; ++k)
                bytes[i + k] = char((v >> (8 * k)) & 0xff);
        }
        bytes[6] = char((bytes[6] & 0x0f) | 0x40);
        bytes[8] = char((bytes[8] & 0x3f) | 0x80);
        return QUuid::fromRfc4122(bytes).toString(QUuid::WithoutBraces);
    }

private:
    std::mt19937 m_engine;
};

// Every new object draws a random id and uuid; the sample's come from the generator.
template<typename T>
std::shared_ptr<T> make(Random &random)
{
    auto object = std::make_shared<T>();
    if constexpr (std::is_base_of_v<BaseObject, T>) {
        object->setId(random.id());
        object->setUuid(QUuid::fromString(random.id()));
    }
    return object;
}

const char *const Geometries[] = {Geometry::ANGLE_45asN15, Geometry::ANGLE_45as15, Geometry::ANGLE_45as25,
                                  Geometry::ANGLE_45as45, Geometry::ANGLE_45as75, Geometry::ANGLE_45as110};
const double Aspecular[] = {-15, 15, 25, 45, 75, 110};
// The flop-index limits of the automotive sets: ±FlopLimit.
constexpr double FlopLimit = 0.5;
// How much the flop of a metallic trial changes with its sparkle deviation.
constexpr double FlopPerSparkle = 0.05;

// A paint: base reflectance curve (sum of Gaussians and a sigmoid) and how much
// metallic flop it has.
struct Paint
{
    QString name;
    double base;      // constant part
    double peak;      // Gaussian amplitude
    double peakNm;    // Gaussian centre
    double peakWidth; // Gaussian width
    double edge;      // sigmoid amplitude (reds rise towards long wavelengths)
    double edgeNm;
    double flop;      // 0 solid .. 1 strong metallic
    double sparkle;
};

// How a trial departs from its standard: lightness factor, hue shift of the
// spectral features in nm, chroma factor on the coloured part; for metallics the
// change of sparkle and the factor on the flop that the flakes' alignment brings with it.
struct Deviation
{
    double lightness = 1.0;
    double hueShiftNm = 0.0;
    double chroma = 1.0;
    double sparkle = 0.0;
    double flop = 1.0;
};

double reflectance(const Paint &p, double nm, double aspecular, const Deviation &d)
{
    const double g = p.peak * std::exp(-std::pow((nm - p.peakNm - d.hueShiftNm) / p.peakWidth, 2.0));
    const double s = p.edge / (1.0 + std::exp(-(nm - p.edgeNm - d.hueShiftNm) / 18.0));
    const double colour = p.base + d.chroma * (g + s);
    // Metallic flop: bright near the specular, dark far from it.
    // Towards the illumination (negative aspecular angles) the flakes reflect less than
    // at the same angle past the specular.
    const double away = aspecular < 0 ? 1.8 * -aspecular : aspecular;
    const double flop = std::clamp(p.flop * d.flop, 0.0, 1.0);
    const double angular = p.flop > 0 ? (1.0 - flop) + flop * 2.6 * std::exp(-away / 28.0)
                                      : 1.0 - 0.0006 * away;
    const double value = colour * angular * d.lightness;
    return std::clamp(value, 0.002, 1.5);
}

std::shared_ptr<AppearanceValues> measure(Random &random, const Paint &paint, const Deviation &deviation)
{
    const double sparkleDelta = deviation.sparkle;
    auto values = make<AppearanceValues>(random);
    std::vector<std::shared_ptr<ColorValues>> colour;
    for (int g = 0; g < 6; ++g) {
        auto spectrum = make<ReflectanceSpectrum>(random);
        spectrum->setGeometry(Geometry::toGeometry(QString::fromLatin1(Geometries[g])));
        spectrum->setStartWavelength(400);
        spectrum->setWavelengthInterval(10);
        QVector<double> r;
        for (int nm = 400; nm <= 700; nm += 10)
            r << std::round(reflectance(paint, nm, Aspecular[g], deviation) * 1e5) / 1e5;
        spectrum->setSpectralValues(r);
        colour.push_back(spectrum);
    }
    values->setColorValues(colour);
    if (paint.flop > 0) {
        auto texture = make<TextureValues>(random);
        texture->setTexturePhysicalConditions(
            TexturePhysicalCondition(Geometry::toGeometry(QString::fromLatin1(Geometry::ANGLE_15as15))));
        auto scale = make<TextureScaleValuesDirectional>(random);
        scale->setSparkleGrade(std::round((paint.sparkle + sparkleDelta) * 100) / 100);
        scale->setSparkleColorVariation(std::round((paint.sparkle * 0.4 + sparkleDelta * 0.5) * 100) / 100);
        texture->setTextureScaleValues(scale);
        values->setTextureValues({texture});
    }
    return values;
}

// A tolerance set of one type at the six geometries, with the type's default
// limits scaled by `limit` (wider near the specular, where metallic readings
// scatter most) and the usual thresholds: pass up to 0.8 of the limit, warning up to 1.
std::shared_ptr<ToleranceSet> toleranceSet(Random &random, const QString &name, const QString &type, double limit)
{
    auto set = make<ToleranceSet>(random);
    set->setName(name);
    std::vector<std::shared_ptr<Tolerance>> tolerances;
    ToleranceFactory *factory = ToleranceFactory::toleranceFactory();
    for (int g = 0; g < 6; ++g) {
        auto tolerance = factory->createTolerance(type, Geometry::toGeometry(QString::fromLatin1(Geometries[g])));
        if (!tolerance)
            continue;
        // The factory's new objects draw random ids; the sample's come from the generator.
        auto renumber = [&random](BaseObject &object) {
            object.setId(random.id());
            object.setUuid(QUuid::fromString(object.id()));
        };
        renumber(*tolerance);
        for (const auto &parameter : tolerance->toleranceParameters())
            renumber(*parameter);
        for (const auto &value : tolerance->toleranceValues())
            renumber(*value);
        const double widen = std::abs(Aspecular[g]) <= 15 ? 1.5 : 1.0;
        for (const auto &value : tolerance->toleranceValues()) {
            if (value && value->isEditable())
                value->setValue(value->valueAsDouble() * limit * widen);
        }
        tolerance->setPassThreshold(1.0);
        tolerance->setCheckThreshold(0.8);
        tolerances.push_back(tolerance);
    }
    set->setTolerances(tolerances);
    return set;
}

// The worst normalised difference of a trial over the set's geometries.
double worstDifference(const ToleranceSet &set, const AppearanceValues &trial, const AppearanceValues &standard)
{
    const ColorimetricCondition condition(QStringLiteral("D65"), QStringLiteral("10"));
    double worst = 0.0;
    for (const auto &tolerance : set.tolerances()) {
        const ToleranceJudgement j = tolerance->judge(trial, standard, condition);
        if (j.status != 0 && std::isfinite(j.normalizedDifference))
            worst = std::max(worst, j.normalizedDifference);
    }
    return worst;
}

template<typename T>
std::shared_ptr<T> named(Random &random, const QString &name)
{
    auto object = make<T>(random);
    object->setName(name);
    return object;
}

bool store(ObjectStore &objectStore, const std::vector<std::shared_ptr<BaseObject>> &objects, const QString &folder,
           ErrorInfo *error)
{
    std::vector<StoreRecord> records(objects.size());
    for (size_t i = 0; i < objects.size(); ++i) {
        if (!ObjectCodec::toRecord(*objects[i], &records[i], error))
            return false;
    }
    if (!objectStore.add(&records, folder, error))
        return false;
    for (auto &object : objects) {
        object->setVersion(1);
        object->setIsStored(true);
    }
    return true;
}

} // namespace

bool SampleData::populate(ObjectStore &objectStore, ErrorInfo *error)
{
    Random random(20240601u);

    auto standardsFolder = named<Folder>(random, QStringLiteral("Standards"));
    auto jobsFolder = named<Folder>(random, QStringLiteral("QC Jobs"));
    auto tolerancesFolder = named<Folder>(random, QStringLiteral("Tolerance Sets"));
    auto colorantsFolder = named<Folder>(random, QStringLiteral("Colorants"));
    auto formulasFolder = named<Folder>(random, QStringLiteral("Formulas"));
    if (!store(objectStore, {standardsFolder, jobsFolder, tolerancesFolder, colorantsFolder, formulasFolder},
               QString(), error))
        return false;

    // Tolerance sets: pass and check (warning) limits per geometry.
    auto labSet = toleranceSet(random, QStringLiteral("Automotive CIELab"), QStringLiteral("CIELab(+/-)"), 1.0);
    auto de2000Set = toleranceSet(random, QStringLiteral("Automotive CIEDE2000"), QStringLiteral("CIEDE2000"), 1.0);
    // The automotive ΔE set also judges the flop index (sample-wide, no geometry). Its ids come
    // from a generator of its own so that everything drawn after it stays as it was.
    {
        Random flopRandom(20240602u);
        auto flop = ToleranceFactory::toleranceFactory()->createTolerance(QStringLiteral("Flop Index(+/-)"), Geometry());
        if (flop) {
            const auto renumber = [&flopRandom](BaseObject &object) {
                object.setId(flopRandom.id());
                object.setUuid(QUuid::fromString(object.id()));
            };
            renumber(*flop);
            for (const auto &parameter : flop->toleranceParameters())
                renumber(*parameter);
            for (const auto &value : flop->toleranceValues()) {
                renumber(*value);
                if (value->isEditable())
                    value->setValue(value->valueAsDouble() * FlopLimit);
            }
            auto tolerances = de2000Set->tolerances();
            tolerances.push_back(flop);
            de2000Set->setTolerances(tolerances);
        }
    }
    auto cmcSet = toleranceSet(random, QStringLiteral("Solid CMC"), QStringLiteral("CMC(l:c)"), 1.0);
    auto de94Set = toleranceSet(random, QStringLiteral("Solid CIE94"), QStringLiteral("CIE94"), 1.2);
    if (!store(objectStore, {labSet, de2000Set, cmcSet, de94Set}, tolerancesFolder->id(), error))
        return false;

    auto jobTemplate = named<QCJobTemplate>(random, QStringLiteral("Effect colour release"));
    jobTemplate->setToleranceSets({labSet, de2000Set});
    if (!store(objectStore, {jobTemplate}, jobsFolder->id(), error))
        return false;

    const Paint paints[] = {
        {QStringLiteral("Silver Metallic"), 0.16, 0.02, 480, 80, 0.02, 600, 0.9, 6.5},
        {QStringLiteral("Blue Metallic"), 0.04, 0.30, 455, 45, 0.03, 680, 0.75, 5.0},
        {QStringLiteral("Red Solid"), 0.04, 0.02, 450, 40, 0.62, 600, 0.0, 0.0},
    };
    int standardIndex = 0;
    for (const Paint &paint : paints) {
        auto standard = named<Standard>(random, paint.name);
        standard->setAppearanceValues(measure(random, paint, Deviation()));
        standard->setToleranceSets(paint.flop > 0 ? std::vector<std::shared_ptr<ToleranceSet>>{labSet, de2000Set}
                                                  : std::vector<std::shared_ptr<ToleranceSet>>{cmcSet, de94Set});
        auto trialFolder = named<Folder>(random, paint.name + QStringLiteral(" Trials"));
        if (!store(objectStore, {standard}, standardsFolder->id(), error)
            || !store(objectStore, {trialFolder}, standardsFolder->id(), error))
            return false;

        // Each trial departs from the standard in a random direction (lightness, hue, chroma), scaled so
        // that its worst normalised difference against the standard's first tolerance set hits a target:
        // half of the trials pass, a quarter warn, a quarter fail.
        const ToleranceSet &primary = *standard->toleranceSets().front();
        std::vector<std::shared_ptr<BaseObject>> trials;
        std::vector<std::shared_ptr<Trial>> jobTrials;
        for (int i = 0; i < TrialsPerStandard; ++i) {
            const int kind = i % 4; // 0, 1 pass; 2 warning; 3 fail
            const double target = kind < 2 ? 0.15 + 0.6 * random.uniform()
                                 : kind == 2 ? 0.83 + 0.15 * random.uniform()
                                             : 1.1 + 1.4 * random.uniform();
            const double dl = random.normal(), dh = random.normal(), dc = random.normal();
            const double norm = std::max(1e-9, std::sqrt(dl * dl + dh * dh + dc * dc));
            const double sparkle = paint.flop > 0 ? 0.4 * random.normal() : 0.0;
            auto deviationAt = [&](double scale) {
                Deviation d;
                d.lightness = 1.0 + 0.03 * scale * dl / norm;
                d.hueShiftNm = 3.0 * scale * dh / norm;
                d.chroma = 1.0 + 0.06 * scale * dc / norm;
                d.sparkle = sparkle * std::min(1.0, scale);
                // Better aligned flakes sparkle more and travel further in lightness.
                d.flop = 1.0 + FlopPerSparkle * sparkle * scale;
                return d;
            };
            // Bisection on the scale; n grows with it over this range.
            double lo = 0.0, hi = 12.0;
            for (int step = 0; step < 40; ++step) {
                const double mid = 0.5 * (lo + hi);
                Random scratch(1u);
                const auto probe = measure(scratch, paint, deviationAt(mid));
                if (worstDifference(primary, *probe, *standard->appearanceValues()) < target)
                    lo = mid;
                else
                    hi = mid;
            }
            auto trial = named<Trial>(random, QStringLiteral("%1 T%2").arg(paint.name).arg(i + 1, 2, 10, QLatin1Char('0')));
            trial->setAppearanceValues(measure(random, paint, deviationAt(0.5 * (lo + hi))));
            trial->setStandard(standard);
            trial->setTimeStamp(Timestamp(2026, 3, 2 + i / 8, 7 + i % 8, (i * 7) % 60, (i * 13) % 60));
            trials.push_back(trial);
            jobTrials.push_back(trial);
        }
        if (!store(objectStore, trials, trialFolder->id(), error))
            return false;

        auto job = named<QCJob>(random, QStringLiteral("Release %1").arg(paint.name));
        job->setQcJobTemplate(jobTemplate);
        job->setQcJobTemplateName(jobTemplate->name());
        job->setStandard(standard);
        job->setTrials(jobTrials);
        if (!store(objectStore, {job}, jobsFolder->id(), error))
            return false;
        ++standardIndex;
    }

    // Colorants and formulas.
    struct ColorantSpec
    {
        const char *name;
        const char *type;
        double density;
        int r, g, b;
    };
    const ColorantSpec specs[] = {
        {"Clear Binder", ColorantType::Clear, 1.02, 240, 240, 240},
        {"Fine Aluminium", ColorantType::Metallic, 1.45, 190, 190, 195},
        {"Coarse Aluminium", ColorantType::Metallic, 1.50, 170, 172, 178},
        {"Phthalo Blue", ColorantType::Pigment, 1.12, 20, 40, 140},
        {"Perylene Red", ColorantType::Pigment, 1.18, 170, 20, 30},
        {"Carbon Black", ColorantType::Pigment, 1.10, 20, 20, 20},
        {"Titanium White", ColorantType::Pigment, 1.90, 250, 250, 250},
    };
    std::vector<std::shared_ptr<Colorant>> colorants;
    std::vector<std::shared_ptr<BaseObject>> colorantObjects;
    for (const ColorantSpec &spec : specs) {
        auto colorant = named<Colorant>(random, QString::fromLatin1(spec.name));
        colorant->setType(QString::fromLatin1(spec.type));
        colorant->setDensity(spec.density);
        RGBValue rgb;
        rgb.setR(spec.r);
        rgb.setG(spec.g);
        rgb.setB(spec.b);
        colorant->setDisplayRGB(rgb);
        colorant->setIsResource(true);
        colorants.push_back(colorant);
        colorantObjects.push_back(colorant);
    }
    if (!store(objectStore, colorantObjects, colorantsFolder->id(), error))
        return false;

    const auto formula = [&](const QString &name, const std::vector<std::pair<int, double>> &parts) {
        auto f = named<Formula>(random, name);
        std::vector<std::shared_ptr<Ingredient>> ingredients;
        double total = 0;
        for (const auto &[index, amount] : parts) {
            auto ingredient = make<Ingredient>(random);
            ingredient->setColorant(colorants[size_t(index)]);
            ingredient->setConcentration(amount);
            ingredients.push_back(ingredient);
            total += amount;
        }
        f->setIngredients(ingredients);
        f->setTotalQuantity(total);
        f->setTotalQuantityUnit(QStringLiteral("Gram"));
        return f;
    };
    auto silver = formula(QStringLiteral("Silver Metallic"), {{0, 62.0}, {1, 24.0}, {2, 12.5}, {5, 1.5}});
    auto blue = formula(QStringLiteral("Blue Metallic"), {{0, 60.0}, {1, 14.0}, {3, 22.0}, {5, 4.0}});
    auto red = formula(QStringLiteral("Red Solid"), {{0, 55.0}, {4, 38.0}, {6, 5.0}, {5, 2.0}});
    if (!store(objectStore, {silver, blue, red}, formulasFolder->id(), error))
        return false;

    const auto restriction = [&](ColorantRestrictionType type, int colorant, int anchor, double value) {
        auto r = make<ColorantRestriction>(random);
        r->setRestrictionType(type);
        r->setColorant(colorants[size_t(colorant)]);
        if (anchor >= 0)
            r->setAnchorColorant(colorants[size_t(anchor)]);
        r->setValue(value);
        return r;
    };
    std::vector<std::shared_ptr<BaseObject>> recipes;
    const std::pair<std::shared_ptr<Formula>, std::vector<std::shared_ptr<ColorantRestriction>>> recipeSpecs[] = {
        {silver, {restriction(ColorantRestrictionType::Loading, 0, -1, 62.0),
                  restriction(ColorantRestrictionType::Ratio, 2, 1, 0.5)}},
        {blue, {restriction(ColorantRestrictionType::Loading, 0, -1, 60.0),
                restriction(ColorantRestrictionType::Constant, 5, -1, 4.0)}},
        {red, {restriction(ColorantRestrictionType::Ratio, 6, 4, 0.13)}},
    };
    std::vector<std::shared_ptr<RecipeTrial>> firstSteps;
    for (const auto &[f, restrictions] : recipeSpecs) {
        auto recipe = named<RecipeTrial>(random, f->name() + QStringLiteral(" Recipe"));
        recipe->setFormulas({f});
        auto settings = make<FormulationSettings>(random);
        settings->setColorantRestrictions(restrictions);
        recipe->setFormulationSettings(settings);
        recipe->setRecipeType(QStringLiteral("Correction"));
        recipes.push_back(recipe);
        firstSteps.push_back(recipe);
    }
    if (!store(objectStore, recipes, formulasFolder->id(), error))
        return false;

    // One correction of each recipe after its first trial was judged: the colourist's next
    // formula, referring back to the first trial, under the same restrictions.
    const std::vector<std::pair<int, double>> corrections[] = {
        {{0, 61.0}, {1, 25.5}, {2, 12.5}, {5, 1.0}},
        {{0, 59.0}, {1, 14.0}, {3, 23.5}, {5, 3.5}},
        {{0, 54.0}, {4, 39.5}, {6, 5.0}, {5, 1.5}},
    };
    std::vector<std::shared_ptr<BaseObject>> correctionSteps;
    for (size_t i = 0; i < firstSteps.size(); ++i) {
        const auto &first = firstSteps[i];
        const QString name = first->formula()->name();
        auto corrected = formula(name + QStringLiteral(" Correction 1"), corrections[i]);
        auto step = named<RecipeTrial>(random, name + QStringLiteral(" Correction 1"));
        step->setFormulas({corrected});
        auto settings = make<FormulationSettings>(random);
        std::vector<std::shared_ptr<ColorantRestriction>> restrictions;
        for (const auto &r : first->formulationSettings()->colorantRestrictions()) {
            auto copy = make<ColorantRestriction>(random);
            copy->setRestrictionType(r->restrictionType());
            copy->setColorant(r->colorant());
            copy->setAnchorColorant(r->anchorColorant());
            copy->setValue(r->value());
            restrictions.push_back(copy);
        }
        settings->setColorantRestrictions(restrictions);
        step->setFormulationSettings(settings);
        step->setPreviousRecipeTrial(first);
        step->setRecipeType(QStringLiteral("Correction"));
        correctionSteps.push_back(step);
    }
    return store(objectStore, correctionSteps, formulasFolder->id(), error);
}

} // namespace vexa
