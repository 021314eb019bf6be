#pragma once

#include <settings/settings_export.h>

#include <QMetaType>
#include <QString>

// A choice of a list setting: the stored value and the text shown for it.
struct VEXA_SETTINGS_EXPORT StringPair
{
    StringPair() = default;
    StringPair(const QString &value, const QString &displayText);
    // The value is shown as it is.
    explicit StringPair(const QString &value);

    QString value;
    QString displayText;

    bool operator==(const StringPair &other) const;
    bool operator!=(const StringPair &other) const { return !(*this == other); }
};

Q_DECLARE_METATYPE(StringPair)
