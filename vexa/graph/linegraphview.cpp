#include <vexa/graph/linegraphview.h>

#include <QFontMetrics>
#include <QPaintEvent>
#include <QPainter>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <functional>
#include <map>
#include <sstream>

namespace {

constexpr int Margin = 10;
constexpr int PlotTop = 15;
constexpr int BelowPlot = 30;
constexpr int TickLength = 5;
constexpr int LabelGap = 5;
// Groups nest rarely more than once; a group that contains itself must not recurse forever.
constexpr int MaxDepth = 16;

const QColor GridColor(220, 220, 220, 100);
const QColor FrameColor(150, 150, 150);
const QColor AxisColor(60, 60, 60);

// Calls f for every series and member, depth first, members after their group.
void forEachSeries(const std::shared_ptr<GraphData> &data, const std::function<void(const GraphData &)> &f,
                   int depth = 0)
{
    if (!data || depth > MaxDepth)
        return;
    f(*data);
    for (const std::shared_ptr<GraphData> &member : data->subData())
        forEachSeries(member, f, depth + 1);
}

void scanRange(Axis &axis, const std::vector<std::shared_ptr<GraphData>> &data, double (GraphPoint::*coordinate)() const)
{
    double smallest = 1e10;
    double largest = -1e10;
    bool found = false;
    if (!axis.isFixed()) {
        for (const std::shared_ptr<GraphData> &series : data) {
            forEachSeries(series, [&](const GraphData &d) {
                for (const GraphPoint &p : d.points()) {
                    // A point that cannot be drawn does not stretch either axis.
                    if (!std::isfinite(p.x()) || !std::isfinite(p.y()))
                        continue;
                    const double v = (p.*coordinate)();
                    found = true;
                    smallest = std::min(smallest, v);
                    largest = std::max(largest, v);
                }
            });
        }
    }
    axis.calculateRange(smallest, largest, found);
}

// A usable start and span for mapping: a range end that is not a number maps as 0, an
// empty, reversed or infinite range as one unit.
double mappingMin(const Axis &axis)
{
    return std::isfinite(axis.min()) ? axis.min() : 0.0;
}

double mappingSpan(const Axis &axis)
{
    const double span = axis.max() - axis.min();
    return std::isfinite(span) && span > 0.0 ? span : 1.0;
}

// Far-away points keep their direction roughly but stay within what the rasterizer handles.
double clampPixel(double v)
{
    return std::clamp(v, -1e6, 1e6);
}

// Half-pixel offset so that one-pixel lines on whole pixels stay sharp with antialiasing.
double crisp(double v)
{
    return std::floor(v) + 0.5;
}

std::string formatNumber(double value)
{
    char buffer[64];
    std::snprintf(buffer, sizeof buffer, "%.10g", value);
    return buffer;
}

struct TickLabels
{
    std::vector<double> values;
    QStringList labels;
    int widest = 0;
};

TickLabels tickLabels(const Axis &axis, const QFontMetrics &metrics)
{
    TickLabels result;
    result.values = axis.ticks();
    for (double v : result.values) {
        const QString label = QString::fromStdString(axis.tickLabel(v));
        result.widest = std::max(result.widest, metrics.horizontalAdvance(label));
        result.labels << label;
    }
    return result;
}

} // namespace

LineGraphView::LineGraphView(QWidget *parent)
    : QWidget(parent)
    , m_xAxis(Axis::Automatic, Axis::Automatic)
    , m_yAxis(Axis::Automatic, Axis::Automatic)
{
}

LineGraphView::~LineGraphView() = default;

void LineGraphView::setXAxis(const Axis &axis)
{
    m_xAxis = axis;
    update();
}

void LineGraphView::setYAxis(const Axis &axis)
{
    m_yAxis = axis;
    update();
}

void LineGraphView::addData(const std::shared_ptr<GraphData> &data)
{
    m_xAxis.clearRange();
    m_yAxis.clearRange();
    m_info.clear();
    if (data)
        m_data.push_back(data);
    update();
}

