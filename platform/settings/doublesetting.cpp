#include "doublesetting.h"

#include <algorithm>
#include <cmath>

DoubleSetting::DoubleSetting(const QString &key, double defaultValue, const QString &labelText,
                             const QString &descriptionText)
    : BaseSetting(key, QVariant(defaultValue), labelText, descriptionText)
{
}

double DoubleSetting::value() const
{
    return variantValue().toDouble();
}

double DoubleSetting::defaultValue() const
{
    return defaultVariantValue().toDouble();
}

bool DoubleSetting::setValue(double value)
{
    return setVariantValue(QVariant(value));
}

void DoubleSetting::setPrecision(int decimals)
{
    m_precision = std::clamp(decimals, 0, 15);
}

void DoubleSetting::setRange(double minimum, double maximum)
{
    if (!std::isfinite(minimum) || !std::isfinite(maximum))
        return;
    if (minimum > maximum)
        std::swap(minimum, maximum);
    m_minimum = minimum;
    m_maximum = maximum;
    setStoredDefault(QVariant(std::clamp(defaultValue(), minimum, maximum)));
    storeValue(QVariant(std::clamp(value(), minimum, maximum)));
}

std::shared_ptr<BaseSetting> DoubleSetting::clone() const
{
    auto copy = std::make_shared<DoubleSetting>(key(), defaultValue(), labelText(), descriptionText());
    copy->m_precision = m_precision;
    copy->m_minimum = m_minimum;
    copy->m_maximum = m_maximum;
    copy->m_singleStep = m_singleStep;
    copyBaseInto(*copy);
    return copy;
}

bool DoubleSetting::normalize(QVariant &value) const
{
    switch (value.userType()) {
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::LongLong:
    case QMetaType::ULongLong:
    case QMetaType::Float:
    case QMetaType::Double:
        break;
    default:
        return false;
    }
    const double number = value.toDouble();
    if (!std::isfinite(number) || number < m_minimum || number > m_maximum)
        return false;
    value = QVariant(number);
    return true;
}
