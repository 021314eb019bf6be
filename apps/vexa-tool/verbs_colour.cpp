// Verbs over the colorimetry and tolerance libraries: lab, de, judge.

#include "verbregistry.h"

#include <colorimetry/colorconverter.h>
#include <colorimetry/colordifferencecalculator.h>

#include <tolerances/tolerancefactory.h>

#include <domain/appearancevalues.h>
#include <domain/reflectancespectrum.h>
#include <domain/serialization.h>
#include <domain/standard.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <domain/trial.h>

#include <QFile>

#include <cmath>
#include <stdexcept>

using namespace vexa;

namespace {

/// Takes "--name VALUE" out of args; false with a message when the value is missing.
bool takeOption(QStringList &args, const QString &name, QString *value, QTextStream &err)
{
    const int index = args.indexOf(name);
    if (index < 0)
        return true;
    if (index + 1 >= args.size()) {
        err << name << " needs a value\n";
        return false;
    }
    *value = args.at(index + 1);
    args.removeAt(index + 1);
    args.removeAt(index);
    return true;
}

bool parseCondition(const QString &text, ColorimetricCondition *condition, QTextStream &err)
{
    bool ok = false;
    *condition = ColorimetricCondition::fromString(text, &ok);
    if (!ok) {
        err << "Unknown colorimetric condition \"" << text << "\" (e.g. D65/10; see vexa-tool conditions)\n";
        return false;
    }
    return true;
}

bool parseNumber(const QString &text, double *value, QTextStream &err)
{
    bool ok = false;
    *value = text.toDouble(&ok);
    if (!ok || !std::isfinite(*value)) {
        err << "Not a number: \"" << text << "\"\n";
        return false;
    }
    return true;
}

bool readFile(const QString &path, QByteArray *bytes, QTextStream &err)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        err << path << ": cannot open: " << file.errorString() << "\n";
        return false;
    }
    *bytes = file.readAll();
    return true;
}

std::shared_ptr<Reflectable> readStored(const QString &path, QTextStream &err)
{
    QByteArray bytes;
    if (!readFile(path, &bytes, err))
        return nullptr;
    QString error;
    auto object = Serialization::readAny(bytes, &error);
    if (!object)
        err << path << ": broken: " << error << "\n";
    return object;
}

/// The appearance values of a stored AppearanceValues, Trial or Standard (its first values).
std::shared_ptr<AppearanceValues> readAppearance(const QString &path, QTextStream &err)
{
    const auto object = readStored(path, err);
    if (!object)
        return nullptr;
    if (auto values = std::dynamic_pointer_cast<AppearanceValues>(object))
        return values;
    std::shared_ptr<AppearanceValues> values;
    if (const auto trial = std::dynamic_pointer_cast<Trial>(object))
        values = trial->appearanceValues();
    else if (const auto standard = std::dynamic_pointer_cast<Standard>(object))
        values = standard->appearanceValues();
    if (!values)
        err << path << ": holds no appearance values\n";
    return values;
}

/// A spectrum from simple text ("start interval v1 v2 ...", '#' comments) or the stored form.
bool readSpectra(const QString &path, std::vector<std::shared_ptr<ReflectanceSpectrum>> *spectra, QTextStream &err)
{
    QByteArray bytes;
    if (!readFile(path, &bytes, err))
        return false;
    if (bytes.trimmed().startsWith('{')) {
        QString error;
        const auto object = Serialization::readAny(bytes, &error);
        if (!object) {
            err << path << ": broken: " << error << "\n";
            return false;
        }
        if (auto spectrum = std::dynamic_pointer_cast<ReflectanceSpectrum>(object)) {
            spectra->push_back(spectrum);
        } else if (const auto values = std::dynamic_pointer_cast<AppearanceValues>(object)) {
            for (const auto &colorValues : values->colorValues()) {
                if (auto spectrum = std::dynamic_pointer_cast<ReflectanceSpectrum>(colorValues))
                    spectra->push_back(spectrum);
            }
        }
        if (spectra->empty()) {
            err << path << ": holds no reflectance spectrum\n";
            return false;
        }
        return true;
    }
    QStringList words;
    for (const QString &line : QString::fromUtf8(bytes).split(QLatin1Char('\n'))) {
        const QString content = line.section(QLatin1Char('#'), 0, 0);
        words << content.split(QRegExp(QStringLiteral("[\\s,;]+")), Qt::SkipEmptyParts);
    }
    if (words.size() < 3) {
        err << path << ": expected \"start interval value value ...\" with at least one value\n";
        return false;
    }
    double start = 0.0;
    double interval = 0.0;
    if (!parseNumber(words.at(0), &start, err) || !parseNumber(words.at(1), &interval, err))
        return false;
    if (interval <= 0.0) {
        err << path << ": the wavelength interval must be positive\n";
        return false;
    }
    QVector<double> values;
    for (int i = 2; i < words.size(); ++i) {
        double v = 0.0;
        if (!parseNumber(words.at(i), &v, err))
            return false;
        values.append(v);
    }
    spectra->push_back(std::make_shared<ReflectanceSpectrum>(values, start, interval));
    return true;
}

