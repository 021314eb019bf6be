#include "stringsetting.h"

StringSetting::StringSetting(const QString &key, const QString &defaultValue, const QString &labelText,
                             const QString &descriptionText, DisplayType displayType,
                             const QString &displayHint)
    : BaseSetting(key, QVariant(defaultValue), labelText, descriptionText)
    , m_displayType(displayType)
    , m_displayHint(displayHint)
{
}

QString StringSetting::value() const
{
    return variantValue().toString();
}

QString StringSetting::defaultValue() const
{
    return defaultVariantValue().toString();
}

bool StringSetting::setValue(const QString &value)
{
    return setVariantValue(QVariant(value));
}

QString StringSetting::displayHintValue(const QString &name) const
{
    const auto entries = m_displayHint.split(QLatin1Char(';'), Qt::SkipEmptyParts);
    for (const QString &entry : entries) {
        const int equals = entry.indexOf(QLatin1Char('='));
        if (equals > 0 && entry.left(equals).trimmed().compare(name, Qt::CaseInsensitive) == 0)
            return entry.mid(equals + 1).trimmed();
    }
    return QString();
}

void StringSetting::setRegularExpression(const QRegularExpression &expression)
{
    if (expression.isValid())
        m_regularExpression = expression;
}

bool StringSetting::isAcceptable(const QString &text) const
{
    if (m_regularExpression.pattern().isEmpty())
        return true;
    const QRegularExpression anchored(QRegularExpression::anchoredPattern(m_regularExpression.pattern()),
                                      m_regularExpression.patternOptions());
    return anchored.match(text).hasMatch();
}

std::shared_ptr<BaseSetting> StringSetting::clone() const
{
    auto copy = std::make_shared<StringSetting>(key(), defaultValue(), labelText(), descriptionText(),
                                                m_displayType, m_displayHint);
    copy->m_regularExpression = m_regularExpression;
    copyBaseInto(*copy);
    return copy;
}

bool StringSetting::normalize(QVariant &value) const
{
    if (value.userType() != QMetaType::QString)
        return false;
    // The default is always acceptable, even when it is an empty text the
    // expression would refuse: it marks "not set yet".
    const QString text = value.toString();
    return text == defaultValue() || isAcceptable(text);
}
