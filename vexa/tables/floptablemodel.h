#pragma once

#include <vexa/vexa_export.h>

#include <domain/colorimetriccondition.h>

#include <QAbstractTableModel>
#include <QMetaObject>
#include <QStringList>

#include <memory>
#include <unordered_map>
#include <vector>

class GeneralSettings;

namespace vexa {

class AppearanceValues;
class AppearanceViewDataModel;
class NamedObject;
class Standard;
class Tolerance;
class Trial;
class TrialSelectionModel;

// The flop table: the standard (row 0) and the trials of the data model (row r is trial
// r − 1), or with the selected-trial flag the standard and the selected trial alone, with
// their flop index (the lightness travel of an effect colour across 45as15, 45as45 and
// 45as110) and each trial's flop difference from the standard, on the verdict colour of the
// flop tolerance. No standard, no rows.
//
// Columns: "Name", "ΔFlop-index", "Flop-index". Only DisplayRole (the name; the numbers as
// plain doubles, empty where they cannot be computed), TextAlignmentRole and BackgroundRole
// (pass "#00914d", warning "#F2E000", fail "#FF3D35" on the flop difference of trial rows)
// are answered.
//
// The flop index is computed under the illuminant of the general settings' colorimetric
// condition with the 10° observer, once per measurement: values are cached until the
// standard, the trials or the condition change. The flop tolerance is the first tolerance of
// type "Flop Index(+/-)" of the current tolerance set; when that set holds none, the first
// of the other sets in force (standard's, else job template's, else the defaults), so that
// choosing the per-angle set of the colour table does not hide the sample-wide flop verdict.
//
// Selecting a trial changes nothing unless the flag is set; then only row 1 changes.
class VEXA_EXPORT FlopTableModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    enum Column {
        NameColumn,
        FlopDifferenceColumn,
        FlopColumn,
    };

    explicit FlopTableModel(std::shared_ptr<GeneralSettings> generalSettings, QObject *parent = nullptr);
    ~FlopTableModel() override;

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel);
    std::shared_ptr<AppearanceViewDataModel> appearanceViewDataModel() const { return m_dataModel; }
    std::shared_ptr<TrialSelectionModel> trialSelectionModel() const { return m_selectionModel; }

    // With the flag set the rows hold the standard and the selected trial alone.
    void setSelectedTrialOnly(bool selectedTrialOnly);
    bool selectedTrialOnly() const { return m_selectedTrialOnly; }

    // The general settings' illuminant with the 10° observer.
    ColorimetricCondition flopCondition() const { return m_condition; }
    // The flop tolerance in force; null when there is none.
    std::shared_ptr<Tolerance> flopTolerance() const { return m_flopTolerance; }
    static std::shared_ptr<Tolerance> flopToleranceOf(const AppearanceViewDataModel &dataModel);

    // The flop index of a measurement; false when one of the three geometries is missing
    // or the index is undefined.
    bool didGetFlop(const std::shared_ptr<AppearanceValues> &values, double &flop) const;
    // The trial's flop index minus the standard's; false unless both exist.
    bool didGetdFlop(const std::shared_ptr<Trial> &trial, double &dFlop) const;

    // The standard or trial of a row; null out of range.
    std::shared_ptr<NamedObject> objectAt(int row) const;
    std::shared_ptr<Trial> trialAt(int row) const;
    // The row of a trial; -1 when it is not listed.
    int rowOf(const std::shared_ptr<Trial> &trial) const;

    // Forgets every computed value and rebuilds the rows.
    void refresh();

    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    int columnCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role = Qt::DisplayRole) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role = Qt::DisplayRole) const override;

private:
    struct Cached
    {
        std::shared_ptr<AppearanceValues> values; // kept alive so that the key stays unique
        double flop;
        bool valid;
    };
    struct Verdict
    {
        std::shared_ptr<AppearanceValues> values;
        int status;
    };

    void connectModels();
    void disconnectModels();
    void rebuildRows();
    void onSelectedTrialChanged();
    void onToleranceChanged();
    void onConditionChanged();
    ColorimetricCondition conditionFromSettings() const;
    QVariant verdictColor(int row) const;
    const Cached &flopOf(const std::shared_ptr<AppearanceValues> &values) const;

    std::shared_ptr<GeneralSettings> m_generalSettings;
    std::shared_ptr<AppearanceViewDataModel> m_dataModel;
    std::shared_ptr<TrialSelectionModel> m_selectionModel;
    bool m_selectedTrialOnly = false;
    QStringList m_headers;

    // Built by rebuildRows(): the standard and the trials in row order.
    std::shared_ptr<Standard> m_standard;
    std::vector<std::shared_ptr<Trial>> m_trials;
    mutable std::unordered_map<const Trial *, int> m_rowOfTrial; // filled on first use
    ColorimetricCondition m_condition;
    std::shared_ptr<Tolerance> m_flopTolerance;

    mutable std::unordered_map<const AppearanceValues *, Cached> m_flops;
    mutable std::unordered_map<const AppearanceValues *, Verdict> m_verdicts;

    std::vector<QMetaObject::Connection> m_connections;
    QMetaObject::Connection m_settingsConnection;
};

} // namespace vexa
