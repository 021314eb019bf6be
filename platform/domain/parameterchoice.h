#pragma once

#include <domain/reflectable.h>

#include <QVariant>

namespace vexa {

// One possible value of a choice parameter: the value and the text shown for it.
class VEXA_DOMAIN_EXPORT ParameterChoice : public Reflectable
{
    VEXA_REFLECTABLE(ParameterChoice)
public:
    ParameterChoice() = default;
    ParameterChoice(const QVariant &value, const QString &displayText) : m_value(value), m_displayText(displayText) {}

    QVariant value() const { return m_value; }
    void setValue(const QVariant &value) { m_value = value; }
    QString displayText() const { return m_displayText; }
    void setDisplayText(const QString &text) { m_displayText = text; }

private:
    QVariant m_value;
    QString m_displayText;
};

} // namespace vexa
