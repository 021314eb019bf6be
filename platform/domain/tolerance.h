#pragma once

#include <domain/baseobject.h>
#include <domain/colorimetriccondition.h>
#include <domain/geometry.h>
#include <domain/tolerancejudgement.h>
#include <domain/toleranceparameter.h>
#include <domain/tolerancesetparameters.h>
#include <domain/tolerancevalue.h>

namespace vexa {

class AppearanceValues;

// The limits of one tolerance type at one geometry, and its pass and check
// (warning) thresholds: a normalized difference up to checkThreshold passes, up to
// passThreshold warns, above fails. The judging itself is done by the rule
// registered for toleranceType() (ToleranceRuleRegistry).
class VEXA_DOMAIN_EXPORT Tolerance : public BaseObject
{
    VEXA_REFLECTABLE(Tolerance)
public:
    QString toleranceType() const { return m_toleranceType; }
    void setToleranceType(const QString &type) { m_toleranceType = type; }
    QString toleranceGroup() const { return m_toleranceGroup; }
    void setToleranceGroup(const QString &group) { m_toleranceGroup = group; }

    QString geometry() const { return m_geometry; }
    void setGeometry(const QString &geometry) { m_geometry = geometry; }
    void setGeometry(const Geometry &geometry) { m_geometry = geometry.toString(); }
    Geometry geometryValue() const { return Geometry::toGeometry(m_geometry, static_cast<bool *>(nullptr)); }

    double passThreshold() const { return m_passThreshold; }
    void setPassThreshold(double threshold) { m_passThreshold = threshold; }
    double checkThreshold() const { return m_checkThreshold; }
    void setCheckThreshold(double threshold) { m_checkThreshold = threshold; }

    const std::vector<std::shared_ptr<ToleranceParameter>> &toleranceParameters() const { return m_parameters; }
    void setToleranceParameters(const std::vector<std::shared_ptr<ToleranceParameter>> &parameters) { m_parameters = parameters; }
    const std::vector<std::shared_ptr<ToleranceValue>> &toleranceValues() const { return m_values; }
    void setToleranceValues(const std::vector<std::shared_ptr<ToleranceValue>> &values) { m_values = values; }
    // The set-wide parameters in force for this tolerance.
    std::shared_ptr<ToleranceSetParameters> toleranceSetParameters() const { return m_setParameters; }
    void setToleranceSetParameters(const std::shared_ptr<ToleranceSetParameters> &parameters) { m_setParameters = parameters; }

    // Lookups by name; null when absent.
    std::shared_ptr<ToleranceValue> toleranceValue(const QString &name) const;
    std::shared_ptr<ToleranceParameter> toleranceParameter(const QString &name) const;

    // "CIEDE2000 at 45as15" (the type alone without a geometry): names the tolerance in messages.
    QString describe() const;
    // Why this tolerance cannot judge (unknown type, a limit or threshold out of range), in
    // words for the user; empty when it can. See ToleranceRule::validate.
    QString validationError() const;

    // Judges the trial's values against the standard's at this tolerance's geometry.
    // Status 0 when no rule is registered for the type or the rule cannot judge; with a
    // tolerance that cannot judge at all, the judgement's error says why.
    ToleranceJudgement judge(const AppearanceValues &trial, const AppearanceValues &standard,
                             const ColorimetricCondition &condition) const;
    // The status alone: 0 no verdict, 1 pass, 2 warning, 3 fail.
    int status(const AppearanceValues &trial, const AppearanceValues &standard,
               const ColorimetricCondition &condition) const;
    // The status of a normalized difference under this tolerance's thresholds
    // (<= checkThreshold: 1; <= passThreshold: 2; else, NaN and infinity included, 3). For rules.
    int statusOfNormalizedDifference(double normalizedDifference) const;

private:
    void setGeometryText(const QString &geometry) { m_geometry = geometry; }

    QString m_toleranceType;
    QString m_toleranceGroup;
    QString m_geometry;
    double m_passThreshold = 1.0;
    double m_checkThreshold = 0.8;
    std::vector<std::shared_ptr<ToleranceParameter>> m_parameters;
    std::vector<std::shared_ptr<ToleranceValue>> m_values;
    std::shared_ptr<ToleranceSetParameters> m_setParameters;
};

} // namespace vexa
