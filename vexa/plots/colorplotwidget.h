#pragma once

#include <vexa/vexa_export.h>

#include <vexa/models/appearanceviewbase.h>

#include <QImage>
#include <QWidget>

#include <functional>

class QAction;
class QMenu;
class QPrinter;

namespace vexa {

class PlotWidget;

// An a*b* plot and an L* plot side by side (stretch 4 : 1), sharing the page's models, with a
// context menu that prints a snapshot of both.
//
// Printing goes through a replaceable function (setSnapshotPrinter) that receives the
// snapshot; the default one offers the print dialog, or a PDF file when no printer is
// installed. Tests and hosts that must not open dialogs install their own.
class VEXA_EXPORT ColorPlotWidget : public QWidget, public AppearanceViewBase
{
    Q_OBJECT
public:
    using SnapshotPrinter = std::function<void(const QImage &snapshot, QWidget *parent)>;

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

    void setSnapshotPrinter(SnapshotPrinter printer);
    // Both plots as one image, drawn without their interactive decorations.
    QImage snapshot();

    // Paints the image onto the printer's page, scaled to fit and centred. False when the
    // printer cannot be painted on.
    static bool printImage(const QImage &image, QPrinter &printer);
    // The print dialog when a printer exists, else a file dialog for a PDF file.
    static void printWithDialog(const QImage &snapshot, QWidget *parent);

public Q_SLOTS:
    void refreshAll();
    void print();
    void onContextMenuRequested(const QPoint &position);

private:
    PlotWidget *m_abPlot = nullptr; // Owned (child).
    PlotWidget *m_lPlot = nullptr;  // Owned (child).
    QMenu *m_contextMenu = nullptr; // Owned (child).
    QAction *m_printAction = nullptr;
    SnapshotPrinter m_snapshotPrinter;
};

} // namespace vexa
