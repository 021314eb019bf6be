#pragma once

#include <settings/basesetting.h>

// A yes/no setting, edited with a check box.
class VEXA_SETTINGS_EXPORT BoolSetting : public BaseSetting
{
    Q_OBJECT
public:
    BoolSetting(const QString &key, bool defaultValue, const QString &labelText,
                const QString &descriptionText = QString());

    bool value() const;
    bool defaultValue() const;
    void setValue(bool value);

    std::shared_ptr<BaseSetting> clone() const override;

protected:
    bool normalize(QVariant &value) const override;
};
