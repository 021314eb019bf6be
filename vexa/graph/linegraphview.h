#pragma once

#include <vexa/vexa_export.h>
#include <vexa/graph/axis.h>
#include <vexa/graph/graphdata.h>

#include <QImage>
#include <QPointF>
#include <QPolygonF>
#include <QRect>
#include <QWidget>

#include <iosfwd>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <vector>

class QFontMetrics;
class QPainter;

// A small line chart: named, coloured series of (x, y) points against an x and a y axis
// with automatic or fixed ranges, rounded ticks with labels, light grid lines and, from
// two series on, a legend along the bottom.
//
// Ranges are calculated at every paint (see Axis). Layout, in pixels: the legend's rows
// fill the bottom above a 10-pixel margin; the plot rectangle runs from the widest y
// label + 10 to the right edge less 10 and room for the last x label, and from 15 down
// to 30 above the legend (or above the bottom margin). x ticks and the x axis line sit
// on whole x values: their x is truncated to an integer before it is mapped.
//
// Points that are not finite numbers break a curve and take no part in the ranges; a point
// without finite neighbours is drawn as a dot. Curves are clipped to the plot rectangle.
class VEXA_EXPORT LineGraphView : public QWidget
{
    Q_OBJECT
public:
    // The legend's grid: `columns` columns of `columnWidth` pixels and `rows` rows of
    // `rowHeight` pixels from `top` down. Empty (no rows) below two series.
    struct LegendLayout
    {
        int columns = 0;
        int rows = 0;
        int columnWidth = 0;
        int rowHeight = 0;
        int top = 0;
    };

    explicit LineGraphView(QWidget *parent = nullptr);
    ~LineGraphView() override;

    void setXAxis(const Axis &axis);
    void setYAxis(const Axis &axis);
    const Axis &xAxis() const { return m_xAxis; }
    const Axis &yAxis() const { return m_yAxis; }

    // Appends a series (a null one is ignored); clears both calculated ranges and the
    // info text; repaints.
    void addData(const std::shared_ptr<GraphData> &data);
    // Removes every series; clears both calculated ranges and the info text; repaints.
    void clear();
    const std::vector<std::shared_ptr<GraphData>> &data() const { return m_data; }

    // A note shown at the top of the plot (an empty text shows nothing).
    void showInfo(const std::string &text);
    const std::string &info() const { return m_info; }

    // Pen width of the curves in pixels: 1 by default, which Qt draws fastest (a wider
    // antialiased pen costs about twenty times as much per segment). A series can be given
    // its own width (for itself and its members) until clear().
    void setCurveWidth(double width);
    double curveWidth() const { return m_curveWidth; }
    void setCurveWidth(int series, double width);
    double curveWidth(int series) const;

    // Keeps the drawing of a series (with its members) in an image of the plot's size and
    // draws that image again while the series is the same object (which must not change:
    // a cached group gains no members), in the same plot rectangle, ranges and width. Worth it for a layer of many curves that
    // stays while other series change (the active trials while another one is selected).
    // Until clear(); the image itself outlives clear() so that the same object added again
    // is not drawn anew.
    void setSeriesCached(int series, bool cached = true);
    bool isSeriesCached(int series) const { return m_cachedSeries.count(series) > 0; }
    // How often a cached series was drawn anew (for tests and measurements).
    int cachedSeriesRenderCount() const { return m_layerRenders; }

    // Calculates both axes' ranges from the series, as every paint does.
    void calculateRanges();
    LegendLayout legendLayout(const QFontMetrics &metrics, const QSize &size) const;
    // The plot rectangle of the last paint (empty before the first).
    QRect plotRect() const { return m_plotRect; }
    // The pixel of a data point in the last paint's plot rectangle and ranges. An empty or
    // reversed range maps as if it were one unit long.
    QPointF toPixel(double x, double y) const;

    // The data as tab-separated text: a header line (the x axis' name, then one name per
    // curve), then one line per distinct x value in ascending order with each curve's y
    // value at that x (empty where a curve has none or it is not a number). Every series
    // and every member of a group with points is a curve; a curve with the name and the
    // points of an earlier one is written once.
    void writeData(std::ostream &out) const;
    std::string dataText() const;

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent *event) override;

    // Draws the series at `index` (its points and its members'), after the frame, the
    // ticks and the grid and before the legend. Override to draw something with a curve.
    virtual void paintData(QPainter &painter, const std::shared_ptr<GraphData> &data, int index);
    // Draws one series' points in its colour and then its members.
    void paintCurve(QPainter &painter, const GraphData &data, double width);
    // The column name of a curve in writeData(): its own name; a member without one takes
    // its group's name, numbered "(1)", "(2)" … when the group has several members.
    virtual std::string columnName(const GraphData &curve, const GraphData *group, int member, int members) const;

private:
    struct Mapping
    {
        double x0 = 0.0;
        double xScale = 1.0;
        double y0 = 0.0;
        double yScale = 1.0;
        QPointF operator()(double x, double y) const { return QPointF(x0 + x * xScale, y0 + y * yScale); }
    };
    Mapping mapping() const;
    void paintCurve(QPainter &painter, const GraphData &data, double width, const Mapping &map, int depth);
    void paintCachedCurve(QPainter &painter, const std::shared_ptr<GraphData> &data, double width);

    // The drawing of one cached series and what it was drawn for.
    struct Layer
    {
        std::weak_ptr<GraphData> data;
        QRect rect;
        double xMin = 0.0;
        double xMax = 0.0;
        double yMin = 0.0;
        double yMax = 0.0;
        double width = 0.0;
        qreal pixelRatio = 1.0;
        QImage image;
    };
    void paintAxes(QPainter &painter);
    void paintLegend(QPainter &painter, const LegendLayout &legend);
    void paintNotes(QPainter &painter);

    Axis m_xAxis;
    Axis m_yAxis;
    std::vector<std::shared_ptr<GraphData>> m_data;
    std::string m_info;
    QRect m_plotRect;
    double m_curveWidth = 1.0;
    std::map<int, double> m_seriesWidths;
    std::set<int> m_cachedSeries;
    std::vector<Layer> m_layers;
    int m_layerRenders = 0;
    QPolygonF m_polyline; // Reused by paintCurve.
};