void LineGraphView::clear()
{
    m_seriesWidths.clear();
    m_cachedSeries.clear();
    m_xAxis.clearRange();
    m_yAxis.clearRange();
    m_info.clear();
    m_data.clear();
    update();
}

void LineGraphView::showInfo(const std::string &text)
{
    m_info = text;
    update();
}

void LineGraphView::setCurveWidth(double width)
{
    if (!(width > 0.0) || !std::isfinite(width))
        return;
    m_curveWidth = width;
    update();
}

void LineGraphView::setCurveWidth(int series, double width)
{
    if (!(width > 0.0) || !std::isfinite(width))
        return;
    m_seriesWidths[series] = width;
    update();
}

void LineGraphView::setSeriesCached(int series, bool cached)
{
    if (cached)
        m_cachedSeries.insert(series);
    else
        m_cachedSeries.erase(series);
    update();
}

double LineGraphView::curveWidth(int series) const
{
    const auto it = m_seriesWidths.find(series);
    return it == m_seriesWidths.end() ? m_curveWidth : it->second;
}

void LineGraphView::calculateRanges()
{
    scanRange(m_xAxis, m_data, &GraphPoint::x);
    scanRange(m_yAxis, m_data, &GraphPoint::y);
}

LineGraphView::LegendLayout LineGraphView::legendLayout(const QFontMetrics &metrics, const QSize &size) const
{
    LegendLayout legend;
    const int series = int(m_data.size());
    if (series < 2)
        return legend;
    int widest = 0;
    for (const std::shared_ptr<GraphData> &d : m_data)
        widest = std::max(widest, metrics.horizontalAdvance(QString::fromStdString(d->name())));
    legend.columnWidth = widest + 40;
    legend.columns = std::max(1, (size.width() - 40) / legend.columnWidth);
    legend.rows = (series + legend.columns - 1) / legend.columns;
    legend.rowHeight = int(1.5 * metrics.height());
    legend.top = (size.height() - Margin) - legend.rowHeight * legend.rows;
    return legend;
}

LineGraphView::Mapping LineGraphView::mapping() const
{
    const double left = m_plotRect.x();
    const double right = m_plotRect.x() + m_plotRect.width();
    const double top = m_plotRect.y();
    const double bottom = m_plotRect.y() + m_plotRect.height();
    Mapping map;
    map.xScale = (right - left) / mappingSpan(m_xAxis);
    map.x0 = left - mappingMin(m_xAxis) * map.xScale;
    map.yScale = -(bottom - top) / mappingSpan(m_yAxis);
    map.y0 = bottom - mappingMin(m_yAxis) * map.yScale;
    return map;
}

QPointF LineGraphView::toPixel(double x, double y) const
{
    return mapping()(x, y);
}

