#include <vexa/plots/plotwidget.h>

#include <vexa/models/appearanceviewdatamodel.h>
#include <vexa/models/trialselectionmodel.h>
#include <vexa/plots/checkgraphicsitem.h>
#include <vexa/plots/colorplotsettings.h>
#include <vexa/plots/nonantialiasedqgraphicspolygonitem.h>
#include <vexa/plots/textitem.h>
#include <vexa/plots/trialgraphicsitem.h>
#include <vexa/plots/zoomgraphicsview.h>
#include <vexa/widgets/verdictcolors.h>
#include <vexa/widgets/uihelper.h>

#include <colorimetry/colorconverter.h>
#include <domain/appearancevalues.h>
#include <domain/rgbvalue.h>
#include <domain/standard.h>
#include <domain/tolerance.h>
#include <domain/trial.h>
#include <tolerances/tolerancefactory.h>
#include <tolerances/tolerancetypes.h>

#include <QGraphicsItemGroup>
#include <QGraphicsLineItem>
#include <QGraphicsPathItem>
#include <QGraphicsPolygonItem>
#include <QGraphicsRectItem>
#include <QGraphicsScene>
#include <QHBoxLayout>
#include <QLinearGradient>
#include <QPen>
#include <QSignalBlocker>

#include <algorithm>
#include <cmath>

