#pragma once

#include <domain/domain_export.h>

#include <QMetaType>
#include <QString>
#include <QVector>

namespace vexa {

// Illuminant and observer of a colour computation, kept as their names ("D65", "10").
// The default is D65/10.
class VEXA_DOMAIN_EXPORT ColorimetricCondition
{
public:
    ColorimetricCondition();
    ColorimetricCondition(const QString &illuminant, const QString &observer);

    QString illuminant() const { return m_illuminant; }
    QString observer() const { return m_observer; }
    void setIlluminant(const QString &illuminant) { m_illuminant = illuminant; }
    void setObserver(const QString &observer) { m_observer = observer; }

    // Both names known (Illuminant::fromValue, Observer::fromString).
    bool isValid() const;

    // The short form "D65/10".
    QString toString() const;
    // Parses "D65/10" (also "D65/10°", "d65 / 2"); the default condition and *ok false on bad text.
    static ColorimetricCondition fromString(const QString &text, bool *ok = nullptr);

    // Every known illuminant under each observer: A/2, A/10, C/2, ... F12/10.
    static QVector<ColorimetricCondition> availableConditions();

    bool operator==(const ColorimetricCondition &o) const;
    bool operator!=(const ColorimetricCondition &o) const { return !(*this == o); }
    bool operator<(const ColorimetricCondition &o) const;

private:
    QString m_illuminant;
    QString m_observer;
};

VEXA_DOMAIN_EXPORT uint qHash(const ColorimetricCondition &condition, uint seed = 0);

} // namespace vexa

Q_DECLARE_METATYPE(vexa::ColorimetricCondition)
