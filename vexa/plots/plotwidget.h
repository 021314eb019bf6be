#pragma once

#include <vexa/vexa_export.h>

#include <vexa/models/appearanceviewbase.h>
#include <vexa/plots/workerthread.h>

#include <domain/geometry.h>
#include <domain/labvalue.h>

#include <QColor>
#include <QList>
#include <QMutex>
#include <QRect>
#include <QTransform>
#include <QVector>
#include <QWidget>

#include <memory>

class QGraphicsItem;
class QGraphicsItemGroup;
class QGraphicsPathItem;
class QGraphicsPolygonItem;
class QGraphicsRectItem;
class QGraphicsScene;

namespace vexa {

class CheckGraphicsItem;
class ColorPlotSettings;
class TextItem;
class Tolerance;
class Trial;
class TrialGraphicsItem;
class ZoomGraphicsView;

// The base of the colour plots: a graphics scene in a zooming view showing the trials of the
// page against the standard at one geometry, with axes, the tolerance region (computed on the
// plot's WorkerThread) and, for the a*b* plots, the tinted background and the hue circle.
//
// Scene coordinates are CIELAB units with y pointing down: an a*b* plot puts (a*, b*) at
// (a*, -b*) (relative plots: differences to the standard), an L* plot puts L* at -L* on a strip
// from x = -1 to 1.
//
// Z order: tinted background -5, hue circle and chroma line -3, axes -2, tolerance region -1,
// inactive trials 0, active trials 1, the selected trial 2, the standard 3, its label 10.
class VEXA_EXPORT PlotWidget : public QWidget, public AppearanceViewBase
{
    Q_OBJECT
public:
    enum class Plane { AB, L };
    enum class Reference { Absolute, Relative };

    ~PlotWidget() override;

    // Puts the view into the plot's layout, shows the scene in it (sceneRect until data
    // arrives), white background, antialiasing, an unselectable frame; the titles name the
    // horizontal and vertical axes.
    void initialize(ZoomGraphicsView *view, const QRect &sceneRect, const QString &horizontalTitle,
                    const QString &verticalTitle);

    // The persisted settings; null means the defaults ("Dynamic", no hue circle, tinted
    // background, enabled).
    void setSettings(const std::shared_ptr<ColorPlotSettings> &settings);
    std::shared_ptr<ColorPlotSettings> settings() const { return m_settings; }

    void setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                   const std::shared_ptr<TrialSelectionModel> &selectionModel) override;

    Plane plane() const { return m_plane; }
    Reference reference() const { return m_reference; }
    QGraphicsScene *scene() const { return m_scene; }
    ZoomGraphicsView *view() const { return m_view; }

    // The geometry drawn: the selected colour geometry with "Dynamic", else the fixed one.
    Geometry shownGeometry() const;
    // The standard's L*a*b* at the shown geometry; null when there is none.
    const std::shared_ptr<LabValue> &standardLab() const { return m_standardLab; }
    QList<TrialGraphicsItem *> trialItems() const { return m_trialItems; }
    TrialGraphicsItem *trialItem(const std::shared_ptr<Trial> &trial) const;
    CheckGraphicsItem *standardItem() const { return m_standardItem; }
    TextItem *standardLabel() const { return m_standardLabel; }
    QGraphicsRectItem *frameItem() const { return m_frame; }
    QGraphicsItemGroup *toleranceGroup() const { return m_toleranceGroup; }
    QGraphicsPathItem *warningBandItem() const { return m_warningBandItem; }
    QGraphicsPolygonItem *passRegionItem() const { return m_passRegionItem; }
    QGraphicsRectItem *backgroundItem() const { return m_backgroundItem; }
    QGraphicsItem *hueCircleItem() const { return m_hueCircleItem; }
    QGraphicsItem *chromaLineItem() const { return m_chromaLineItem; }
    const QList<TextItem *> &tickLabels() const { return m_tickLabels; }
    QVector<double> horizontalTicks() const { return m_horizontalTicks; }
    QVector<double> verticalTicks() const { return m_verticalTicks; }
    // Half the width of the shown range in CIELAB units (about the standard).
    double displayRange() const { return m_displayRange; }
    // The shape last applied (generation and geometry).
    const ToleranceShape &toleranceShape() const { return m_shape; }
    // The generation of the newest shape request; 0 before the first.
    quint64 shapeGeneration() const { return m_generation; }
    WorkerThread *workerThread() const { return m_worker.get(); }
    bool isPreparedForPrinting() const { return m_printing; }

    // Scene position of a colour (differences to the standard in relative plots).
    QPointF labToScene(double l, double a, double b) const;
    // Maps shapes computed in CIELAB (a*, b*) or (x, L*) to the scene.
    QTransform valueToScene() const;

