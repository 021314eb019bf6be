#pragma once

#include <utilities/utilities_export.h>

#include <QString>

namespace vexa {

class VEXA_UTILITIES_EXPORT ApplicationInfo
{
public:
    static ApplicationInfo &instance();

    // The library version, "major.minor.patch".
    QString version() const;
    QString name() const;
    QString organization() const;

private:
    ApplicationInfo() = default;
};

} // namespace vexa