int runLab(const QStringList &arguments, QTextStream &out, QTextStream &err)
{
    QStringList args = arguments;
    QString conditionText = QStringLiteral("D65/10");
    if (!takeOption(args, QStringLiteral("--condition"), &conditionText, err))
        return 2;
    if (args.size() != 1) {
        err << "Usage: vexa-tool lab SPECTRUM_FILE [--condition D65/10]\n";
        return 2;
    }
    ColorimetricCondition condition;
    if (!parseCondition(conditionText, &condition, err))
        return 1;
    std::vector<std::shared_ptr<ReflectanceSpectrum>> spectra;
    if (!readSpectra(args.first(), &spectra, err))
        return 1;
    int failures = 0;
    for (const auto &spectrum : spectra) {
        const LabValue lab = ColorConverter::toLab(*spectrum, condition);
        const QString geometry = spectrum->physicalCondition().geometry();
        if (!lab.isValid()) {
            err << (geometry.isEmpty() ? QStringLiteral("spectrum") : geometry)
                << ": no colour (empty spectrum, a value that is not a number, or a bad wavelength grid)\n";
            ++failures;
            continue;
        }
        const LChValue lch = ColorConverter::toLCh(lab);
        if (!geometry.isEmpty())
            out << geometry << " ";
        out << condition.toString() << QStringLiteral(" L*=%1 a*=%2 b*=%3 C*=%4 h=%5\n")
                                           .arg(lab.l(), 0, 'f', 4)
                                           .arg(lab.a(), 0, 'f', 4)
                                           .arg(lab.b(), 0, 'f', 4)
                                           .arg(lch.c(), 0, 'f', 4)
                                           .arg(lch.h(), 0, 'f', 2);
    }
    return failures == 0 ? 0 : 1;
}

// The weights of a formula, given as "2:1" (CMC l:c) or "1:1:1" (kL:kC:kH); false with a
// message naming the text when it is not that many positive numbers.
bool parseFactors(const QString &option, const QString &text, int count, double *factors, QTextStream &err)
{
    const QStringList parts = text.split(QLatin1Char(':'));
    bool ok = parts.size() == count;
    for (int i = 0; ok && i < count; ++i) {
        factors[i] = parts.at(i).toDouble(&ok);
        ok = ok && std::isfinite(factors[i]) && factors[i] > 0.0;
    }
    if (!ok)
        err << option << " wants " << (count == 2 ? "two" : "three") << " positive numbers joined by ':' (got \""
            << text << "\")\n";
    return ok;
}

QString factorText(const double *factors, int count)
{
    QStringList parts;
    for (int i = 0; i < count; ++i)
        parts << QString::number(factors[i], 'g', 6);
    return parts.join(QLatin1Char(':'));
}

// CMC's l:c is 2:1 unless given (the textile and automotive convention: lightness counts half);
// the other formulas' weights are 1 unless given. The line names the factors it used.
int runDe(const QStringList &arguments, QTextStream &out, QTextStream &err)
{
    QStringList args = arguments;
    QString formula = QStringLiteral("CIE2000");
    QString lcText;
    QString weightsText;
    QString precisionText = QStringLiteral("4");
    if (!takeOption(args, QStringLiteral("--formula"), &formula, err)
        || !takeOption(args, QStringLiteral("--lc"), &lcText, err)
        || !takeOption(args, QStringLiteral("--weights"), &weightsText, err)
        || !takeOption(args, QStringLiteral("--precision"), &precisionText, err))
        return 2;
    if (args.size() != 6) {
        err << "Usage: vexa-tool de L1 a1 b1 L2 a2 b2 [--formula CIE2000] [--lc 2:1] [--weights 1:1:1] "
               "[--precision 4]\n";
        return 2;
    }
    bool precisionOk = false;
    const int precision = precisionText.toInt(&precisionOk);
    if (!precisionOk || precision < 0 || precision > 15) {
        err << "--precision wants a number of decimals from 0 to 15 (got \"" << precisionText << "\")\n";
        return 2;
    }
    if (!ColorDifferenceCalculator::isKnownFormula(formula)) {
        err << "Unknown formula \"" << formula << "\" (known: "
            << ColorDifferenceCalculator::formulaNames().join(QStringLiteral(", ")) << ")\n";
        return 2;
    }
    const QString kind = formula.trimmed().toUpper();
    const bool cmc = kind == QLatin1String("CMC");
    const bool din = kind.startsWith(QLatin1String("DIN99"));
    const bool cielab = !cmc && !din && kind != QLatin1String("CIE94") && !kind.contains(QLatin1String("2000"));
    if (!lcText.isEmpty() && !cmc) {
        err << "--lc sets CMC's l:c; " << formula << " takes --weights\n";
        return 2;
    }
    if (!weightsText.isEmpty() && (cmc || cielab)) {
        err << "--weights sets kL:kC:kH (CIE94, CIE2000) or kE:kCH (DIN99, DIN99o); "
            << (cmc ? QStringLiteral("CMC takes --lc") : formula + QStringLiteral(" has none")) << "\n";
        return 2;
    }
    double factors[3] = {1.0, 1.0, 1.0};
    int factorCount = 3;
    QString factorNames = QStringLiteral("kL:kC:kH");
    if (cmc) {
        factors[0] = 2.0;
        factorCount = 2;
        factorNames = QStringLiteral("l:c");
        if (!lcText.isEmpty() && !parseFactors(QStringLiteral("--lc"), lcText, 2, factors, err))
            return 2;
    } else if (din) {
        factorCount = 2;
        factorNames = QStringLiteral("kE:kCH");
    } else if (cielab) {
        factorCount = 0;
    }
    if (!weightsText.isEmpty() && !parseFactors(QStringLiteral("--weights"), weightsText, factorCount, factors, err))
        return 2;

    double v[6];
    for (int i = 0; i < 6; ++i) {
        if (!parseNumber(args.at(i), &v[i], err))
            return 1;
    }
    const LabValue standard(v[0], v[1], v[2]);
    const LabValue trial(v[3], v[4], v[5]);
    const double dE = ColorDifferenceCalculator::Default_DE(formula, standard, trial, factors[0], factors[1], factors[2]);
    out << formula;
    if (factorCount > 0)
        out << " " << factorNames << "=" << factorText(factors, factorCount);
    out << QStringLiteral(" dE=%1 dL*=%2 dC*=%3 dH*=%4\n")
               .arg(dE, 0, 'f', precision)
               .arg(ColorDifferenceCalculator::Delta_L(standard, trial), 0, 'f', precision)
               .arg(ColorDifferenceCalculator::Delta_C(standard, trial), 0, 'f', precision)
               .arg(ColorDifferenceCalculator::Delta_H(standard, trial), 0, 'f', precision);
    return 0;
}

