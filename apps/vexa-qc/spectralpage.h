#pragma once

#include <QWidget>

#include <memory>

class QAction;
class QComboBox;
class QModelIndex;
class QTableView;

namespace vexa {

class AppearanceViewDataModel;
class MetamerismView;
class SpectralPlotWidget;
class SpectralValueTableModel;
class TrialSelectionModel;

// The spectra of a comparison: the curves of the standard and the active trials at the
// selected geometry (or of the selected trial at every geometry), the spectral values with
// their differences to the standard, and the selected trial's metamerism under other
// light. All three follow the page's models; a click on a trial's column selects it.
class SpectralPage : public QWidget
{
    Q_OBJECT
public:
    explicit SpectralPage(QWidget *parent = nullptr);
    ~SpectralPage() override;

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel);
    void setDeltaEFormula(const QString &formula);
    void settingsChanged();

    SpectralPlotWidget *plot() const { return m_plot; }
    SpectralValueTableModel *tableModel() const { return m_tableModel; }
    QTableView *tableView() const { return m_table; }
    MetamerismView *metamerism() const { return m_metamerism; }
    QComboBox *scopeBox() const { return m_scopeBox; }
    QAction *copyTableAction() const { return m_copyTable; }

    // The whole table as tab-separated text, as shown.
    QString tableText() const;

private:
    void onScopeChosen();
    void onCellClicked(const QModelIndex &index);
    void copyTable();
    void fitColumns();

    std::shared_ptr<TrialSelectionModel> m_selectionModel;
    QComboBox *m_scopeBox;                // Child.
    SpectralPlotWidget *m_plot;           // Child.
    SpectralValueTableModel *m_tableModel; // Child.
    QTableView *m_table;                  // Child.
    MetamerismView *m_metamerism;         // Child.
    QAction *m_copyTable;                 // Child.
};

} // namespace vexa
