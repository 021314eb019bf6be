#include "boolsetting.h"

BoolSetting::BoolSetting(const QString &key, bool defaultValue, const QString &labelText,
                         const QString &descriptionText)
    : BaseSetting(key, QVariant(defaultValue), labelText, descriptionText)
{
}

bool BoolSetting::value() const
{
    return variantValue().toBool();
}

bool BoolSetting::defaultValue() const
{
    return defaultVariantValue().toBool();
}

void BoolSetting::setValue(bool value)
{
    storeValue(QVariant(value));
}

std::shared_ptr<BaseSetting> BoolSetting::clone() const
{
    auto copy = std::make_shared<BoolSetting>(key(), defaultValue(), labelText(), descriptionText());
    copyBaseInto(*copy);
    return copy;
}

bool BoolSetting::normalize(QVariant &value) const
{
    // Only real booleans: a text such as "yes" in a settings file is a fault,
    // not a true.
    return value.userType() == QMetaType::Bool;
}
