#pragma once

#include <domain/colorimetriccondition.h>
#include <domain/colorvalues.h>

#include <QVector>

namespace vexa {

// A CIE L*a*b* value under a colorimetric condition. A default-constructed value is
// empty: its coordinates are NaN until set.
class VEXA_DOMAIN_EXPORT LabValue : public ColorValues
{
    VEXA_REFLECTABLE(LabValue)
public:
    LabValue();
    LabValue(double l, double a, double b, const ColorimetricCondition &condition = ColorimetricCondition());

    double l() const { return m_l; }
    double a() const { return m_a; }
    double b() const { return m_b; }
    void setL(double l) { m_l = l; }
    void setA(double a) { m_a = a; }
    void setB(double b) { m_b = b; }
    ColorimetricCondition colorimetricCondition() const { return m_condition; }
    void setColorimetricCondition(const ColorimetricCondition &condition) { m_condition = condition; }

    // {l, a, b}.
    QVector<double> values() const { return {m_l, m_a, m_b}; }
    // No coordinate set (all NaN).
    bool isEmpty() const;
    // Every coordinate a finite number.
    bool isValid() const;

    QString toString() const override;

private:
    double m_l;
    double m_a;
    double m_b;
    ColorimetricCondition m_condition;
};

} // namespace vexa
