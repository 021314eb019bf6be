#include "colorimetriccondition.h"

#include "illuminant.h"
#include "observer.h"

#include <QHashFunctions>

namespace vexa {

ColorimetricCondition::ColorimetricCondition()
    : m_illuminant(QStringLiteral("D65")), m_observer(QStringLiteral("10"))
{
}

ColorimetricCondition::ColorimetricCondition(const QString &illuminant, const QString &observer)
    : m_illuminant(illuminant), m_observer(observer)
{
}

bool ColorimetricCondition::isValid() const
{
    bool a = false;
    bool b = false;
    Illuminant::fromValue(m_illuminant, &a);
    Observer::fromString(m_observer, &b);
    return a && b;
}

QString ColorimetricCondition::toString() const
{
    return m_illuminant + QLatin1Char('/') + m_observer;
}

ColorimetricCondition ColorimetricCondition::fromString(const QString &text, bool *ok)
{
    const QStringList parts = text.split(QLatin1Char('/'));
    bool good = parts.size() == 2;
    Illuminant::Type illuminant = Illuminant::Unknown;
    Observer::Type observer = Observer::Unknown;
    if (good) {
        bool a = false;
        bool b = false;
        illuminant = Illuminant::fromValue(parts.at(0), &a);
        observer = Observer::fromString(parts.at(1), &b);
        good = a && b;
    }
    if (ok)
        *ok = good;
    if (!good)
        return ColorimetricCondition();
    return ColorimetricCondition(Illuminant::toString(illuminant), Observer::toString(observer));
}

QVector<ColorimetricCondition> ColorimetricCondition::availableConditions()
{
    QVector<ColorimetricCondition> out;
    for (const QString &illuminant : Illuminant::names()) {
        for (const QString &observer : Observer::names())
            out.append(ColorimetricCondition(illuminant, observer));
    }
    return out;
}

bool ColorimetricCondition::operator==(const ColorimetricCondition &o) const
{
    return m_illuminant == o.m_illuminant && m_observer == o.m_observer;
}

bool ColorimetricCondition::operator<(const ColorimetricCondition &o) const
{
    return m_illuminant != o.m_illuminant ? m_illuminant < o.m_illuminant : m_observer < o.m_observer;
}

uint qHash(const ColorimetricCondition &condition, uint seed)
{
    return qHash(condition.toString(), seed);
}

} // namespace vexa
