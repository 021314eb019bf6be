#pragma once

#include <domain/domain_export.h>

#include <QString>
#include <QStringList>

namespace vexa {

// The CIE standard observers.
class VEXA_DOMAIN_EXPORT Observer
{
public:
    enum Type { Observer_2_Degree, Observer_10_Degree, Unknown };

    // "2" or "10" (a trailing degree sign or "deg" is accepted); Unknown and *ok false otherwise.
    static Type fromString(const QString &text, bool *ok = nullptr);
    // "2", "10"; empty for Unknown.
    static QString toString(Type type);
    static QStringList names();
};

} // namespace vexa
