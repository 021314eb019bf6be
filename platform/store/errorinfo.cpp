#include <store/errorinfo.h>

namespace vexa {

ErrorInfo::ErrorInfo(const QString &message, CorvidErrorCode code, const QString &internalMessage)
    : m_message(message)
    , m_errorCode(code)
    , m_internalMessage(internalMessage)
{
}

std::shared_ptr<ErrorInfo> ErrorInfo::create(const QString &message, CorvidErrorCode code,
                                             const QString &internalMessage, const QStringList &arguments)
{
    return std::make_shared<ErrorInfo>(substituteArguments(message, arguments), code,
                                       substituteArguments(internalMessage, arguments));
}

std::shared_ptr<ErrorInfo> ErrorInfo::create(const QString &message, int code, const QString &internalMessage,
                                             const QStringList &arguments)
{
    return create(message, static_cast<CorvidErrorCode>(code), internalMessage, arguments);
}

QString ErrorInfo::toString() const
{
    return QStringLiteral("%1 (%2)").arg(m_message).arg(static_cast<int>(m_errorCode));
}

bool ErrorInfo::fail(ErrorInfo *target, CorvidErrorCode code, const QString &message,
                     const QString &internalMessage)
{
    if (target)
        *target = ErrorInfo(message, code, internalMessage);
    return false;
}

QString substituteArguments(const QString &text, const QStringList &arguments)
{
    QString result;
    result.reserve(text.size());
    for (int i = 0; i < text.size(); ++i) {
        const QChar c = text.at(i);
        if (c == QLatin1Char('%') && i + 1 < text.size() && text.at(i + 1).isDigit()) {
            int j = i + 1;
            int number = 0;
            while (j < text.size() && text.at(j).isDigit() && number < 100)
                number = number * 10 + text.at(j++).digitValue();
            if (number >= 1 && number <= arguments.size()) {
                result += arguments.at(number - 1);
                i = j - 1;
                continue;
            }
        }
        result += c;
    }
    return result;
}

} // namespace vexa
