#pragma once

#include <QWidget>

#include <memory>
#include <vector>

class QComboBox;
class QLabel;
class QListWidget;
class QListWidgetItem;
class QSplitter;
class QTabWidget;
class GeneralSettings;

namespace vexa {

class AppearanceViewDataModel;
class ColorPlotWidget;
class FlopTableWidget;
class JobDetailViewSettings;
class MultiColorValueTableModel;
class MultiColorValueWidget;
class QCJob;
class SpectralPage;
class ToleranceSelector;
class Trial;
class TrialSelectionModel;
struct LoadedJob;

// One comparison page: the trials of a job with check boxes (the active trials), the
// geometry filter, the colorimetric condition and the ΔE formula on the left; on the
// right the views in tabs: "Colour" (the colour table with the flop table beside it and
// the colour plots) and "Spectra" (the spectral page). Every view shares the page's one
// data model and one selection model.
class ComparisonPage : public QWidget
{
    Q_OBJECT
public:
    ComparisonPage(std::shared_ptr<GeneralSettings> generalSettings,
                   std::shared_ptr<JobDetailViewSettings> viewSettings, QWidget *parent = nullptr);
    ~ComparisonPage() override;

    void showJob(const LoadedJob &job);

    std::shared_ptr<AppearanceViewDataModel> dataModel() const { return m_dataModel; }
    std::shared_ptr<TrialSelectionModel> selectionModel() const { return m_selectionModel; }
    MultiColorValueWidget *tableWidget() const { return m_table; }
    FlopTableWidget *flopWidget() const { return m_flop; }
    ColorPlotWidget *plotWidget() const { return m_plot; }
    SpectralPage *spectralPage() const { return m_spectral; }
    QTabWidget *viewTabs() const { return m_tabs; }
    // Brings the tab of the views to the front: "colour" or "spectra". False for another name.
    bool showViews(const QString &name);
    QListWidget *trialList() const { return m_trialList; }
    QListWidget *geometryList() const { return m_geometryList; }
    // Says why the tolerance set in force gives no verdicts; hidden when it can judge.
    QLabel *toleranceWarning() const { return m_toleranceWarning; }

    // The view settings changed (settings dialog): every view re-reads them.
    void settingsChanged();

private:
    QWidget *buildControls();
    void fillTrialList();
    void fillGeometryList();
    void onTrialItemChanged(QListWidgetItem *item);
    void onTrialCurrentChanged();
    void onGeometryItemChanged();
    void onConditionChosen();
    void onFormulaChosen();
    void followSelection();
    void updateVerdictIcons();

    std::shared_ptr<GeneralSettings> m_generalSettings;
    std::shared_ptr<JobDetailViewSettings> m_viewSettings;
    std::shared_ptr<AppearanceViewDataModel> m_dataModel;
    std::shared_ptr<TrialSelectionModel> m_selectionModel;
    std::shared_ptr<MultiColorValueTableModel> m_tableModel;

    QLabel *m_title = nullptr;
    QListWidget *m_trialList = nullptr;
    QListWidget *m_geometryList = nullptr;
    QComboBox *m_conditionBox = nullptr;
    QComboBox *m_formulaBox = nullptr;
    ToleranceSelector *m_toleranceSelector = nullptr;
    QLabel *m_toleranceWarning = nullptr;
    MultiColorValueWidget *m_table = nullptr;
    FlopTableWidget *m_flop = nullptr;
    ColorPlotWidget *m_plot = nullptr;
    SpectralPage *m_spectral = nullptr;
    QTabWidget *m_tabs = nullptr;
    std::vector<std::shared_ptr<Trial>> m_trials;
    bool m_updating = false;
};

} // namespace vexa