    // Black on light colours (HSL lightness above 0.5), white otherwise (0.5 included).
    static QColor labelColorFor(const QColor &background);
    // "Nice" tick values (1, 2, 2.5 or 5 times a power of ten) inside [min, max], about
    // `count` of them.
    static QVector<double> tickValues(double min, double max, int count);
    static QString tickLabel(double value, double step);
    // The verdict colours of the tables, used for the markers' rings.
    static QColor verdictColor(int status);

public Q_SLOTS:
    virtual void refreshAll();
    void settingsChanged() override;
    void refreshStandard() override;
    void refreshTrials() override;
    void refreshActiveTrials() override;
    void refreshTolerance() override;
    void refreshColorimetricCondition() override;
    void refreshQCJob() override;
    void refreshQCJobTemplate() override;
    void onTrialSelected() override;
    void onGeometrySelected() override;
    void onStandardGeometrySelected() override;
    void onActiveGeometriesChanged() override;
    virtual void onSelectionChanged();
    // Snapshot printing: hide the interactive decorations (selection, scroll bars), then
    // restore them.
    virtual void prepareForPrinting();
    virtual void finishedPrinting();
    virtual void setZoom(double zoom);

Q_SIGNALS:
    // A shape answer of the newest request was applied (also when it had no region).
    void sgToleranceShapeApplied(quint64 generation);

protected:
    PlotWidget(Plane plane, Reference reference, QWidget *parent = nullptr);

    // The marker of one trial (the a*b* and L* plots draw different ones); the plot places it.
    virtual TrialGraphicsItem *createTrialItem(const std::shared_ptr<Trial> &trial, const Geometry &geometry) = 0;
    // Adds the standard's name label: a reduced point size, unaffected by zooming, z 10.
    TextItem *addStandardLabel();

private Q_SLOTS:
    void onShapeCalculated(const vexa::ToleranceShape &shape);

private:
    bool isEnabledBySettings() const;
    bool showHueCircleSetting() const;
    bool showTintedBackgroundSetting() const;
    void rebuildScene();
    void clearScene();
    void computeDisplayRange(const QVector<QPointF> &trialOffsets);
    void buildAxes();
    void buildTintedBackground();
    void buildHueCircle();
    void buildStandard();
    void buildTrials();
    // Puts the standard's label on the side of the standard where it covers the fewest trial
    // markers (up-right, up-left, down-right, down-left, in that order of preference).
    void placeStandardLabel();
    void requestToleranceShape();
    void clearToleranceItems();
    void refreshSelection();
    void updateActiveStates();
    std::shared_ptr<Tolerance> currentTolerance() const;

    const Plane m_plane;
    const Reference m_reference;
    std::shared_ptr<ColorPlotSettings> m_settings;
    QGraphicsScene *m_scene = nullptr;  // Owned (child).
    ZoomGraphicsView *m_view = nullptr; // Owned (child).
    QString m_horizontalTitle;
    QString m_verticalTitle;

    Geometry m_geometry;
    std::shared_ptr<LabValue> m_standardLab;
    QColor m_standardColor;
    double m_displayRange = 1.0;
    double m_toleranceExtent = 0.0;
    QRectF m_frameRect;

    // Scene items, owned by the scene.
    QGraphicsRectItem *m_frame = nullptr;
    QGraphicsRectItem *m_backgroundItem = nullptr;
    QGraphicsItem *m_hueCircleItem = nullptr;
    QGraphicsItem *m_chromaLineItem = nullptr;
    QList<QGraphicsItem *> m_axisItems;
    QList<TextItem *> m_tickLabels;
    QGraphicsItemGroup *m_toleranceGroup = nullptr;
    QGraphicsPathItem *m_warningBandItem = nullptr;
    QGraphicsPolygonItem *m_passRegionItem = nullptr;
    CheckGraphicsItem *m_standardItem = nullptr;
    TextItem *m_standardLabel = nullptr;
    QGraphicsItem *m_standardLine = nullptr;
    QList<TrialGraphicsItem *> m_trialItems;
    QVector<double> m_horizontalTicks;
    QVector<double> m_verticalTicks;

    QMutex m_mutex;
    std::unique_ptr<WorkerThread> m_worker;
    quint64 m_generation = 0;
    ToleranceShape m_shape;
    bool m_updatingSelection = false;
    bool m_printing = false;
    Qt::ScrollBarPolicy m_savedHorizontalPolicy = Qt::ScrollBarAsNeeded;
    Qt::ScrollBarPolicy m_savedVerticalPolicy = Qt::ScrollBarAsNeeded;
};

} // namespace vexa
