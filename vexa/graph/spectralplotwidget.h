#pragma once

#include <vexa/vexa_export.h>
#include <vexa/graph/graphdata.h>
#include <vexa/graph/spectralselection.h>
#include <vexa/models/appearanceviewbase.h>

#include <QStringList>
#include <QWidget>

#include <memory>
#include <vector>

class QLabel;

namespace vexa {

class SpectralView;
class Trial;

// The curve area of a spectral page with its title, following the page's models.
//
// At the selected geometry the first legend entry holds the active trials (thin, pale),
// then come the standard (black) and the selected trial (blue), drawn in that order and
// wider so that the two compared curves lie on top. The layer of active trials is drawn
// once and kept while only the selected trial changes. At all
// geometries each geometry is one legend entry in its own colour: the selected trial's
// curve solid, the standard's pale. Missing spectra are named in the view's note.
class VEXA_EXPORT SpectralPlotWidget : public QWidget, public AppearanceViewBase
{
    Q_OBJECT
public:
    explicit SpectralPlotWidget(QWidget *parent = nullptr);
    ~SpectralPlotWidget() override;

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel) override;
    void settingsChanged() override;

    void setScope(SpectralScope scope);
    SpectralScope scope() const { return m_scope; }

    SpectralView *view() const { return m_view; }
    QLabel *titleLabel() const { return m_title; }

    // The colour of the n-th geometry at all geometries.
    static QColor geometryColor(int n);

public Q_SLOTS:
    void refreshAll();

protected:
    void refreshStandard() override { refreshAll(); }
    void refreshQCJob() override { refreshAll(); }
    void refreshActiveTrials() override { refreshAll(); }
    void refreshTrials() override { refreshAll(); }
    // Keeps the layer of active trials when they and the geometry are the same.
    void onTrialSelected() override { refresh(); }
    void onActiveGeometriesChanged() override { refreshAll(); }
    void onGeometrySelected() override { refresh(); }
    void changeEvent(QEvent *event) override;

private:
    void refresh();
    void fillSelectedGeometry();
    void fillAllGeometries(const std::vector<SpectralEntry> &entries);

    SpectralScope m_scope = SpectralScope::SelectedGeometry;
    // The layer of active trials, what it was built for, and the active trials without a
    // spectrum there.
    bool m_layerValid = false;
    std::shared_ptr<GraphData> m_activeLayer;
    std::vector<std::shared_ptr<Trial>> m_layerTrials;
    Geometry m_layerGeometry;
    QStringList m_layerMissing;
    QLabel *m_title;      // Child.
    SpectralView *m_view; // Child.
};

} // namespace vexa
