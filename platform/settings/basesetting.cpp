#include "basesetting.h"

BaseSetting::BaseSetting(const QString &key, const QVariant &defaultValue, const QString &labelText,
                         const QString &descriptionText)
    : m_key(key)
    , m_defaultValue(defaultValue)
    , m_value(defaultValue)
    , m_labelText(labelText)
    , m_descriptionText(descriptionText)
{
}

BaseSetting::~BaseSetting() = default;

QVariant BaseSetting::variantValue() const
{
    return m_value;
}

QVariant BaseSetting::defaultVariantValue() const
{
    return m_defaultValue;
}

bool BaseSetting::setVariantValue(const QVariant &value)
{
    QVariant normalized = value;
    if (!normalize(normalized))
        return false;
    storeValue(normalized);
    return true;
}

void BaseSetting::setDefaultVariantValue(const QVariant &value)
{
    QVariant normalized = value;
    if (normalize(normalized))
        m_defaultValue = normalized;
}

bool BaseSetting::isDefault() const
{
    return variantValue() == defaultVariantValue();
}

void BaseSetting::resetToDefault()
{
    storeValue(m_defaultValue);
}

bool BaseSetting::assignValue(const BaseSetting &other)
{
    return setVariantValue(other.variantValue());
}

void BaseSetting::copyAttributesFrom(const BaseSetting &other)
{
    m_readOnly = other.m_readOnly;
    m_visible = other.m_visible;
    m_expert = other.m_expert;
}

QJsonValue BaseSetting::toJson() const
{
    return QJsonValue::fromVariant(variantValue());
}

bool BaseSetting::fromJson(const QJsonValue &json, QStringList *errors)
{
    if (json.isNull() || json.isUndefined() || !setVariantValue(json.toVariant())) {
        if (errors)
            errors->append(QStringLiteral("setting \"%1\" has a value of the wrong kind or out of range")
                               .arg(m_key));
        return false;
    }
    return true;
}

void BaseSetting::storeValue(const QVariant &value)
{
    if (m_value == value && m_value.userType() == value.userType())
        return;
    m_value = value;
    Q_EMIT sgValueChanged();
}

void BaseSetting::copyBaseInto(BaseSetting &other) const
{
    other.m_key = m_key;
    other.m_labelText = m_labelText;
    other.m_descriptionText = m_descriptionText;
    other.m_defaultValue = m_defaultValue;
    other.m_value = m_value;
    other.copyAttributesFrom(*this);
}
