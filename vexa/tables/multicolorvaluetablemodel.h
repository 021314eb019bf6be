#pragma once

#include <vexa/vexa_export.h>
#include <vexa/tables/appearanceviewtablemodelrow.h>
#include <vexa/tables/columndefinition.h>

#include <domain/colorimetriccondition.h>
#include <domain/geometry.h>

#include <QAbstractTableModel>
#include <QFont>
#include <QMetaObject>

#include <memory>
#include <set>
#include <vector>

class GeneralSettings;

namespace vexa {

class AppearanceViewDataModel;
class ColorCompareSettings;
class GeometryProvider;
class Standard;
class ToleranceSelector;
class Trial;
class TrialSelectionModel;

// The central colour table of a comparison page: one row per measurement and geometry
// (the standard's rows first when shown, then each shown trial's), one column per
// quantity (general columns, the trials' coordinates, the standard's coordinates,
// colour-difference metrics, one verdict column per tolerance set in force).
//
// Shown trials are the selection model's active trials, in their order; while no trial
// is active, every trial of the data model is shown. Geometries come from the geometry
// provider (by default the selection model's colour geometry filter); when it gives none,
// the geometries present in the shown measurements are listed.
//
// Rows and columns are rebuilt (a model reset) whenever the data model, the active
// trials, the geometry filter or the colour compare settings change.
//
// Besides the display roles every cell offers its raw value under ExportValueRole
// (Qt::UserRole + 20: a double, QDateTime or text) and, for numbers, the spreadsheet
// number format under ExportNumberFormatRole (Qt::UserRole + 21).
class VEXA_EXPORT MultiColorValueTableModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    static constexpr int ExportValueRole = Qt::UserRole + 20;
    static constexpr int ExportNumberFormatRole = Qt::UserRole + 21;
    // True on the standard's rows (a bool), for views that keep them on top.
    static constexpr int StandardRowRole = Qt::UserRole + 22;

    // The general columns that may precede the colour columns.
    enum class GeneralColumn {
        Name,
        Geometry,
        DateTime,
        InstrumentInfo,
    };

    MultiColorValueTableModel(std::shared_ptr<ColorCompareSettings> settings,
                              std::shared_ptr<GeneralSettings> generalSettings, QObject *parent = nullptr);
    ~MultiColorValueTableModel() override;

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel);
    std::shared_ptr<AppearanceViewDataModel> appearanceViewDataModel() const { return m_dataModel; }
    std::shared_ptr<TrialSelectionModel> trialSelectionModel() const { return m_selectionModel; }

    // Null restores the default: the selection model's colour geometry filter.
    void setGeometryProvider(const std::shared_ptr<GeometryProvider> &provider);
    std::shared_ptr<GeometryProvider> geometryProvider() const { return m_provider; }

    void setShowStandard(bool show);
    bool showStandard() const { return m_showStandard; }

    // A fixed column layout; when not empty it alone defines the columns.
    void setColumns(const std::vector<std::shared_ptr<ColumnDefinition>> &columns);
    const std::vector<std::shared_ptr<ColumnDefinition>> &columns() const { return m_explicitColumns; }

    void setGeneralColumns(const std::vector<GeneralColumn> &columns);
    const std::vector<GeneralColumn> &displayedGeneralColumns() const { return m_generalColumns; }

    // Decimals of the numbers shown (2 by default; clamped to 0..10).
    void setDecimals(int decimals);
    int decimals() const { return m_decimals; }

    std::shared_ptr<ColorCompareSettings> colorCompareSettings() const { return m_settings; }
    std::shared_ptr<GeneralSettings> generalSettings() const { return m_generalSettings; }
    ToleranceSelector *toleranceSelector() const { return m_toleranceSelector; }

    // The data model's condition; the default condition without a data model.
    ColorimetricCondition colorimetricCondition() const;

    // A new model with the same settings, models, provider, columns and options.
    std::shared_ptr<MultiColorValueTableModel> clone() const;

    // The row record behind a row; null out of range.
    std::shared_ptr<AppearanceViewTableModelRow> rowAt(int row) const;
    // The column definition behind a column; null out of range.
    std::shared_ptr<ColumnDefinition> columnAt(int column) const;
    // The row of a trial at a geometry, or of the standard at a geometry; -1 when not listed.
    int rowOf(const std::shared_ptr<Trial> &trial, const Geometry &geometry) const;
    int standardRowOf(const Geometry &geometry) const;
    // The geometries the rows are listed at, in order.
    const std::vector<Geometry> &shownGeometries() const { return m_geometries; }

    // Rebuilds rows and columns from the models and the settings.
    void refresh();

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;
    Qt::ItemFlags flags(const QModelIndex &index) const override;

    // The bold 14-pixel header font.
    static QFont headerFont();
    // The 14-pixel cell font.
    static QFont cellFont();

private:
    void connectModels();
    void disconnectModels();
    void rebuild();
    void buildColumns();
    void buildRows();
    std::set<Geometry> geometriesToShow(const std::vector<std::shared_ptr<Trial>> &trials,
                                        const std::shared_ptr<Standard> &standard) const;
    std::vector<std::shared_ptr<Trial>> shownTrials() const;
    QVariant cellValue(const QModelIndex &index) const;
    QString displayText(const QModelIndex &index, const QVariant &value) const;
    int headerMargin() const;

    std::shared_ptr<ColorCompareSettings> m_settings;
    std::shared_ptr<GeneralSettings> m_generalSettings;
    std::shared_ptr<AppearanceViewDataModel> m_dataModel;
    std::shared_ptr<TrialSelectionModel> m_selectionModel;
    std::shared_ptr<GeometryProvider> m_provider;
    bool m_customProvider = false;
    bool m_showStandard = true;
    int m_decimals = 2;
    std::vector<std::shared_ptr<ColumnDefinition>> m_explicitColumns;
    std::vector<GeneralColumn> m_generalColumns;
    ToleranceSelector *m_toleranceSelector = nullptr; // Child object.

    // Built by rebuild().
    std::vector<std::shared_ptr<ColumnDefinition>> m_builtColumns;
    std::vector<std::shared_ptr<AppearanceViewTableModelRow>> m_rows;
    std::vector<Geometry> m_geometries;

    std::vector<QMetaObject::Connection> m_modelConnections;
    QMetaObject::Connection m_settingsConnection;
};

} // namespace vexa
