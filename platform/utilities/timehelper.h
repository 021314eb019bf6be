#pragma once

#include <utilities/timestamp.h>
#include <utilities/utilities_export.h>

#include <QDateTime>

namespace vexa {

class VEXA_UTILITIES_EXPORT TimeHelper
{
public:
    // The timestamp as a UTC QDateTime; an invalid QDateTime for a null or invalid timestamp.
    static QDateTime convert(const Timestamp &timestamp);
    // The QDateTime, taken to UTC, as a timestamp (milliseconds dropped).
    static Timestamp convert(const QDateTime &dateTime);
    // Now, in UTC.
    static Timestamp timestamp();
};

} // namespace vexa
