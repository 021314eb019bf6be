#pragma once

#include <settings/basesetting.h>

#include <limits>

// A whole number within a range, edited with a spin box.
class VEXA_SETTINGS_EXPORT IntSetting : public BaseSetting
{
    Q_OBJECT
public:
    IntSetting(const QString &key, int defaultValue, const QString &labelText,
               const QString &descriptionText = QString());

    int value() const;
    int defaultValue() const;
    // Returns false and changes nothing when the value lies outside the range.
    bool setValue(int value);

    int minimum() const { return m_minimum; }
    int maximum() const { return m_maximum; }
    // The current value is clamped into the new range.
    void setRange(int minimum, int maximum);

    std::shared_ptr<BaseSetting> clone() const override;

protected:
    bool normalize(QVariant &value) const override;

private:
    int m_minimum = std::numeric_limits<int>::min();
    int m_maximum = std::numeric_limits<int>::max();
};
