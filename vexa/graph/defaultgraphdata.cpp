#include <vexa/graph/defaultgraphdata.h>

DefaultGraphData::DefaultGraphData() = default;

DefaultGraphData::DefaultGraphData(const std::vector<GraphPoint> &points)
    : m_points(points)
{
}

DefaultGraphData::DefaultGraphData(const std::vector<GraphPoint> &points, const std::string &name,
                                   const QColor &color)
    : m_name(name)
    , m_color(color)
    , m_points(points)
{
}

DefaultGraphData::~DefaultGraphData() = default;
