#include <vexa/widgets/verdictcolors.h>

#include <QBrush>

#include <algorithm>
#include <cmath>

namespace vexa {

namespace {

double linear(double channel)
{
    return channel <= 0.04045 ? channel / 12.92 : std::pow((channel + 0.055) / 1.055, 2.4);
}

} // namespace

const QColor &VerdictColors::passColor()
{
    static const QColor color(QStringLiteral("#00914d"));
    return color;
}

const QColor &VerdictColors::warningColor()
{
    static const QColor color(QStringLiteral("#F2E000"));
    return color;
}

const QColor &VerdictColors::failColor()
{
    static const QColor color(QStringLiteral("#FF3D35"));
    return color;
}

QColor VerdictColors::colorOfStatus(int status)
{
    switch (status) {
    case 1: return passColor();
    case 2: return warningColor();
    case 3: return failColor();
    default: return QColor();
    }
}

QColor VerdictColors::colorOfBackground(const QVariant &background)
{
    switch (background.userType()) {
    case QMetaType::QColor:
        return background.value<QColor>();
    case QMetaType::QBrush: {
        const QBrush brush = background.value<QBrush>();
        return brush.style() == Qt::NoBrush ? QColor() : brush.color();
    }
    case QMetaType::QString:
        return QColor(background.toString().trimmed());
    default:
        return QColor();
    }
}

int VerdictColors::statusOfBackground(const QVariant &background)
{
    const QColor color = colorOfBackground(background);
    if (!color.isValid())
        return 0;
    for (int status = 1; status <= 3; ++status) {
        if (colorOfStatus(status).rgb() == color.rgb())
            return status;
    }
    return 0;
}

QString VerdictColors::word(int status)
{
    switch (status) {
    case 1: return tr("PASS");
    case 2: return tr("WARNING");
    case 3: return tr("FAIL");
    default: return QString();
    }
}

double VerdictColors::relativeLuminance(const QColor &color)
{
    const QColor rgb = color.toRgb();
    return 0.2126 * linear(rgb.redF()) + 0.7152 * linear(rgb.greenF()) + 0.0722 * linear(rgb.blueF());
}

double VerdictColors::contrastRatio(const QColor &first, const QColor &second)
{
    const double a = relativeLuminance(first);
    const double b = relativeLuminance(second);
    return (std::max(a, b) + 0.05) / (std::min(a, b) + 0.05);
}

QColor VerdictColors::readableTextColor(const QColor &background)
{
    const QColor black(Qt::black);
    const QColor white(Qt::white);
    return contrastRatio(background, black) >= contrastRatio(background, white) ? black : white;
}

} // namespace vexa
