#pragma once

#include <vexa/vexa_export.h>

#include <QColor>
#include <QCoreApplication>
#include <QString>
#include <QVariant>

namespace vexa {

// The verdict colours every view, export and printout shares: pass "#00914d", warning
// "#F2E000", fail "#FF3D35". A verdict is recognised by its colour, whatever spelling or
// wrapper carries it ("#FF3D35", "#ff3d35", a QColor, a QBrush).
class VEXA_EXPORT VerdictColors
{
    Q_DECLARE_TR_FUNCTIONS(vexa::VerdictColors)
public:
    static const QColor &passColor();
    static const QColor &warningColor();
    static const QColor &failColor();

    // The colour of a status (1 pass, 2 warning, 3 fail); an invalid colour for any other.
    static QColor colorOfStatus(int status);
    // The status whose colour a background value holds (a QColor, a QBrush with a pattern or
    // a colour text), compared as colours; 0 for anything else.
    static int statusOfBackground(const QVariant &background);
    // The colour a background value holds, or an invalid colour.
    static QColor colorOfBackground(const QVariant &background);
    // "PASS", "WARNING", "FAIL" (translated); empty for other statuses.
    static QString word(int status);

    // Black or white, whichever contrasts more with the background (WCAG relative luminance):
    // black on all three verdict colours (white reaches only 4.1:1 on pass and 3.5:1 on fail).
    static QColor readableTextColor(const QColor &background);
    // The WCAG contrast ratio of two colours, 1 to 21.
    static double contrastRatio(const QColor &first, const QColor &second);
    // The WCAG relative luminance of an sRGB colour, 0 (black) to 1 (white).
    static double relativeLuminance(const QColor &color);
};

} // namespace vexa
