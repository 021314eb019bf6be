#include <tolerances/colordifferencerule.h>

#include <tolerances/boxlimit.h>
#include <tolerances/toleranceruletools.h>

#include <colorimetry/colordifferenceformulas.h>

#include <domain/tolerance.h>

#include <QStringList>
#include <QVector>

#include <algorithm>
#include <cmath>

namespace vexa {

namespace {

using Tools = ToleranceRuleTools;
using Formulas = ColorDifferenceFormulas;

double boxAxis(const Tolerance &tolerance, const QString &axis, double delta)
{
    return BoxLimit::normalized(delta, Tools::limit(tolerance, axis + QLatin1Char('-'), -1.0),
                                Tools::limit(tolerance, axis + QLatin1Char('+'), 1.0));
}

double maxOf(std::initializer_list<double> values)
{
    double result = 0.0;
    for (double v : values) {
        if (std::isnan(v))
            return v;
        result = std::max(result, v);
    }
    return result;
}

} // namespace

ColorDifferenceRule::ColorDifferenceRule(Kind kind)
    : m_kind(kind)
{
}

QString ColorDifferenceRule::validate(const Tolerance &tolerance) const
{
    const QString thresholds = ToleranceRule::validate(tolerance);
    if (!thresholds.isEmpty())
        return thresholds;
    switch (m_kind) {
    case Kind::LabBox:
    case Kind::LChBox: {
        static const char *const labAxes[] = {"dL", "da", "db"};
        static const char *const lchAxes[] = {"dL", "dC", "dH"};
        for (const char *axis : m_kind == Kind::LabBox ? labAxes : lchAxes) {
            const QString problem = Tools::checkBoxLimits(tolerance, QString::fromLatin1(axis));
            if (!problem.isEmpty())
                return problem;
        }
        return QString();
    }
    case Kind::CIE94:
        if (Tools::cie94Application(tolerance).name.isEmpty())
            return QStringLiteral("%1: the application \"%2\" is not known (\"Graphic arts\" or \"Textiles\").")
                .arg(tolerance.describe(), Tools::text(tolerance, QStringLiteral("Application"), QString()));
        return Tools::checkDifferenceLimit(tolerance, QStringLiteral("dE"));
    default:
        return Tools::checkDifferenceLimit(tolerance, QStringLiteral("dE"));
    }
}

ToleranceJudgement ColorDifferenceRule::judge(const Tolerance &tolerance, const AppearanceValues &trial,
                                              const AppearanceValues &standard,
                                              const ColorimetricCondition &condition) const
{
    ToleranceJudgement judgement;
    CieLab s;
    CieLab t;
    if (!Tools::labPair(standard, trial, tolerance.geometryValue(), condition, &s, &t))
        return judgement;

    const Formulas::Result cielab = Formulas::cie76(s, t);
    const double da = t.a - s.a;
    const double db = t.b - s.b;
    double n = 0.0;
    Formulas::Result r;
    QStringList names;
    switch (m_kind) {
    case Kind::LabBox:
        n = maxOf({boxAxis(tolerance, QStringLiteral("dL"), cielab.lightness), boxAxis(tolerance, QStringLiteral("da"), da),
                   boxAxis(tolerance, QStringLiteral("db"), db)});
        judgement.colorDifferences = {cielab.dE, cielab.lightness, da, db};
        judgement.differenceNames = QStringList{QStringLiteral("dE*ab"), QStringLiteral("dL*"), QStringLiteral("da*"),
                                     QStringLiteral("db*")};
        Tools::conclude(tolerance, n, &judgement);
        return judgement;
    case Kind::LChBox:
        n = maxOf({boxAxis(tolerance, QStringLiteral("dL"), cielab.lightness),
                   boxAxis(tolerance, QStringLiteral("dC"), cielab.chroma),
                   boxAxis(tolerance, QStringLiteral("dH"), cielab.hue)});
        judgement.colorDifferences = {cielab.dE, cielab.lightness, cielab.chroma, cielab.hue};
        judgement.differenceNames = QStringList{QStringLiteral("dE*ab"), QStringLiteral("dL*"), QStringLiteral("dC*"),
                                     QStringLiteral("dH*")};
        Tools::conclude(tolerance, n, &judgement);
        return judgement;
    case Kind::CIELab:
        judgement.colorDifferences = {cielab.dE, cielab.lightness, da, db};
        judgement.differenceNames = QStringList{QStringLiteral("dE*ab"), QStringLiteral("dL*"), QStringLiteral("da*"),
                                     QStringLiteral("db*")};
        Tools::conclude(tolerance, cielab.dE / Tools::limit(tolerance, QStringLiteral("dE"), 1.0), &judgement);
        return judgement;
    case Kind::CIE94: {
        const bool geometricMean = Tools::text(tolerance, QStringLiteral("Chroma reference"), QStringLiteral("Standard"))
                                   == QLatin1String("Geometric mean");
        // kL, K1 and K2 follow the application, whatever numbers the set carries.
        const Tools::Cie94Application application = Tools::cie94Application(tolerance);
        r = Formulas::cie94(s, t, application.kL, Tools::number(tolerance, QStringLiteral("kC"), 1.0),
                            Tools::number(tolerance, QStringLiteral("kH"), 1.0), application.K1, application.K2,
                            geometricMean ? Formulas::ChromaReference::GeometricMean
                                          : Formulas::ChromaReference::Standard);
        names = QStringList{QStringLiteral("dE94"), QStringLiteral("dL/(kL SL)"), QStringLiteral("dC/(kC SC)"),
                 QStringLiteral("dH/(kH SH)")};
        break;
    }
    case Kind::CMC:
        r = Formulas::cmc(s, t, Tools::number(tolerance, QStringLiteral("l"), 2.0),
                          Tools::number(tolerance, QStringLiteral("c"), 1.0));
        names = QStringList{QStringLiteral("dE CMC"), QStringLiteral("dL/(l SL)"), QStringLiteral("dC/(c SC)"),
                 QStringLiteral("dH/SH")};
        break;
    case Kind::CIEDE2000:
        r = Formulas::ciede2000(s, t, Tools::number(tolerance, QStringLiteral("kL"), 1.0),
                                Tools::number(tolerance, QStringLiteral("kC"), 1.0),
                                Tools::number(tolerance, QStringLiteral("kH"), 1.0));
        names = QStringList{QStringLiteral("dE00"), QStringLiteral("dL'/(kL SL)"), QStringLiteral("dC'/(kC SC)"),
                 QStringLiteral("dH'/(kH SH)")};
        break;
    case Kind::DIN99:
        r = Formulas::din99(s, t, Tools::number(tolerance, QStringLiteral("kE"), 1.0),
                            Tools::number(tolerance, QStringLiteral("kCH"), 1.0));
        names = QStringList{QStringLiteral("dE99"), QStringLiteral("dL99"), QStringLiteral("dC99"), QStringLiteral("dH99")};
        break;
    case Kind::DIN99o:
        r = Formulas::din99o(s, t, Tools::number(tolerance, QStringLiteral("kE"), 1.0),
                             Tools::number(tolerance, QStringLiteral("kCH"), 1.0));
        names = QStringList{QStringLiteral("dE99o"), QStringLiteral("dL99o"), QStringLiteral("dC99o"), QStringLiteral("dH99o")};
        break;
    }
    judgement.colorDifferences = {r.dE, r.lightness, r.chroma, r.hue};
    judgement.differenceNames = names;
    Tools::conclude(tolerance, r.dE / Tools::limit(tolerance, QStringLiteral("dE"), 1.0), &judgement);
    return judgement;
}

} // namespace vexa
