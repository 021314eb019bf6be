#pragma once

#include <QString>

namespace vexa {

/// The names of the tolerance types, groups, limits and parameters, as stored in tolerance sets.
namespace ToleranceTypes {

inline const QString CIELabBox = QStringLiteral("CIELab(+/-)");
inline const QString CIELChBox = QStringLiteral("CIELCh(+/-)");
inline const QString CIELabDE = QStringLiteral("CIELab dE*ab");
inline const QString CIE94 = QStringLiteral("CIE94");
inline const QString CMC = QStringLiteral("CMC(l:c)");
inline const QString CIEDE2000 = QStringLiteral("CIEDE2000");
inline const QString DIN99 = QStringLiteral("DIN99");
inline const QString DIN99o = QStringLiteral("DIN99o");
inline const QString DIN6175_2 = QStringLiteral("DIN 6175-2");
inline const QString Audi2000 = QStringLiteral("Audi2000");
inline const QString FlopIndex = QStringLiteral("Flop Index(+/-)");

inline const QString GroupCIEL = QStringLiteral("CIEL");
inline const QString GroupDIN6175_2 = QStringLiteral("DIN 6175-2");
inline const QString GroupAudi = QStringLiteral("Audi");

} // namespace ToleranceTypes

} // namespace vexa
