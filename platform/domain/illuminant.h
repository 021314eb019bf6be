#pragma once

#include <domain/domain_export.h>

#include <QString>
#include <QStringList>

namespace vexa {

// The CIE illuminants colour values are computed under.
class VEXA_DOMAIN_EXPORT Illuminant
{
public:
    enum Type { A, C, D50, D55, D65, D75, F2, F7, F11, F12, Unknown };

    // The illuminant named by value ("D65", case ignored); Unknown and *ok false otherwise.
    static Type fromValue(const QString &value, bool *ok = nullptr);
    // "D65" ...; empty for Unknown.
    static QString toString(Type type);
    // Every known illuminant, in enumeration order.
    static QVector<Type> all();
    static QStringList names();
};

} // namespace vexa
