#include <vexa/tables/columndefinition.h>

#include <vexa/widgets/verdictcolors.h>

#include <vexa/tables/appearanceviewtablemodelrow.h>
#include <vexa/tables/multicolorvaluetablemodel.h>

#include <domain/appearancevalues.h>
#include <domain/labchvalue.h>
#include <domain/namedobject.h>
#include <domain/tolerance.h>
#include <domain/toleranceset.h>
#include <utilities/timehelper.h>

#include <QColor>

#include <cmath>

namespace vexa {

namespace {

QVariant finiteOrEmpty(double value)
{
    return std::isfinite(value) ? QVariant(value) : QVariant();
}

constexpr int kLeftAligned = Qt::AlignLeft | Qt::AlignVCenter;

} // namespace

ColumnDefinition::~ColumnDefinition() = default;

QVariant ColumnDefinition::color(const AppearanceViewTableModelRow &) const
{
    return QVariant();
}

int ColumnDefinition::alignment() const
{
    return Qt::AlignCenter;
}

// Name -------------------------------------------------------------------------------

QString ColumnDefinitionName::headerText() const
{
    return tr("Name");
}

QVariant ColumnDefinitionName::value(const AppearanceViewTableModelRow &row) const
{
    return QVariant(QString::fromStdString(row.displayName()));
}

int ColumnDefinitionName::alignment() const
{
    return kLeftAligned;
}

// Geometry ---------------------------------------------------------------------------

QString ColumnDefinitionGeometry::headerText() const
{
    return tr("Geometry");
}

QVariant ColumnDefinitionGeometry::value(const AppearanceViewTableModelRow &row) const
{
    if (!row.geometry().isValid())
        return QVariant();
    return row.geometry().toString();
}

int ColumnDefinitionGeometry::alignment() const
{
    return kLeftAligned;
}

// Date/time --------------------------------------------------------------------------

QString ColumnDefinitionDateTime::headerText() const
{
    return tr("Date/Time");
}

QVariant ColumnDefinitionDateTime::value(const AppearanceViewTableModelRow &row) const
{
    Timestamp stamp;
    if (row.appearanceValues())
        stamp = row.appearanceValues()->timeStamp();
    if (stamp.isNull() && row.namedObject())
        stamp = row.namedObject()->timeStamp();
    const QDateTime dateTime = TimeHelper::convert(stamp);
    return dateTime.isValid() ? QVariant(dateTime) : QVariant();
}

int ColumnDefinitionDateTime::alignment() const
{
    return kLeftAligned;
}

// Instrument -------------------------------------------------------------------------

QString ColumnDefinitionInstrumentInfo::headerText() const
{
    return tr("Instrument");
}

QVariant ColumnDefinitionInstrumentInfo::value(const AppearanceViewTableModelRow &row) const
{
    if (!row.appearanceValues())
        return QVariant();
    const InstrumentInfo &info = row.appearanceValues()->instrumentInfo();
    QStringList parts;
    if (!info.type().isEmpty())
        parts << info.type();
    if (!info.serialNumber().isEmpty())
        parts << info.serialNumber();
    if (parts.isEmpty())
        return QVariant();
    return parts.join(QLatin1Char(' '));
}

int ColumnDefinitionInstrumentInfo::alignment() const
{
    return kLeftAligned;
}

// L*a*b*/L*C*h -----------------------------------------------------------------------

ColumnDefinitionLabCh::ColumnDefinitionLabCh(Column column, const MultiColorValueTableModel &model)
    : m_column(column)
    , m_model(&model)
{
}

QString ColumnDefinitionLabCh::coordinateLetter(Column column)
{
    switch (column) {
    case L: return QStringLiteral("L");
    case a: return QStringLiteral("a");
    case b: return QStringLiteral("b");
    case C: return QStringLiteral("C");
    case h: return QStringLiteral("h");
    }
    return QString();
}

QString ColumnDefinitionLabCh::headerText() const
{
    return tr("%1\n(%2)").arg(coordinateLetter(m_column), m_model->colorimetricCondition().toString());
}

QVariant ColumnDefinitionLabCh::value(const AppearanceViewTableModelRow &row) const
{
    const auto &lab = row.labChValue();
    if (!lab || !lab->isValid())
        return QVariant();
    switch (m_column) {
    case L: return finiteOrEmpty(lab->l());
    case a: return finiteOrEmpty(lab->a());
    case b: return finiteOrEmpty(lab->b());
    case C: return finiteOrEmpty(lab->c());
    case h: return finiteOrEmpty(lab->h());
    }
    return QVariant();
}

// Standard coordinates ---------------------------------------------------------------

ColumnDefinitionStandardLabCh::ColumnDefinitionStandardLabCh(EColorSpaceCoordinate coordinate,
                                                             const MultiColorValueTableModel &model)
    : m_coordinate(coordinate)
    , m_model(&model)
{
}

QString ColumnDefinitionStandardLabCh::headerText() const
{
    return tr("%1\n(%2)").arg(standardColorSpaceCoordinateName(m_coordinate),
                              m_model->colorimetricCondition().toString());
}

QVariant ColumnDefinitionStandardLabCh::value(const AppearanceViewTableModelRow &row) const
{
    const auto &lab = row.standardLabChValue();
    if (!lab || !lab->isValid())
        return QVariant();
    return finiteOrEmpty(colorSpaceCoordinateValue(m_coordinate, lab->lab()));
}

// Colour-difference metrics ----------------------------------------------------------

ColumnDefinitionColorDifference::ColumnDefinitionColorDifference(EColorSpaceDelta delta)
    : m_delta(delta)
{
}

QString ColumnDefinitionColorDifference::headerText() const
{
    return colorSpaceDeltaDisplayName(m_delta);
}

QVariant ColumnDefinitionColorDifference::value(const AppearanceViewTableModelRow &row) const
{
    if (row.isStandard() || !row.labChValue() || !row.standardLabChValue())
        return QVariant();
    return finiteOrEmpty(colorSpaceDeltaValue(m_delta, row.standardLabChValue()->lab(), row.labChValue()->lab()));
}

// Tolerance sets ---------------------------------------------------------------------

ColumnDefinitionToleranceSet::ColumnDefinitionToleranceSet(const std::shared_ptr<ToleranceSet> &toleranceSet)
    : m_toleranceSet(toleranceSet)
{
}

const QColor &ColumnDefinitionToleranceSet::passColor()
{
    return VerdictColors::passColor();
}

const QColor &ColumnDefinitionToleranceSet::warningColor()
{
    return VerdictColors::warningColor();
}

const QColor &ColumnDefinitionToleranceSet::failColor()
{
    return VerdictColors::failColor();
}

QVariant ColumnDefinitionToleranceSet::colorOfStatus(int status)
{
    const QColor color = VerdictColors::colorOfStatus(status);
    return color.isValid() ? QVariant(color) : QVariant();
}

QString ColumnDefinitionToleranceSet::headerText() const
{
    return m_toleranceSet ? m_toleranceSet->name() : QString();
}

QVariant ColumnDefinitionToleranceSet::value(const AppearanceViewTableModelRow &row) const
{
    if (!m_toleranceSet || row.isStandard())
        return QVariant();
    const auto tolerance = m_toleranceSet->toleranceWithGeometry(row.geometry());
    if (!tolerance)
        return QVariant();
    const ToleranceJudgement &judgement = row.judgement(*tolerance);
    if (judgement.colorDifferences.isEmpty())
        return QVariant();
    return finiteOrEmpty(judgement.colorDifferences.first());
}

QVariant ColumnDefinitionToleranceSet::color(const AppearanceViewTableModelRow &row) const
{
    if (!m_toleranceSet || row.isStandard())
        return QVariant();
    const auto tolerance = m_toleranceSet->toleranceWithGeometry(row.geometry());
    if (!tolerance)
        return QVariant();
    return colorOfStatus(row.judgement(*tolerance).status);
}

} // namespace vexa
