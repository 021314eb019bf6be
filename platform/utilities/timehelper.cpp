#include "timehelper.h"

namespace vexa {

QDateTime TimeHelper::convert(const Timestamp &timestamp)
{
    if (timestamp.isNull() || !timestamp.isValid())
        return QDateTime();
    return QDateTime(QDate(timestamp.year(), timestamp.month(), timestamp.day()),
                     QTime(timestamp.hour(), timestamp.minute(), timestamp.second()), Qt::UTC);
}

Timestamp TimeHelper::convert(const QDateTime &dateTime)
{
    if (!dateTime.isValid())
        return Timestamp();
    const QDateTime utc = dateTime.toUTC();
    return Timestamp(utc.date().year(), utc.date().month(), utc.date().day(), utc.time().hour(),
                     utc.time().minute(), utc.time().second());
}

Timestamp TimeHelper::timestamp()
{
    return convert(QDateTime::currentDateTimeUtc());
}

} // namespace vexa
