#pragma once

#include <settings/basesetting.h>

#include <QRegularExpression>

// A text setting. The display type chooses the editor; the display hint tunes
// it ("MinimumWidth=250;", also "MaximumWidth=…;", "MinimumHeight=…;",
// "Placeholder=…;"). With a regular expression set, only texts it matches as
// a whole are accepted.
class VEXA_SETTINGS_EXPORT StringSetting : public BaseSetting
{
    Q_OBJECT
public:
    enum class DisplayType {
        Plain,
        Password,
        MultiLine,
        DirectoryPath,
        FilePath,
    };
    Q_ENUM(DisplayType)

    StringSetting(const QString &key, const QString &defaultValue, const QString &labelText,
                  const QString &descriptionText = QString(), DisplayType displayType = DisplayType::Plain,
                  const QString &displayHint = QString());

    QString value() const;
    QString defaultValue() const;
    // Returns false and changes nothing when the text does not match the regular expression.
    bool setValue(const QString &value);

    DisplayType displayType() const { return m_displayType; }
    void setDisplayType(DisplayType type) { m_displayType = type; }
    QString displayHint() const { return m_displayHint; }
    void setDisplayHint(const QString &hint) { m_displayHint = hint; }
    // The value of one "Name=value;" entry of the display hint, empty when absent.
    QString displayHintValue(const QString &name) const;

    QRegularExpression regularExpression() const { return m_regularExpression; }
    // The expression must match the whole text. An invalid expression is ignored.
    void setRegularExpression(const QRegularExpression &expression);
    bool isAcceptable(const QString &text) const;

    std::shared_ptr<BaseSetting> clone() const override;

protected:
    bool normalize(QVariant &value) const override;

private:
    DisplayType m_displayType;
    QString m_displayHint;
    QRegularExpression m_regularExpression;
};
