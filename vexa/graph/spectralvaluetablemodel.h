#pragma once

#include <vexa/vexa_export.h>
#include <vexa/graph/spectralselection.h>
#include <vexa/models/appearanceviewbase.h>

#include <QAbstractTableModel>

#include <memory>
#include <vector>

namespace vexa {

// The spectral values of a spectral page as a table: one row per wavelength (every
// wavelength of any shown spectrum, ascending), a first column with the wavelength in nm,
// then per measurement its reflectance factor and, for trials, the difference to the
// standard at the same wavelength and geometry ("ΔR …", trial − standard). Cells without
// a value (no spectrum, a grid that misses the wavelength, a value that is not a number)
// are empty. The selected trial's columns are bold on a light background.
//
// Follows the page's models: the columns are rebuilt when the standard, the trials, the
// active trials, the geometry or the scope change; a change of the selected trial among
// the shown ones only moves the highlight.
//
// Besides the display roles every cell offers its raw value under ExportValueRole (a
// double, or nothing) and the spreadsheet number format under ExportNumberFormatRole.
class VEXA_EXPORT SpectralValueTableModel : public QAbstractTableModel, public AppearanceViewBase
{
    Q_OBJECT
public:
    static constexpr int ExportValueRole = Qt::UserRole + 20;
    static constexpr int ExportNumberFormatRole = Qt::UserRole + 21;

    // What a column shows.
    enum class ColumnKind {
        Wavelength,
        Reflectance,
        Difference,
    };

    explicit SpectralValueTableModel(QObject *parent = nullptr);
    ~SpectralValueTableModel() override;

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel) override;
    void settingsChanged() override;

    void setScope(SpectralScope scope);
    SpectralScope scope() const { return m_scope; }
    // Decimals of the reflectance factors and differences (4 by default; clamped to 0..8).
    void setDecimals(int decimals);
    int decimals() const { return m_decimals; }

    ColumnKind columnKind(int column) const;
    // The entry behind a column; null for the wavelength column and out of range.
    const SpectralEntry *entryAt(int column) const;
    // The first column of a trial (its reflectance); -1 when it is not shown.
    int columnOf(const std::shared_ptr<Trial> &trial) const;
    // The wavelength of a row; NaN out of range.
    double wavelengthAt(int row) const;

    // Rebuilds rows and columns from the models.
    void refreshAll();

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;

protected:
    void refreshStandard() override { refreshAll(); }
    void refreshQCJob() override { refreshAll(); }
    void refreshActiveTrials() override { refreshAll(); }
    void refreshTrials() override { refreshAll(); }
    void onActiveGeometriesChanged() override { refreshAll(); }
    void onGeometrySelected() override { refreshAll(); }
    void onTrialSelected() override;

private:
    struct Column
    {
        ColumnKind kind = ColumnKind::Wavelength;
        int entry = -1;
        std::vector<double> values; // One per row; NaN where there is none.
    };

    void rebuild();
    bool isHighlighted(int column) const;
    QVariant value(const QModelIndex &index) const;

    SpectralScope m_scope = SpectralScope::SelectedGeometry;
    int m_decimals = 4;
    std::vector<SpectralEntry> m_entries;
    std::vector<double> m_wavelengths;
    std::vector<Column> m_columns;
};

} // namespace vexa
