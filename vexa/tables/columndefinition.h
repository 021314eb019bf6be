#pragma once

#include <vexa/vexa_export.h>
#include <vexa/models/colorspace.h>

#include <QCoreApplication>
#include <QString>
#include <QVariant>

#include <memory>

namespace vexa {

class AppearanceViewTableModelRow;
class MultiColorValueTableModel;
class ToleranceSet;

// One column of a colour table: its header and, for each row, its value, background
// colour and alignment. An invalid value is an empty cell.
class VEXA_EXPORT ColumnDefinition
{
public:
    ColumnDefinition() = default;
    ColumnDefinition(const ColumnDefinition &) = default;
    ColumnDefinition &operator=(const ColumnDefinition &) = default;
    virtual ~ColumnDefinition();

    virtual QString headerText() const = 0;
    virtual QVariant value(const AppearanceViewTableModelRow &row) const = 0;
    // A QColor, or invalid for no colour.
    virtual QVariant color(const AppearanceViewTableModelRow &row) const;
    // Qt::Alignment flags; centred by default.
    virtual int alignment() const;
};

// The row's display name.
class VEXA_EXPORT ColumnDefinitionName : public ColumnDefinition
{
    Q_DECLARE_TR_FUNCTIONS(vexa::ColumnDefinitionName)
public:
    QString headerText() const override;
    QVariant value(const AppearanceViewTableModelRow &row) const override;
    int alignment() const override;
};

// The row's geometry as text.
class VEXA_EXPORT ColumnDefinitionGeometry : public ColumnDefinition
{
    Q_DECLARE_TR_FUNCTIONS(vexa::ColumnDefinitionGeometry)
public:
    QString headerText() const override;
    QVariant value(const AppearanceViewTableModelRow &row) const override;
    int alignment() const override;
};

// When the row's measurement was taken (a QDateTime in UTC).
class VEXA_EXPORT ColumnDefinitionDateTime : public ColumnDefinition
{
    Q_DECLARE_TR_FUNCTIONS(vexa::ColumnDefinitionDateTime)
public:
    QString headerText() const override;
    QVariant value(const AppearanceViewTableModelRow &row) const override;
    int alignment() const override;
};

// The instrument that took the row's measurement: type and serial number.
class VEXA_EXPORT ColumnDefinitionInstrumentInfo : public ColumnDefinition
{
    Q_DECLARE_TR_FUNCTIONS(vexa::ColumnDefinitionInstrumentInfo)
public:
    QString headerText() const override;
    QVariant value(const AppearanceViewTableModelRow &row) const override;
    int alignment() const override;
};

// One coordinate of the row's L*a*b*/L*C*h value. The header names the coordinate
// and, on a second line, the model's colorimetric condition.
class VEXA_EXPORT ColumnDefinitionLabCh : public ColumnDefinition
{
    Q_DECLARE_TR_FUNCTIONS(vexa::ColumnDefinitionLabCh)
public:
    enum Column { L = 0, a = 1, b = 2, C = 3, h = 4 };

    // The model must outlive the definition.
    ColumnDefinitionLabCh(Column column, const MultiColorValueTableModel &model);

    Column column() const { return m_column; }
    // "L", "a", "b", "C", "h"; empty for any other value.
    static QString coordinateLetter(Column column);

    QString headerText() const override;
    QVariant value(const AppearanceViewTableModelRow &row) const override;

private:
    Column m_column;
    const MultiColorValueTableModel *m_model; // Not owned.
};

// One coordinate of the standard's value at the row's geometry ("Std_L*" ...).
class VEXA_EXPORT ColumnDefinitionStandardLabCh : public ColumnDefinition
{
    Q_DECLARE_TR_FUNCTIONS(vexa::ColumnDefinitionStandardLabCh)
public:
    // The model must outlive the definition.
    ColumnDefinitionStandardLabCh(EColorSpaceCoordinate coordinate, const MultiColorValueTableModel &model);

    QString headerText() const override;
    QVariant value(const AppearanceViewTableModelRow &row) const override;

private:
    EColorSpaceCoordinate m_coordinate;
    const MultiColorValueTableModel *m_model; // Not owned.
};

// A colour-difference metric of the row against the standard; empty on the standard's
// own rows.
class VEXA_EXPORT ColumnDefinitionColorDifference : public ColumnDefinition
{
public:
    explicit ColumnDefinitionColorDifference(EColorSpaceDelta delta);

    EColorSpaceDelta delta() const { return m_delta; }
    QString headerText() const override;
    QVariant value(const AppearanceViewTableModelRow &row) const override;

private:
    EColorSpaceDelta m_delta;
};

// The verdict of one tolerance set: the first colour difference its tolerance at the
// row's geometry computes, on the verdict colour. Empty and uncoloured where the set
// has no tolerance at that geometry, on the standard's rows and without a standard.
class VEXA_EXPORT ColumnDefinitionToleranceSet : public ColumnDefinition
{
public:
    explicit ColumnDefinitionToleranceSet(const std::shared_ptr<ToleranceSet> &toleranceSet);

    // The application-wide verdict colours: pass "#00914d", warning "#F2E000", fail "#FF3D35".
    static const QColor &passColor();
    static const QColor &warningColor();
    static const QColor &failColor();
    // The colour of a verdict status (1 pass, 2 warning, 3 fail); invalid for others.
    static QVariant colorOfStatus(int status);

    const std::shared_ptr<ToleranceSet> &toleranceSet() const { return m_toleranceSet; }
    QString headerText() const override;
    QVariant value(const AppearanceViewTableModelRow &row) const override;
    QVariant color(const AppearanceViewTableModelRow &row) const override;

private:
    std::shared_ptr<ToleranceSet> m_toleranceSet;
};

} // namespace vexa
