#pragma once

#include <utilities/utilities_export.h>

#include <QString>

namespace vexa {

// A calendar time in UTC as the store keeps it: whole seconds, no time zone.
// A default-constructed timestamp is null (year 0).
class VEXA_UTILITIES_EXPORT Timestamp
{
public:
    Timestamp() = default;
    Timestamp(int year, int month, int day, int hour = 0, int minute = 0, int second = 0);

    int year() const { return m_year; }
    int month() const { return m_month; }
    int day() const { return m_day; }
    int hour() const { return m_hour; }
    int minute() const { return m_minute; }
    int second() const { return m_second; }

    bool isNull() const { return m_year == 0; }
    bool isValid() const;

    // ISO 8601, "2024-03-05T14:07:09Z"; empty for a null timestamp.
    QString toString() const;
    // Parses the form toString() writes; a null timestamp on bad text.
    static Timestamp fromString(const QString &text, bool *ok = nullptr);

    bool operator==(const Timestamp &o) const;
    bool operator!=(const Timestamp &o) const { return !(*this == o); }
    bool operator<(const Timestamp &o) const;

private:
    int m_year = 0;
    int m_month = 0;
    int m_day = 0;
    int m_hour = 0;
    int m_minute = 0;
    int m_second = 0;
};

} // namespace vexa
