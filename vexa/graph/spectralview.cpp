#include <vexa/graph/spectralview.h>

#include <vexa/graph/graphdatagroup.h>
#include <vexa/graph/spectralgraphdata.h>

#include <domain/appearancevalues.h>
#include <domain/reflectancespectrum.h>
#include <utilities/logger.h>

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QContextMenuEvent>
#include <QMenu>
#include <QPainter>
#include <QPointer>

namespace vexa {

const char *const SpectralView::BackgroundImage = ":/Images/Spectrum.png";

SpectralView::SpectralView(QWidget *parent)
    : LineGraphView(parent)
    , m_copyAction(new QAction(this))
{
    setXAxis(Axis(400.0, 700.0, "nm"));
    setYAxis(Axis(0.0, Axis::Automatic, "R"));

    // The menu is a child of the view; whoever lets go last (the view's children or this
    // pointer) deletes it, once.
    auto *menu = new QMenu(this);
    QPointer<QMenu> guard(menu);
    m_contextMenu = std::shared_ptr<QMenu>(menu, [guard](QMenu *) { delete guard.data(); });

    m_copyAction->setShortcut(QKeySequence::Copy);
    m_copyAction->setShortcutContext(Qt::WidgetShortcut);
    connect(m_copyAction, &QAction::triggered, this, &SpectralView::copyToClipboard);
    addAction(m_copyAction);
    m_contextMenu->addAction(m_copyAction);
    setFocusPolicy(Qt::ClickFocus);
    retranslate();
}

SpectralView::~SpectralView() = default;

void SpectralView::retranslate()
{
    m_copyAction->setText(tr("Copy"));
    m_copyAction->setToolTip(tr("Copy the spectra as text: wavelength, then one column per spectrum"));
}

void SpectralView::changeEvent(QEvent *event)
{
    if (event->type() == QEvent::LanguageChange)
        retranslate();
    LineGraphView::changeEvent(event);
}

void SpectralView::addSpectralData(std::shared_ptr<ReflectanceSpectrum> spectrum, int index)
{
    if (!spectrum) {
        Logger::instance().error(LogCategory::General, QStringLiteral("SpectralView::addSpectralData: no spectrum"));
        return;
    }
    addData(std::make_shared<SpectralGraphData>(std::move(spectrum), index));
}

bool SpectralView::didAddSpectralData(std::shared_ptr<AppearanceValues> values, int index, const QColor &color)
{
    if (!values)
        return false;
    auto group = std::make_shared<GraphDataGroup>(values->name().toStdString(), color);
    for (const std::shared_ptr<ColorValues> &colorValues : values->colorValues()) {
        if (auto spectrum = std::dynamic_pointer_cast<ReflectanceSpectrum>(colorValues))
            group->addSubData(std::make_shared<SpectralGraphData>(spectrum, index));
    }
    addData(group);
    return true;
}

QString SpectralView::copyText() const
{
    return QString::fromStdString(dataText());
}

void SpectralView::copyToClipboard()
{
    QApplication::clipboard()->setText(copyText());
}

QImage SpectralView::backgroundImage()
{
    static const QImage image(QString::fromLatin1(BackgroundImage));
    return image;
}

const QPixmap &SpectralView::scaledBackground(const QSize &size)
{
    if (m_scaledBackground.size() != size) {
        const QImage image = backgroundImage();
        m_scaledBackground = image.isNull() || size.isEmpty()
            ? QPixmap()
            : QPixmap::fromImage(image.scaled(size, Qt::IgnoreAspectRatio, Qt::SmoothTransformation));
    }
    return m_scaledBackground;
}

// The spectrum's colours go behind the first series, over the whole plot rectangle:
// from (x minimum, y maximum) to (x maximum, y minimum).
void SpectralView::paintData(QPainter &painter, const std::shared_ptr<GraphData> &data, int index)
{
    if (index == 0) {
        const QRectF target =
            QRectF(toPixel(xAxis().min(), yAxis().max()), toPixel(xAxis().max(), yAxis().min())).normalized();
        const QRect pixels = target.toAlignedRect().intersected(plotRect());
        if (!pixels.isEmpty()) {
            const QPixmap &background = scaledBackground(target.toAlignedRect().size());
            if (!background.isNull())
                painter.drawPixmap(target.toAlignedRect().topLeft(), background);
        }
    }
    LineGraphView::paintData(painter, data, index);
}

// A spectrum's column is named by its measurement and its geometry ("STD 45as15").
std::string SpectralView::columnName(const GraphData &curve, const GraphData *group, int member, int members) const
{
    const auto *spectral = dynamic_cast<const SpectralGraphData *>(&curve);
    if (!spectral || !spectral->spectrum())
        return LineGraphView::columnName(curve, group, member, members);
    const std::string geometry = spectral->spectrum()->physicalCondition().geometry().toStdString();
    const std::string owner = group ? group->name() : std::string();
    if (geometry.empty())
        return LineGraphView::columnName(curve, group, member, members);
    return owner.empty() ? geometry : owner + " " + geometry;
}

void SpectralView::contextMenuEvent(QContextMenuEvent *event)
{
    m_contextMenu->popup(event->globalPos());
    event->accept();
}

} // namespace vexa
