#pragma once

#include <settings/basesetting.h>

// A number within a range, shown with a number of decimals, edited with a spin box.
class VEXA_SETTINGS_EXPORT DoubleSetting : public BaseSetting
{
    Q_OBJECT
public:
    DoubleSetting(const QString &key, double defaultValue, const QString &labelText,
                  const QString &descriptionText = QString());

    double value() const;
    double defaultValue() const;
    // Returns false and changes nothing for NaN, infinities and values outside the range.
    bool setValue(double value);

    int precision() const { return m_precision; }
    void setPrecision(int decimals);
    double minimum() const { return m_minimum; }
    double maximum() const { return m_maximum; }
    // The current value is clamped into the new range.
    void setRange(double minimum, double maximum);
    double singleStep() const { return m_singleStep; }
    void setSingleStep(double step) { m_singleStep = step; }

    std::shared_ptr<BaseSetting> clone() const override;

protected:
    bool normalize(QVariant &value) const override;

private:
    int m_precision = 2;
    double m_minimum = -1e9;
    double m_maximum = 1e9;
    double m_singleStep = 1.0;
};
