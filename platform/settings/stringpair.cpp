#include "stringpair.h"

StringPair::StringPair(const QString &value, const QString &displayText)
    : value(value)
    , displayText(displayText)
{
}

StringPair::StringPair(const QString &value)
    : value(value)
    , displayText(value)
{
}

bool StringPair::operator==(const StringPair &other) const
{
    return value == other.value && displayText == other.displayText;
}
