#include "intsetting.h"

#include <algorithm>
#include <cmath>

IntSetting::IntSetting(const QString &key, int defaultValue, const QString &labelText,
                       const QString &descriptionText)
    : BaseSetting(key, QVariant(defaultValue), labelText, descriptionText)
{
}

int IntSetting::value() const
{
    return variantValue().toInt();
}

int IntSetting::defaultValue() const
{
    return defaultVariantValue().toInt();
}

bool IntSetting::setValue(int value)
{
    return setVariantValue(QVariant(value));
}

void IntSetting::setRange(int minimum, int maximum)
{
    if (minimum > maximum)
        std::swap(minimum, maximum);
    m_minimum = minimum;
    m_maximum = maximum;
    setStoredDefault(QVariant(std::clamp(defaultValue(), minimum, maximum)));
    storeValue(QVariant(std::clamp(value(), minimum, maximum)));
}

std::shared_ptr<BaseSetting> IntSetting::clone() const
{
    auto copy = std::make_shared<IntSetting>(key(), defaultValue(), labelText(), descriptionText());
    copy->m_minimum = m_minimum;
    copy->m_maximum = m_maximum;
    copyBaseInto(*copy);
    return copy;
}

bool IntSetting::normalize(QVariant &value) const
{
    double number = 0.0;
    switch (value.userType()) {
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::LongLong:
    case QMetaType::ULongLong:
    case QMetaType::Double: // numbers read from JSON arrive as doubles
        number = value.toDouble();
        break;
    default:
        return false;
    }
    if (!std::isfinite(number) || number != std::floor(number) || number < m_minimum || number > m_maximum)
        return false;
    value = QVariant(static_cast<int>(number));
    return true;
}
