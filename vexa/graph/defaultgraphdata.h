#pragma once

#include <vexa/vexa_export.h>
#include <vexa/graph/graphdata.h>

// A plain series: a name, a colour and the points, drawn as connected segments in
// the order given.
class VEXA_EXPORT DefaultGraphData : public GraphData
{
public:
    DefaultGraphData();
    explicit DefaultGraphData(const std::vector<GraphPoint> &points);
    DefaultGraphData(const std::vector<GraphPoint> &points, const std::string &name, const QColor &color);
    ~DefaultGraphData() override;

    std::string name() const override { return m_name; }
    QColor color() const override { return m_color; }
    const std::vector<GraphPoint> &points() const override { return m_points; }
    // Always empty.
    const std::vector<std::shared_ptr<GraphData>> &subData() const override { return m_subData; }

private:
    std::string m_name;
    QColor m_color = Qt::black;
    std::vector<GraphPoint> m_points;
    std::vector<std::shared_ptr<GraphData>> m_subData;
};
