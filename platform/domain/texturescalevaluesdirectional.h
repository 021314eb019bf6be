#pragma once

#include <domain/texturescalevalues.h>

#include <QtNumeric>

namespace vexa {

class VEXA_DOMAIN_EXPORT TextureScaleValuesDirectional : public TextureScaleValues
{
    VEXA_REFLECTABLE(TextureScaleValuesDirectional)
public:
    double sparkleGrade() const { return m_sparkleGrade; }
    void setSparkleGrade(double grade) { m_sparkleGrade = grade; }
    double sparkleColorVariation() const { return m_sparkleColorVariation; }
    void setSparkleColorVariation(double variation) { m_sparkleColorVariation = variation; }
    double sparkleIntensity() const { return m_sparkleIntensity; }
    void setSparkleIntensity(double intensity) { m_sparkleIntensity = intensity; }
    double sparkleArea() const { return m_sparkleArea; }
    void setSparkleArea(double area) { m_sparkleArea = area; }

private:
    double m_sparkleGrade = qQNaN();
    double m_sparkleColorVariation = qQNaN();
    double m_sparkleIntensity = qQNaN();
    double m_sparkleArea = qQNaN();
};

} // namespace vexa