void LineGraphView::paintEvent(QPaintEvent *)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.fillRect(rect(), palette().color(QPalette::Base));
    calculateRanges();

    const QFontMetrics metrics = painter.fontMetrics();
    const LegendLayout legend = legendLayout(metrics, size());
    const TickLabels x = tickLabels(m_xAxis, metrics);
    const TickLabels y = tickLabels(m_yAxis, metrics);
    const int lastXLabel = x.labels.isEmpty() ? 0 : metrics.horizontalAdvance(x.labels.back());
    const int left = y.widest + Margin;
    const int right = (width() - Margin) - (lastXLabel + 1) / 2;
    const int bottom = (legend.rows > 0 ? legend.top : height() - Margin) - BelowPlot;
    m_plotRect = QRect(left, PlotTop, std::max(0, right - left), std::max(0, bottom - PlotTop));

    if (m_plotRect.width() > 0 && m_plotRect.height() > 0) {
        const QRectF plot(m_plotRect);
        painter.setPen(QPen(FrameColor, 1));
        painter.setBrush(Qt::NoBrush);
        painter.drawRect(plot.adjusted(0.5, 0.5, -0.5, -0.5));

        // Axis lines: the x axis along the y minimum, the y axis at the whole x minimum.
        painter.setPen(QPen(AxisColor, 1));
        const double originX = clampPixel(toPixel(std::trunc(mappingMin(m_xAxis)), 0.0).x());
        painter.drawLine(QPointF(crisp(originX), plot.bottom()), QPointF(crisp(originX), plot.top()));
        painter.drawLine(QPointF(originX, crisp(plot.bottom() - 1)), QPointF(plot.right(), crisp(plot.bottom() - 1)));

        const QColor textColor = palette().color(QPalette::Text);
        const int textHeight = metrics.height();
        for (int i = 0; i < int(x.values.size()); ++i) {
            const double px = crisp(clampPixel(toPixel(std::trunc(x.values[size_t(i)]), 0.0).x()));
            painter.setPen(QPen(GridColor, 1));
            painter.drawLine(QPointF(px, plot.top()), QPointF(px, plot.bottom()));
            painter.setPen(QPen(AxisColor, 1));
            painter.drawLine(QPointF(px, plot.bottom()), QPointF(px, plot.bottom() + TickLength));
            painter.setPen(textColor);
            const int labelWidth = metrics.horizontalAdvance(x.labels[i]);
            painter.drawText(QRectF(px - labelWidth / 2.0 - 1, plot.bottom() + TickLength + LabelGap, labelWidth + 2,
                                    textHeight),
                             Qt::AlignCenter, x.labels[i]);
        }
        for (int i = 0; i < int(y.values.size()); ++i) {
            const double py = crisp(toPixel(0.0, y.values[size_t(i)]).y());
            painter.setPen(QPen(GridColor, 1));
            painter.drawLine(QPointF(plot.left(), py), QPointF(plot.right(), py));
            painter.setPen(QPen(AxisColor, 1));
            painter.drawLine(QPointF(plot.left() - TickLength, py), QPointF(plot.left(), py));
            painter.setPen(textColor);
            painter.drawText(QRectF(0, py - textHeight / 2.0, plot.left() - TickLength - LabelGap, textHeight),
                             Qt::AlignRight | Qt::AlignVCenter, y.labels[i]);
        }

        painter.save();
        painter.setClipRect(m_plotRect.adjusted(-1, -1, 1, 1));
        for (int i = 0; i < int(m_data.size()); ++i)
            paintData(painter, m_data[size_t(i)], i);
        painter.restore();
    }
    // Images of series no longer shown (or no longer cached) go.
    m_layers.erase(std::remove_if(m_layers.begin(), m_layers.end(),
                                  [this](const Layer &layer) {
                                      const auto data = layer.data.lock();
                                      for (int i : m_cachedSeries) {
                                          if (i < int(m_data.size()) && data && m_data[size_t(i)] == data)
                                              return false;
                                      }
                                      return true;
                                  }),
                   m_layers.end());
    paintLegend(painter, legend);
    paintNotes(painter);
}

void LineGraphView::paintData(QPainter &painter, const std::shared_ptr<GraphData> &data, int index)
{
    if (!data)
        return;
    if (isSeriesCached(index))
        paintCachedCurve(painter, data, curveWidth(index));
    else
        paintCurve(painter, *data, curveWidth(index));
}

void LineGraphView::paintCachedCurve(QPainter &painter, const std::shared_ptr<GraphData> &data, double width)
{
    const QRect rect = m_plotRect.adjusted(-1, -1, 1, 1);
    const qreal ratio = painter.device() ? painter.device()->devicePixelRatioF() : 1.0;
    auto matches = [&](const Layer &layer) {
        return layer.data.lock() == data && layer.rect == rect && layer.xMin == m_xAxis.min()
            && layer.xMax == m_xAxis.max() && layer.yMin == m_yAxis.min() && layer.yMax == m_yAxis.max()
            && layer.width == width && layer.pixelRatio == ratio;
    };
    auto layer = std::find_if(m_layers.begin(), m_layers.end(), matches);
    if (layer == m_layers.end()) {
        m_layers.erase(std::remove_if(m_layers.begin(), m_layers.end(),
                                      [&data](const Layer &l) { return l.data.lock() == data; }),
                       m_layers.end());
        Layer fresh{data, rect, m_xAxis.min(), m_xAxis.max(), m_yAxis.min(), m_yAxis.max(), width, ratio, QImage()};
        fresh.image = QImage(rect.size() * ratio, QImage::Format_ARGB32_Premultiplied);
        fresh.image.setDevicePixelRatio(ratio);
        fresh.image.fill(Qt::transparent);
        QPainter layerPainter(&fresh.image);
        layerPainter.setRenderHints(painter.renderHints());
        layerPainter.translate(-rect.topLeft());
        paintCurve(layerPainter, *data, width);
        layerPainter.end();
        ++m_layerRenders;
        m_layers.push_back(std::move(fresh));
        layer = m_layers.end() - 1;
    }
    painter.drawImage(rect.topLeft(), layer->image);
}

