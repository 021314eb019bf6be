#pragma once

#include <vexa/vexa_export.h>

#include <vexa/models/appearanceviewbase.h>

#include <QImage>
#include <QWidget>

class QAction;
class QMenu;

namespace vexa {

class PlotWidget;

// An a*b* plot and an L* plot side by side (stretch 4 : 1), sharing the page's models, with a
// context menu that prints a snapshot of both. The snapshot prints like every widget of the
// library (WidgetPrinter: the dialog "Print Visual" through DialogRunner, one A4 page), so a
// host or test that runs dialogs its own way prints it too.
class VEXA_EXPORT ColorPlotWidget : public QWidget, public AppearanceViewBase
{
    Q_OBJECT
public:
    explicit ColorPlotWidget(QWidget *parent = nullptr);
    ~ColorPlotWidget() override;

    // Takes both plots (re-parented into this widget) and builds the context menu.
    void initialize(PlotWidget *abPlot, PlotWidget *lPlot);
    PlotWidget *abPlot() const { return m_abPlot; }
    PlotWidget *lPlot() const { return m_lPlot; }

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel) override;
    void settingsChanged() override;

    QMenu *contextMenu() const { return m_contextMenu; }
    QAction *printSnapshotAction() const { return m_printAction; }

    // Both plots as one image, drawn without their interactive decorations.
    QImage snapshot();

public Q_SLOTS:
    void refreshAll();
    // Prints the snapshot; true when something was printed.
    bool print();
    void onContextMenuRequested(const QPoint &position);

private:
    PlotWidget *m_abPlot = nullptr; // Owned (child).
    PlotWidget *m_lPlot = nullptr;  // Owned (child).
    QMenu *m_contextMenu = nullptr; // Owned (child).
    QAction *m_printAction = nullptr;
};

} // namespace vexa