int runJudge(const QStringList &arguments, QTextStream &out, QTextStream &err)
{
    QStringList args = arguments;
    QString conditionText = QStringLiteral("D65/10");
    if (!takeOption(args, QStringLiteral("--condition"), &conditionText, err))
        return 2;
    if (args.size() != 3) {
        err << "Usage: vexa-tool judge STANDARD TRIAL TOLERANCESET [--condition D65/10]\n";
        return 2;
    }
    ColorimetricCondition condition;
    if (!parseCondition(conditionText, &condition, err))
        return 1;
    const auto standard = readAppearance(args.at(0), err);
    const auto trial = readAppearance(args.at(1), err);
    const auto setObject = readStored(args.at(2), err);
    if (!standard || !trial || !setObject)
        return 1;
    const auto set = std::dynamic_pointer_cast<ToleranceSet>(setObject);
    if (!set) {
        err << args.at(2) << ": not a tolerance set\n";
        return 1;
    }
    ToleranceFactory::toleranceFactory(); // registers the judging rules
    static const char *const verdicts[] = {"no verdict", "PASS", "WARNING", "FAIL"};
    int worst = 0;
    bool refused = false;
    for (const auto &tolerance : set->tolerances()) {
        const ToleranceJudgement j = tolerance->judge(*trial, *standard, condition);
        out << (tolerance->geometry().isEmpty() ? QStringLiteral("(sample)") : tolerance->geometry()) << " "
            << tolerance->toleranceType() << ": " << verdicts[std::clamp(j.status, 0, 3)];
        if (!j.error.isEmpty()) {
            out << "\n";
            err << j.error << "\n";
            refused = true;
            continue;
        }
        for (int i = 0; i < j.colorDifferences.size() && i < j.differenceNames.size(); ++i)
            out << " " << j.differenceNames.at(i) << "=" << QString::number(j.colorDifferences.at(i), 'f', 3);
        out << "\n";
        worst = std::max(worst, j.status);
    }
    out << "overall: " << verdicts[worst] << "\n";
    if (refused)
        return 2; // A tolerance that cannot judge: no verdict for the set.
    return worst == 3 ? 1 : 0;
}

const VerbRegistrar registrar{
    {QStringLiteral("lab"), QStringLiteral("SPECTRUM_FILE [--condition D65/10]"),
     QStringLiteral("L*a*b* of a spectrum (text \"start interval v1 v2 ...\" or a stored spectrum)"), &runLab},
    {QStringLiteral("de"), QStringLiteral("L1 a1 b1 L2 a2 b2 [--formula CIE2000] [--lc 2:1] [--weights 1:1:1] [--precision 4]"),
     QStringLiteral("Colour difference, standard first; CMC's l:c is 2:1 unless --lc says otherwise, other weights 1"),
     &runDe},
    {QStringLiteral("judge"), QStringLiteral("STANDARD TRIAL TOLERANCESET [--condition D65/10]"),
     QStringLiteral("Judge a trial against a standard with a tolerance set, per geometry"), &runJudge},
};

} // namespace