namespace vexa {

namespace {

constexpr double kPi = 3.14159265358979323846;
// The a*b* plane's margins around the frame, as fractions of the display range: room for the
// tick labels on the left and at the bottom.
constexpr double kMarginLeft = 0.30;
constexpr double kMarginBottom = 0.16;
constexpr double kMarginTop = 0.05;
constexpr double kMarginRight = 0.05;
// The lightness strip: the frame spans x = -1 ... 1; labels need about as much again.
constexpr double kStripMarginLeft = 1.25;
constexpr double kStripMarginRight = 0.12;
// Shapes wider than this (in CIELAB units) do not widen the shown range any further.
constexpr double kMaximumToleranceExtent = 60.0;

QPen cosmeticPen(const QColor &color, double width, Qt::PenStyle style = Qt::SolidLine)
{
    QPen pen(color, width, style);
    pen.setCosmetic(true);
    return pen;
}

// The next "nice" number at or above value: 1, 1.5, 2, 2.5, 3, 4, 5, 6, 8 times a power of ten.
double niceCeil(double value)
{
    if (!(value > 0.0) || !std::isfinite(value))
        return 1.0;
    const double magnitude = std::pow(10.0, std::floor(std::log10(value)));
    for (double m : {1.0, 1.5, 2.0, 2.5, 3.0, 4.0, 5.0, 6.0, 8.0, 10.0}) {
        if (m * magnitude >= value * (1.0 - 1e-9))
            return m * magnitude;
    }
    return 10.0 * magnitude;
}

std::shared_ptr<AppearanceValues> preparedStandardValues(const AppearanceValues &values, const LabValue &lab,
                                                         const Geometry &geometry)
{
    // The judging rules convert the standard at the tolerance's geometry for every probe;
    // holding its L*a*b* there (and no spectrum) spares that and gives the same numbers.
    auto prepared = std::make_shared<AppearanceValues>();
    std::vector<std::shared_ptr<ColorValues>> colorValues;
    auto stored = std::make_shared<LabValue>(lab);
    stored->setGeometry(geometry);
    colorValues.push_back(stored);
    for (const auto &entry : values.colorValues()) {
        if (entry && entry->geometry() != geometry)
            colorValues.push_back(entry);
    }
    prepared->setColorValues(colorValues);
    prepared->setTextureValues(values.textureValues());
    return prepared;
}

} // namespace

PlotWidget::PlotWidget(Plane plane, Reference reference, QWidget *parent)
    : QWidget(parent)
    , m_plane(plane)
    , m_reference(reference)
    , m_scene(new QGraphicsScene(this))
    , m_worker(std::make_unique<WorkerThread>())
{
    // The judging rules are registered when the factory is created.
    ToleranceFactory::toleranceFactory();
    setContextMenuPolicy(Qt::CustomContextMenu);
    connect(m_worker.get(), &WorkerThread::sgShapeCalculated, this, &PlotWidget::onShapeCalculated,
            Qt::QueuedConnection);
}

PlotWidget::~PlotWidget()
{
    // No answer may reach the plot once it is going: stop and join the worker first.
    disconnect(m_worker.get(), nullptr, this, nullptr);
    m_worker->stop();
    m_trialItems.clear();
    // The scene dies with the widget's children, after this destructor: its items'
    // selection changes must not call back into a plot that is already gone.
    if (m_scene)
        disconnect(m_scene, nullptr, this, nullptr);
}

void PlotWidget::initialize(ZoomGraphicsView *view, const QRect &sceneRect, const QString &horizontalTitle,
                            const QString &verticalTitle)
{
    if (!view || m_view)
        return;
    m_view = view;
    m_horizontalTitle = horizontalTitle;
    m_verticalTitle = verticalTitle;
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(view);
    view->setScene(m_scene);
    view->setContextMenuPolicy(Qt::NoContextMenu);
    view->setRenderHint(QPainter::Antialiasing, true);
    m_scene->setSceneRect(sceneRect);
    m_scene->setBackgroundBrush(Qt::white);
    m_frameRect = QRectF(sceneRect).adjusted(sceneRect.width() * 0.05, sceneRect.height() * 0.05,
                                             -sceneRect.width() * 0.05, -sceneRect.height() * 0.05);
    m_frame = m_scene->addRect(m_frameRect, cosmeticPen(QColor(120, 120, 120), 1));
    m_frame->setFlag(QGraphicsItem::ItemIsSelectable, false);
    m_frame->setZValue(-2);
    view->setFitRect(m_scene->sceneRect(),
                     m_plane == Plane::AB ? Qt::KeepAspectRatio : Qt::IgnoreAspectRatio);
    connect(m_scene, &QGraphicsScene::selectionChanged, this, &PlotWidget::onSelectionChanged);
    connect(view, &ZoomGraphicsView::sgTransformChanged, this, &PlotWidget::placeStandardLabel);
    if (appearanceViewDataModel())
        refreshAll();
}

TextItem *PlotWidget::addStandardLabel()
{
    if (m_standardLabel)
        return m_standardLabel;
    m_standardLabel = new TextItem;
    QFont labelFont = font();
    labelFont.setPointSizeF(std::max(6.0, labelFont.pointSizeF() * 0.85));
    m_standardLabel->setFont(labelFont);
    m_standardLabel->setAlignment(Qt::AlignLeft | Qt::AlignBottom);
    m_standardLabel->setOffset(7);
    m_standardLabel->setZValue(10);
    m_standardLabel->setVisible(false);
    // Clicks go through to the markers under the label.
    m_standardLabel->setAcceptedMouseButtons(Qt::NoButton);
    m_scene->addItem(m_standardLabel);
    return m_standardLabel;
}

void PlotWidget::setSettings(const std::shared_ptr<ColorPlotSettings> &settings)
{
    m_settings = settings;
}

void PlotWidget::setModels(const std::shared_ptr<AppearanceViewDataModel> &dataModel,
                           const std::shared_ptr<TrialSelectionModel> &selectionModel)
{
    AppearanceViewBase::setModels(dataModel, selectionModel);
    refreshAll();
}

bool PlotWidget::isEnabledBySettings() const
{
    return !m_settings || m_settings->isLabPlotEnabled();
}

bool PlotWidget::showHueCircleSetting() const
{
    return m_settings && m_settings->showHueCircle();
}

bool PlotWidget::showTintedBackgroundSetting() const
{
    return !m_settings || m_settings->showTintedBackground();
}

Geometry PlotWidget::shownGeometry() const
{
    const QString fixed = m_settings ? m_settings->geometry() : ColorPlotSettings::dynamicGeometry();
    if (fixed.isEmpty() || fixed == ColorPlotSettings::dynamicGeometry()) {
        const auto selection = trialSelectionModel();
        return selection ? selection->selectedColorGeometry() : Geometry();
    }
    return Geometry::toGeometry(fixed, static_cast<bool *>(nullptr));
}

std::shared_ptr<Tolerance> PlotWidget::currentTolerance() const
{
    const auto model = appearanceViewDataModel();
    if (!model || !m_geometry.isValid())
        return nullptr;
    return model->tolerance(m_geometry);
}

TrialGraphicsItem *PlotWidget::trialItem(const std::shared_ptr<Trial> &trial) const
{
    for (TrialGraphicsItem *item : m_trialItems) {
        if (item->trial() == trial)
            return item;
    }
    return nullptr;
}

QPointF PlotWidget::labToScene(double l, double a, double b) const
{
    const bool relative = m_reference == Reference::Relative && m_standardLab;
    if (m_plane == Plane::AB) {
        const double refA = relative ? m_standardLab->a() : 0.0;
        const double refB = relative ? m_standardLab->b() : 0.0;
        return QPointF(a - refA, -(b - refB));
    }
    const double refL = relative ? m_standardLab->l() : 0.0;
    return QPointF(0.0, -(l - refL));
}

QTransform PlotWidget::valueToScene() const
{
    const bool relative = m_reference == Reference::Relative && m_standardLab;
    if (m_plane == Plane::AB) {
        const double refA = relative ? m_standardLab->a() : 0.0;
        const double refB = relative ? m_standardLab->b() : 0.0;
        return QTransform(1, 0, 0, -1, -refA, refB);
    }
    const double refL = relative ? m_standardLab->l() : 0.0;
    return QTransform(1, 0, 0, -1, 0, refL);
}

QColor PlotWidget::labelColorFor(const QColor &background)
{
    // HSL lightness from the 8-bit channels, so that a lightness of exactly 0.5 stays exact
    // (QColor keeps it in 16 bits, where 0.5 is not representable).
    const int high = std::max({background.red(), background.green(), background.blue()});
    const int low = std::min({background.red(), background.green(), background.blue()});
    return high + low > 255 ? QColor(Qt::black) : QColor(Qt::white);
}

QColor PlotWidget::verdictColor(int status)
{
    const QColor verdict = VerdictColors::colorOfStatus(status);
    return verdict.isValid() ? verdict : QColor(130, 130, 130);
}

QVector<double> PlotWidget::tickValues(double min, double max, int count)
{
    QVector<double> ticks;
    if (!(max > min) || !std::isfinite(min) || !std::isfinite(max) || count < 1)
        return ticks;
    const double raw = (max - min) / count;
    const double magnitude = std::pow(10.0, std::floor(std::log10(raw)));
    double step = 10.0 * magnitude;
    for (double m : {1.0, 2.0, 2.5, 5.0, 10.0}) {
        if (m * magnitude >= raw * 0.999) {
            step = m * magnitude;
            break;
        }
    }
    for (double k = std::ceil(min / step - 1e-9); k * step <= max + step * 1e-9; k += 1.0)
        ticks.append(std::abs(k * step) < step * 1e-9 ? 0.0 : k * step);
    return ticks;
}

QString PlotWidget::tickLabel(double value, double step)
{
    int decimals = 0;
    if (step > 0.0 && std::isfinite(step)) {
        double s = step;
        while (decimals < 6 && std::abs(s - std::round(s)) > 1e-9 * std::max(1.0, s)) {
            s *= 10.0;
            ++decimals;
        }
    }
    QString text = QString::number(value, 'f', decimals);
    if (text.startsWith(QLatin1Char('-')) && text.toDouble() == 0.0)
        text.remove(0, 1);
    return text;
}

void PlotWidget::refreshAll()
{
    m_toleranceExtent = 0.0;
    rebuildScene();
    requestToleranceShape();
}

void PlotWidget::settingsChanged()
{
    refreshAll();
}

void PlotWidget::refreshStandard()
{
    refreshAll();
}

void PlotWidget::refreshTrials()
{
    rebuildScene();
}

void PlotWidget::refreshActiveTrials()
{
    updateActiveStates();
}

void PlotWidget::refreshTolerance()
{
    refreshAll();
}

void PlotWidget::refreshColorimetricCondition()
{
    refreshAll();
}

void PlotWidget::refreshQCJob()
{
    refreshAll();
}

void PlotWidget::refreshQCJobTemplate()
{
}

void PlotWidget::onTrialSelected()
{
    refreshSelection();
}

void PlotWidget::onGeometrySelected()
{
    // A fixed geometry ignores the selection.
    if (shownGeometry() != m_geometry)
        refreshAll();
}

void PlotWidget::onStandardGeometrySelected()
{
}

void PlotWidget::onActiveGeometriesChanged()
{
}

void PlotWidget::clearScene()
{
    auto remove = [this](QGraphicsItem *&item) {
        if (item) {
            m_scene->removeItem(item);
            delete item;
            item = nullptr;
        }
    };
    for (TrialGraphicsItem *item : qAsConst(m_trialItems)) {
        m_scene->removeItem(item);
        delete item;
    }
    m_trialItems.clear();
    for (QGraphicsItem *item : qAsConst(m_axisItems)) {
        m_scene->removeItem(item);
        delete item;
    }
    m_axisItems.clear();
    m_tickLabels.clear();
    QGraphicsItem *background = m_backgroundItem;
    remove(background);
    m_backgroundItem = nullptr;
    remove(m_hueCircleItem);
    remove(m_chromaLineItem);
    remove(m_standardLine);
    QGraphicsItem *standard = m_standardItem;
    remove(standard);
    m_standardItem = nullptr;
    if (m_standardLabel) {
        m_standardLabel->setVisible(false);
    }
}

void PlotWidget::rebuildScene()
{
    if (!m_view)
        return;
    const QSignalBlocker blocker(m_scene);
    m_updatingSelection = true;
    clearScene();
    m_geometry = shownGeometry();
    const auto model = appearanceViewDataModel();
    m_standardLab = (model && m_geometry.isValid() && isEnabledBySettings()) ? model->standardAsLabValue(m_geometry)
                                                                             : nullptr;
    if (m_standardLab && !m_standardLab->isValid())
        m_standardLab = nullptr;
    m_standardColor = m_standardLab ? UIHelper::toColor(ColorConverter::toRGB(*m_standardLab)) : QColor(Qt::white);

    // Offsets of the trials from the standard decide the range shown.
    QVector<QPointF> offsets;
    if (m_standardLab && model) {
        for (const auto &lab : model->trialsAsLabValues(m_geometry)) {
            if (!lab)
                continue;
            if (m_plane == Plane::AB)
                offsets.append(QPointF(lab->a() - m_standardLab->a(), lab->b() - m_standardLab->b()));
            else
                offsets.append(QPointF(0.0, lab->l() - m_standardLab->l()));
        }
    }
    computeDisplayRange(offsets);
    buildAxes();
    if (m_standardLab) {
        if (m_plane == Plane::AB) {
            buildTintedBackground();
            buildHueCircle();
        }
        buildStandard();
        buildTrials();
        placeStandardLabel();
    }
    if (m_toleranceGroup)
        m_toleranceGroup->setTransform(valueToScene());
    m_updatingSelection = false;
    refreshSelection();
}

void PlotWidget::computeDisplayRange(const QVector<QPointF> &trialOffsets)
{
    double extent = 0.0;
    for (const QPointF &offset : trialOffsets) {
        if (std::isfinite(offset.x()))
            extent = std::max(extent, std::abs(offset.x()));
        if (std::isfinite(offset.y()))
            extent = std::max(extent, std::abs(offset.y()));
    }
    extent = std::max(extent, std::min(m_toleranceExtent, kMaximumToleranceExtent));
    m_displayRange = niceCeil(std::max(1.0, extent * 1.15));

    const QPointF centre = m_standardLab ? labToScene(m_standardLab->l(), m_standardLab->a(), m_standardLab->b())
                                         : QPointF(0, 0);
    const double r = m_displayRange;
    QRectF sceneRect;
    if (m_plane == Plane::AB) {
        m_frameRect = QRectF(centre.x() - r, centre.y() - r, 2 * r, 2 * r);
        sceneRect = m_frameRect.adjusted(-kMarginLeft * r, -kMarginTop * r, kMarginRight * r, kMarginBottom * r);
    } else {
        m_frameRect = QRectF(-1.0, centre.y() - r, 2.0, 2 * r);
        sceneRect = m_frameRect.adjusted(-kStripMarginLeft, -kMarginTop * r, kStripMarginRight, kMarginBottom * r);
    }
    m_frame->setRect(m_frameRect);
    m_scene->setSceneRect(sceneRect);
    m_view->setFitRect(sceneRect, m_plane == Plane::AB ? Qt::KeepAspectRatio : Qt::IgnoreAspectRatio);
}

void PlotWidget::buildAxes()
{
    auto keep = [this](QGraphicsItem *item) {
        item->setZValue(-2);
        m_axisItems.append(item);
        return item;
    };
    QFont labelFont = font();
    labelFont.setPointSizeF(std::max(6.0, labelFont.pointSizeF() * 0.85));
    QFont titleFont = font();
    titleFont.setBold(true);
    const QPen gridPen = cosmeticPen(QColor(0, 0, 0, 28), 1);
    const QPen zeroPen = cosmeticPen(QColor(0, 0, 0, 90), 1, Qt::DashLine);
    const QPen tickPen = cosmeticPen(QColor(90, 90, 90), 1);
    // The axes show what the plot places: values (absolute) or differences (relative), both
    // with b* and L* growing upwards.
    const QTransform toScene(1, 0, 0, -1, 0, 0);
    const QTransform toValue = toScene.inverted();
    const QRectF frame = m_frameRect;
    const double tickLength = (m_plane == Plane::AB ? 0.03 * m_displayRange : 0.12);

    // Vertical axis: b* (a*b* plots) or L* (strips), in plotted values.
    const double vLow = toValue.map(frame.bottomLeft()).y();
    const double vHigh = toValue.map(frame.topLeft()).y();
    m_verticalTicks = tickValues(vLow, vHigh, m_plane == Plane::AB ? 5 : 6);
    const double vStep = m_verticalTicks.size() > 1 ? m_verticalTicks.at(1) - m_verticalTicks.at(0) : 1.0;
    for (double v : qAsConst(m_verticalTicks)) {
        const double y = toScene.map(QPointF(0.0, v)).y();
        keep(m_scene->addLine(QLineF(frame.left(), y, frame.right(), y), std::abs(v) < 1e-12 ? zeroPen : gridPen));
        keep(m_scene->addLine(QLineF(frame.left() - tickLength, y, frame.left(), y), tickPen));
        auto *label = new TextItem(tickLabel(v, vStep));
        label->setFont(labelFont);
        label->setTextColor(QColor(70, 70, 70));
        label->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
        label->setOffset(3);
        label->setPos(frame.left() - tickLength, y);
        m_scene->addItem(label);
        keep(label);
        m_tickLabels.append(label);
    }
    // Horizontal axis: a* (a*b* plots only).
    m_horizontalTicks.clear();
    if (m_plane == Plane::AB) {
        const double hLow = toValue.map(frame.topLeft()).x();
        const double hHigh = toValue.map(frame.topRight()).x();
        m_horizontalTicks = tickValues(hLow, hHigh, 5);
        const double hStep = m_horizontalTicks.size() > 1 ? m_horizontalTicks.at(1) - m_horizontalTicks.at(0) : 1.0;
        for (double h : qAsConst(m_horizontalTicks)) {
            const double x = toScene.map(QPointF(h, 0.0)).x();
            keep(m_scene->addLine(QLineF(x, frame.top(), x, frame.bottom()), std::abs(h) < 1e-12 ? zeroPen : gridPen));
            keep(m_scene->addLine(QLineF(x, frame.bottom(), x, frame.bottom() + tickLength), tickPen));
            auto *label = new TextItem(tickLabel(h, hStep));
            label->setFont(labelFont);
            label->setTextColor(QColor(70, 70, 70));
            label->setAlignment(Qt::AlignHCenter | Qt::AlignTop);
            label->setOffset(2);
            label->setPos(x, frame.bottom() + tickLength);
            m_scene->addItem(label);
            keep(label);
            m_tickLabels.append(label);
        }
    }
    // The axis names sit inside the frame: on the a*b* plane's tinted background they take the label colour
    // that reads on the standard's colour.
    QColor titleColor(50, 50, 50);
    if (m_plane == Plane::AB && showTintedBackgroundSetting() && m_standardLab && m_standardLab->isValid()) {
        const RGBValue rgb = ColorConverter::toRGB(*m_standardLab);
        titleColor = labelColorFor(QColor(rgb.R(), rgb.G(), rgb.B()));
    }
    if (!m_horizontalTitle.isEmpty()) {
        auto *title = new TextItem(m_horizontalTitle);
        title->setFont(titleFont);
        title->setTextColor(titleColor);
        title->setAlignment(Qt::AlignRight | Qt::AlignBottom);
        title->setOffset(4);
        title->setPos(frame.bottomRight());
        m_scene->addItem(title);
        keep(title);
    }
    if (!m_verticalTitle.isEmpty()) {
        auto *title = new TextItem(m_verticalTitle);
        title->setFont(titleFont);
        title->setTextColor(titleColor);
        title->setAlignment(Qt::AlignLeft | Qt::AlignTop);
        title->setOffset(4);
        title->setPos(frame.topLeft());
        m_scene->addItem(title);
        keep(title);
    }
}

void PlotWidget::buildTintedBackground()
{
    if (!showTintedBackgroundSetting() || !m_standardLab)
        return;
    // The wedges are clipped to the frame; they lie behind everything else.
    m_backgroundItem = new QGraphicsRectItem(m_frameRect);
    m_backgroundItem->setPen(Qt::NoPen);
    m_backgroundItem->setBrush(Qt::NoBrush);
    m_backgroundItem->setFlag(QGraphicsItem::ItemClipsChildrenToShape);
    m_backgroundItem->setZValue(-5);
    m_scene->addItem(m_backgroundItem);

    const double k = std::max(1.0, m_displayRange / 5.0);
    const QPointF origin = labToScene(m_standardLab->l(), m_standardLab->a(), m_standardLab->b());
    const auto rad = [](double degrees) { return degrees * kPi / 180.0; };
    for (int theta = 0; theta < 360; theta += 2) {
        const double t0 = rad(theta);
        const double t1 = rad(theta + 2);
        const double tm = rad(theta + 1);
        QPolygonF wedge;
        wedge << origin << origin + QPointF(150.0 * std::sin(t0), -150.0 * std::cos(t0))
              << origin + QPointF(150.0 * std::sin(t1), -150.0 * std::cos(t1));
        QLinearGradient gradient(origin, origin + QPointF(100.0 * std::sin(tm), -100.0 * std::cos(tm)));
        gradient.setColorAt(0.0, m_standardColor);
        const LabValue shifted(m_standardLab->l(), m_standardLab->a() + 100.0 * std::sin(tm) / k,
                               m_standardLab->b() + 100.0 * std::cos(tm) / k, m_standardLab->colorimetricCondition());
        gradient.setColorAt(1.0, UIHelper::toColor(ColorConverter::toRGB(shifted)));
        auto *item = new NonAntiAliasedQGraphicsPolygonItem(wedge, m_backgroundItem);
        item->setPen(QPen(Qt::transparent, 0, Qt::NoPen));
        item->setBrush(gradient);
    }
}

void PlotWidget::buildHueCircle()
{
    if (!showHueCircleSetting() || !m_standardLab)
        return;
    const double chroma = std::hypot(m_standardLab->a(), m_standardLab->b());
    const QPointF origin = labToScene(m_standardLab->l(), 0.0, 0.0);
    const QPen pen = cosmeticPen(QColor(80, 80, 80, 170), 1, Qt::DashDotLine);
    if (chroma > 1e-9) {
        auto *circle = m_scene->addEllipse(QRectF(origin.x() - chroma, origin.y() - chroma, 2 * chroma, 2 * chroma),
                                           pen);
        circle->setZValue(-3);
        m_hueCircleItem = circle;
        // The chroma line runs from the achromatic point through the standard and on to the
        // edge of what can be shown.
        const QPointF standard = labToScene(m_standardLab->l(), m_standardLab->a(), m_standardLab->b());
        const QPointF direction = (standard - origin) / chroma;
        const double length = chroma + 3.0 * m_displayRange;
        auto *line = m_scene->addLine(QLineF(origin, origin + direction * length), pen);
        line->setZValue(-3);
        m_chromaLineItem = line;
    }
}

void PlotWidget::buildStandard()
{
    const QPointF position = labToScene(m_standardLab->l(), m_standardLab->a(), m_standardLab->b());
    if (m_plane == Plane::L) {
        auto *line = m_scene->addLine(QLineF(-1.0, position.y(), 1.0, position.y()),
                                      cosmeticPen(QColor(40, 40, 40), 1.5));
        line->setZValue(-0.5);
        m_standardLine = line;
    }
    m_standardItem = new CheckGraphicsItem;
    m_standardItem->setOuterColor(QColor(20, 20, 20));
    m_standardItem->setInnerColors(Qt::white, QColor(160, 160, 160));
    m_standardItem->setPos(position);
    m_standardItem->setZValue(3);
    m_scene->addItem(m_standardItem);
    if (m_standardLabel) {
        const auto model = appearanceViewDataModel();
        const QString name = model && model->standard() ? model->standard()->name() : QString();
        m_standardLabel->setText(name);
        // Translucent, so that a marker under the label still shows.
        QColor box = m_standardColor;
        box.setAlpha(190);
        m_standardLabel->setBackground(box);
        m_standardLabel->setTextColor(labelColorFor(m_standardColor));
        m_standardLabel->setPos(position);
        m_standardLabel->setVisible(!name.isEmpty());
    }
}

void PlotWidget::placeStandardLabel()
{
    if (!m_standardLabel || !m_standardLabel->isVisible() || !m_view)
        return;
    const QPointF anchor = m_view->mapFromScene(m_standardLabel->pos());
    const double reach = TrialGraphicsItem::Radius + 2.0;
    const Qt::Alignment sides[] = {Qt::AlignLeft | Qt::AlignBottom, Qt::AlignRight | Qt::AlignBottom,
                                   Qt::AlignLeft | Qt::AlignTop, Qt::AlignRight | Qt::AlignTop};
    Qt::Alignment best = sides[0];
    int fewest = -1;
    for (const Qt::Alignment side : sides) {
        m_standardLabel->setAlignment(side);
        // The label ignores the view's transformations: its rectangle is in viewport pixels.
        const QRectF covered =
            m_standardLabel->boundingRect().translated(anchor).adjusted(-reach, -reach, reach, reach);
        int count = 0;
        for (const TrialGraphicsItem *item : qAsConst(m_trialItems)) {
            if (covered.contains(m_view->mapFromScene(item->pos())))
                ++count;
        }
        if (fewest < 0 || count < fewest) {
            fewest = count;
            best = side;
        }
        if (count == 0)
            break;
    }
    m_standardLabel->setAlignment(best);
}

void PlotWidget::buildTrials()
{
    const auto model = appearanceViewDataModel();
    const auto selection = trialSelectionModel();
    if (!model || !m_standardLab)
        return;
    const auto tolerance = currentTolerance();
    const auto standard = model->standard();
    const auto standardValues = standard ? standard->appearanceValues() : nullptr;
    const auto groups = model->trialsByGroup(selection ? selection->groupProperty() : nullptr);
    // The strip spreads its markers across its width in trial order.
    const int count = static_cast<int>(groups.size());
    int index = 0;
    for (const auto &entry : groups) {
        const std::shared_ptr<Trial> &trial = entry.second;
        const int position = index++;
        if (!trial)
            continue;
        const auto lab = model->appearanceValueToLab(trial->appearanceValues(), m_geometry);
        if (!lab)
            continue;
        TrialGraphicsItem *item = createTrialItem(trial, m_geometry);
        if (!item)
            continue;
        QPointF at = labToScene(lab->l(), lab->a(), lab->b());
        if (m_plane == Plane::L)
            at.setX(count > 1 ? -0.7 + 1.4 * position / (count - 1) : 0.0);
        item->setPos(at);
        item->setFillColor(UIHelper::toColor(ColorConverter::toRGB(*lab)));
        int status = 0;
        if (tolerance && standardValues && trial->appearanceValues())
            status = tolerance->status(*trial->appearanceValues(), *standardValues, model->colorimetricCondition());
        item->setVerdictColor(verdictColor(status));
        item->setToolTip(QStringLiteral("%1\nL* %2  a* %3  b* %4")
                             .arg(UIHelper::trialDisplayString(trial, QString::fromStdString(model->nameFormat())))
                             .arg(lab->l(), 0, 'f', 2)
                             .arg(lab->a(), 0, 'f', 2)
                             .arg(lab->b(), 0, 'f', 2));
        const bool active = selection && selection->isActive(trial);
        item->setEnabled(active);
        item->setZValue(active ? 1 : 0);
        m_scene->addItem(item);
        m_trialItems.append(item);
    }
}

void PlotWidget::updateActiveStates()
{
    const auto selection = trialSelectionModel();
    const QSignalBlocker blocker(m_scene);
    for (TrialGraphicsItem *item : qAsConst(m_trialItems)) {
        const bool active = selection && selection->isActive(item->trial());
        item->setEnabled(active);
        if (!item->isSelected())
            item->setZValue(active ? 1 : 0);
    }
    refreshSelection();
}

void PlotWidget::refreshSelection()
{
    const auto selection = trialSelectionModel();
    const std::shared_ptr<Trial> selected = selection ? selection->selectedTrial() : nullptr;
    const QSignalBlocker blocker(m_scene);
    for (TrialGraphicsItem *item : qAsConst(m_trialItems)) {
        const bool wanted = selected && item->trial() == selected && !m_printing;
        if (item->isSelected() != wanted) {
            item->setSelected(wanted);
            item->setZValue(item->isSelected() ? 2 : 1);
        } else if (item->isSelected() && item->zValue() != 2) {
            item->setZValue(2);
        }
    }
}

void PlotWidget::onSelectionChanged()
{
    if (m_updatingSelection)
        return;
    const auto selection = trialSelectionModel();
    // The newly picked item is the selected one that is not the model's selection yet.
    const std::shared_ptr<Trial> current = selection ? selection->selectedTrial() : nullptr;
    std::shared_ptr<Trial> picked;
    for (QGraphicsItem *item : m_scene->selectedItems()) {
        auto *trialItem = dynamic_cast<TrialGraphicsItem *>(item);
        if (trialItem && trialItem->trial() != current) {
            picked = trialItem->trial();
            break;
        }
    }
    if (selection && picked)
        selection->setSelectedTrial(picked); // comes back through onTrialSelected
    else
        refreshSelection();
}

void PlotWidget::clearToleranceItems()
{
    if (m_toleranceGroup) {
        m_scene->removeItem(m_toleranceGroup);
        delete m_toleranceGroup; // and its children
    }
    m_toleranceGroup = nullptr;
    m_warningBandItem = nullptr;
    m_passRegionItem = nullptr;
}

void PlotWidget::requestToleranceShape()
{
    {
        QMutexLocker locker(&m_mutex);
        clearToleranceItems();
        m_shape = ToleranceShape();
        m_toleranceExtent = 0.0;
    }
    const quint64 generation = ++m_generation;
    const auto model = appearanceViewDataModel();
    const auto tolerance = currentTolerance();
    const auto standard = model ? model->standard() : nullptr;
    const auto standardValues = standard ? standard->appearanceValues() : nullptr;
    if (!m_view || !m_standardLab || !tolerance || !standardValues) {
        m_worker->cancel();
        return;
    }
    ToleranceShapeRequest request;
    request.kind = m_plane == Plane::AB ? ToleranceShapeRequest::Kind::Plane : ToleranceShapeRequest::Kind::Lightness;
    request.generation = generation;
    auto lab = std::make_shared<LabValue>(*m_standardLab);
    lab->setGeometry(m_geometry);
    request.standardLab = lab;
    request.standardValues = preparedStandardValues(*standardValues, *lab, m_geometry);
    // The worker gets its own copy: an editor may change the tolerance meanwhile.
    auto copy = std::dynamic_pointer_cast<Tolerance>(tolerance->deepCopy());
    request.tolerance = copy ? copy : tolerance;
    request.useAngleDifference = tolerance->toleranceType() == ToleranceTypes::CIELabBox
                                 || tolerance->toleranceType() == ToleranceTypes::CIELChBox;
    m_worker->calculate(request);
}

void PlotWidget::onShapeCalculated(const vexa::ToleranceShape &shape)
{
    QMutexLocker locker(&m_mutex);
    // Answers to superseded requests are dropped.
    if (shape.generation != m_generation)
        return;
    clearToleranceItems();
    m_shape = shape;
    if (shape.valid) {
        m_toleranceGroup = new QGraphicsItemGroup;
        m_toleranceGroup->setZValue(-1);
        m_toleranceGroup->setTransform(valueToScene());
        m_scene->addItem(m_toleranceGroup);

        QPen bandPen(QColor(223, 155, 0, 40), 5, Qt::SolidLine, Qt::FlatCap, Qt::BevelJoin);
        bandPen.setCosmetic(true);
        m_warningBandItem = new QGraphicsPathItem(shape.band, m_toleranceGroup);
        m_warningBandItem->setPen(bandPen);
        m_warningBandItem->setBrush(QColor(242, 224, 0, 40));

        QPen passPen(QColor(2, 90, 48, 40), 5);
        passPen.setCosmetic(true);
        m_passRegionItem = new QGraphicsPolygonItem(shape.inner, m_toleranceGroup);
        m_passRegionItem->setPen(passPen);
        m_passRegionItem->setBrush(QColor(0, 145, 77, 40));

        // A region larger than the shown range widens it (within reason).
        if (m_standardLab) {
            double extent = 0.0;
            for (const QPointF &p : shape.outer) {
                if (m_plane == Plane::AB)
                    extent = std::max({extent, std::abs(p.x() - m_standardLab->a()), std::abs(p.y() - m_standardLab->b())});
                else
                    extent = std::max(extent, std::abs(p.y() - m_standardLab->l()));
            }
            if (std::isfinite(extent) && std::min(extent, kMaximumToleranceExtent) * 1.15 > m_displayRange) {
                m_toleranceExtent = extent;
                locker.unlock();
                rebuildScene();
                locker.relock();
            }
        }
    }
    Q_EMIT sgToleranceShapeApplied(shape.generation);
}

void PlotWidget::prepareForPrinting()
{
    if (m_printing || !m_view)
        return;
    m_printing = true;
    m_savedHorizontalPolicy = m_view->horizontalScrollBarPolicy();
    m_savedVerticalPolicy = m_view->verticalScrollBarPolicy();
    m_view->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_view->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    refreshSelection();
}

void PlotWidget::finishedPrinting()
{
    if (!m_printing || !m_view)
        return;
    m_printing = false;
    m_view->setHorizontalScrollBarPolicy(m_savedHorizontalPolicy);
    m_view->setVerticalScrollBarPolicy(m_savedVerticalPolicy);
    refreshSelection();
}

void PlotWidget::setZoom(double zoom)
{
    if (m_view)
        m_view->setZoom(zoom);
}

} // namespace vexa
