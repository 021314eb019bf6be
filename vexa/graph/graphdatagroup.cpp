#include <vexa/graph/graphdatagroup.h>

GraphDataGroup::GraphDataGroup(const std::string &name, const QColor &color)
    : m_name(name)
    , m_color(color)
{
}

GraphDataGroup::~GraphDataGroup() = default;

void GraphDataGroup::addSubData(const std::shared_ptr<GraphData> &data)
{
    if (data)
        m_subData.push_back(data);
}
