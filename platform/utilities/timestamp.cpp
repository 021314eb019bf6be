#include "timestamp.h"

#include <QDate>
#include <QRegularExpression>
#include <QTime>

#include <tuple>

namespace vexa {

Timestamp::Timestamp(int year, int month, int day, int hour, int minute, int second)
    : m_year(year), m_month(month), m_day(day), m_hour(hour), m_minute(minute), m_second(second)
{
}

bool Timestamp::isValid() const
{
    return QDate::isValid(m_year, m_month, m_day) && QTime::isValid(m_hour, m_minute, m_second);
}

QString Timestamp::toString() const
{
    if (isNull())
        return QString();
    return QStringLiteral("%1-%2-%3T%4:%5:%6Z")
        .arg(m_year, 4, 10, QLatin1Char('0'))
        .arg(m_month, 2, 10, QLatin1Char('0'))
        .arg(m_day, 2, 10, QLatin1Char('0'))
        .arg(m_hour, 2, 10, QLatin1Char('0'))
        .arg(m_minute, 2, 10, QLatin1Char('0'))
        .arg(m_second, 2, 10, QLatin1Char('0'));
}

Timestamp Timestamp::fromString(const QString &text, bool *ok)
{
    static const QRegularExpression re(
        QStringLiteral("^(\\d{4})-(\\d{2})-(\\d{2})T(\\d{2}):(\\d{2}):(\\d{2})Z$"));
    const auto m = re.match(text);
    Timestamp t;
    bool good = false;
    if (m.hasMatch()) {
        t = Timestamp(m.captured(1).toInt(), m.captured(2).toInt(), m.captured(3).toInt(),
                      m.captured(4).toInt(), m.captured(5).toInt(), m.captured(6).toInt());
        good = t.isValid();
        if (!good)
            t = Timestamp();
    }
    if (ok)
        *ok = good || text.isEmpty();
    return t;
}

bool Timestamp::operator==(const Timestamp &o) const
{
    return std::tie(m_year, m_month, m_day, m_hour, m_minute, m_second)
        == std::tie(o.m_year, o.m_month, o.m_day, o.m_hour, o.m_minute, o.m_second);
}

bool Timestamp::operator<(const Timestamp &o) const
{
    return std::tie(m_year, m_month, m_day, m_hour, m_minute, m_second)
        < std::tie(o.m_year, o.m_month, o.m_day, o.m_hour, o.m_minute, o.m_second);
}

} // namespace vexa
