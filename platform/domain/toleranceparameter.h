#pragma once

#include <domain/baseobject.h>
#include <domain/parameterchoice.h>

#include <QVariant>

namespace vexa {

// A named, typed value of a tolerance or tolerance set (a weight, a formula choice ...).
class VEXA_DOMAIN_EXPORT ToleranceParameter : public BaseObject
{
    VEXA_REFLECTABLE(ToleranceParameter)
public:
    enum class ParameterType { CheckBox, Integer, Double, Text, Choice };

    ToleranceParameter() = default;
    ToleranceParameter(const QString &name, const QString &displayName, ParameterType type, const QVariant &value);

    QString name() const { return m_name; }
    void setName(const QString &name) { m_name = name; }
    QString displayName() const { return m_displayName; }
    void setDisplayName(const QString &name) { m_displayName = name; }
    ParameterType parameterType() const { return m_parameterType; }
    void setParameterType(ParameterType type) { m_parameterType = type; }
    // The values a Choice parameter can take.
    const std::vector<std::shared_ptr<ParameterChoice>> &possibleValues() const { return m_possibleValues; }
    void setPossibleValues(const std::vector<std::shared_ptr<ParameterChoice>> &values) { m_possibleValues = values; }
    bool isEditable() const { return m_isEditable; }
    void setIsEditable(bool editable) { m_isEditable = editable; }
    bool isVisible() const { return m_isVisible; }
    void setIsVisible(bool visible) { m_isVisible = visible; }

    QVariant value() const { return m_value; }
    void setValue(const QVariant &value) { m_value = value; }
    bool valueAsBool() const { return m_value.toBool(); }
    // NaN when the value is not a number.
    double valueAsDouble() const;
    int valueAsInt() const { return m_value.toInt(); }

private:
    QString m_name;
    QString m_displayName;
    ParameterType m_parameterType = ParameterType::Double;
    std::vector<std::shared_ptr<ParameterChoice>> m_possibleValues;
    bool m_isEditable = true;
    bool m_isVisible = true;
    QVariant m_value;
};

} // namespace vexa