void LineGraphView::paintCurve(QPainter &painter, const GraphData &data, double width)
{
    paintCurve(painter, data, width, mapping(), 0);
}

void LineGraphView::paintCurve(QPainter &painter, const GraphData &data, double width, const Mapping &map, int depth)
{
    if (depth > MaxDepth)
        return;
    const std::vector<GraphPoint> &points = data.points();
    if (!points.empty()) {
        const QColor color = data.color();
        painter.setPen(QPen(color, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        painter.setBrush(Qt::NoBrush);
        auto flush = [&] {
            const bool onePixel = std::all_of(m_polyline.cbegin(), m_polyline.cend(), [&](const QPointF &p) {
                return (p - m_polyline.front()).manhattanLength() < 0.5;
            });
            if (!onePixel) {
                painter.drawPolyline(m_polyline);
            } else if (!m_polyline.isEmpty()) {
                // A lone point (or points that all land on it): a dot the curve's colour.
                const double r = std::max(1.5, width);
                painter.save();
                painter.setPen(Qt::NoPen);
                painter.setBrush(color);
                painter.drawEllipse(m_polyline.front(), r, r);
                painter.restore();
            }
            m_polyline.clear();
        };
        m_polyline.clear();
        m_polyline.reserve(int(points.size()));
        for (const GraphPoint &p : points) {
            if (std::isfinite(p.x()) && std::isfinite(p.y())) {
                const QPointF pixel = map(p.x(), p.y());
                m_polyline.append(QPointF(clampPixel(pixel.x()), clampPixel(pixel.y())));
            } else {
                flush();
            }
        }
        flush();
    }
    for (const std::shared_ptr<GraphData> &member : data.subData()) {
        if (member)
            paintCurve(painter, *member, width, map, depth + 1);
    }
}

void LineGraphView::paintLegend(QPainter &painter, const LegendLayout &legend)
{
    if (legend.rows <= 0)
        return;
    for (int i = 0; i < int(m_data.size()); ++i) {
        const GraphData &series = *m_data[size_t(i)];
        const int x = (i % legend.columns) * legend.columnWidth;
        const int rowTop = legend.top + (i / legend.columns) * legend.rowHeight;
        const double centre = rowTop + legend.rowHeight / 2.0;
        painter.setPen(QPen(series.color(), 2, Qt::SolidLine, Qt::FlatCap, Qt::BevelJoin));
        painter.drawLine(QPointF(x + 20, centre), QPointF(x + 35, centre));
        painter.setPen(palette().color(QPalette::Text));
        painter.drawText(QRect(x + 40, rowTop, legend.columnWidth - 40, legend.rowHeight),
                         Qt::AlignLeft | Qt::AlignVCenter, QString::fromStdString(series.name()));
    }
}

// The axis names in the plot's inner corners and the info text at its top, each on a
// light box so that they read over curves and backgrounds.
void LineGraphView::paintNotes(QPainter &painter)
{
    const QFontMetrics metrics = painter.fontMetrics();
    const QRect area = m_plotRect.width() > 0 && m_plotRect.height() > 0 ? m_plotRect : rect().adjusted(4, 4, -4, -4);
    auto note = [&](const QRect &box, const QString &text, int flags) {
        painter.setPen(Qt::NoPen);
        painter.setBrush(QColor(255, 255, 255, 210));
        painter.drawRoundedRect(QRectF(box).adjusted(-3, -1, 3, 1), 3, 3);
        painter.setPen(palette().color(QPalette::Text));
        painter.drawText(box, flags, text);
    };
    if (m_plotRect.width() > 0 && m_plotRect.height() > 0) {
        const QString yName = QString::fromStdString(m_yAxis.name());
        if (!yName.isEmpty())
            note(QRect(area.left() + 6, area.top() + 4, metrics.horizontalAdvance(yName), metrics.height()), yName,
                 Qt::AlignCenter);
        const QString xName = QString::fromStdString(m_xAxis.name());
        if (!xName.isEmpty()) {
            const int w = metrics.horizontalAdvance(xName);
            note(QRect(area.right() - 6 - w, area.bottom() - 4 - metrics.height(), w, metrics.height()), xName,
                 Qt::AlignCenter);
        }
    }
    if (!m_info.empty()) {
        const QString text = QString::fromStdString(m_info);
        const int maxWidth = std::max(40, area.width() - 60);
        const QRect bounds = metrics.boundingRect(QRect(0, 0, maxWidth, 10000), Qt::TextWordWrap, text);
        const QRect box(area.center().x() - bounds.width() / 2, area.top() + 6, bounds.width(), bounds.height());
        note(box, text, Qt::TextWordWrap | Qt::AlignCenter);
    }
}

void LineGraphView::writeData(std::ostream &out) const
{
    struct Column
    {
        std::string name;
        std::map<double, double> values; // The first y at each x.
    };
    std::vector<Column> columns;
    std::map<double, bool> xs;
    auto addCurve = [&](const GraphData &curve, const GraphData *group, int member, int members) {
        if (curve.points().empty())
            return;
        Column column{columnName(curve, group, member, members), {}};
        for (const GraphPoint &p : curve.points()) {
            if (!std::isfinite(p.x()))
                continue;
            xs[p.x()] = true;
            column.values.emplace(p.x(), p.y());
        }
        // A curve drawn twice (in a layer and again on top) is written once.
        const bool repeated = std::any_of(columns.begin(), columns.end(), [&column](const Column &c) {
            return c.name == column.name && c.values.size() == column.values.size()
                && std::equal(c.values.begin(), c.values.end(), column.values.begin(), [](const auto &a, const auto &b) {
                       return a.first == b.first && (a.second == b.second || (std::isnan(a.second) && std::isnan(b.second)));
                   });
        });
        if (!repeated)
            columns.push_back(std::move(column));
    };
    std::function<void(const GraphData &, int)> walk = [&](const GraphData &group, int depth) {
        if (depth > MaxDepth)
            return;
        const auto &members = group.subData();
        for (int m = 0; m < int(members.size()); ++m) {
            if (!members[size_t(m)])
                continue;
            addCurve(*members[size_t(m)], &group, m, int(members.size()));
            walk(*members[size_t(m)], depth + 1);
        }
    };
    for (const std::shared_ptr<GraphData> &series : m_data) {
        addCurve(*series, nullptr, 0, 1);
        walk(*series, 0);
    }

    out << (m_xAxis.name().empty() ? std::string("x") : m_xAxis.name());
    for (const Column &c : columns)
        out << '\t' << c.name;
    out << '\n';
    for (const auto &x : xs) {
        out << formatNumber(x.first);
        for (const Column &c : columns) {
            out << '\t';
            const auto it = c.values.find(x.first);
            if (it != c.values.end() && std::isfinite(it->second))
                out << formatNumber(it->second);
        }
        out << '\n';
    }
}

std::string LineGraphView::dataText() const
{
    std::ostringstream out;
    writeData(out);
    return out.str();
}

std::string LineGraphView::columnName(const GraphData &curve, const GraphData *group, int member, int members) const
{
    std::string name = curve.name();
    if (!name.empty() || !group)
        return name;
    name = group->name();
    if (members > 1)
        name += " (" + std::to_string(member + 1) + ")";
    return name;
}

QSize LineGraphView::sizeHint() const
{
    return QSize(480, 320);
}

QSize LineGraphView::minimumSizeHint() const
{
    return QSize(160, 120);
}
