#pragma once

#include <vexa/vexa_export.h>
#include <vexa/graph/graphdata.h>

// Several series under one legend entry: the group has a name and a colour for the
// legend but no points of its own; each member is drawn in its own colour.
class VEXA_EXPORT GraphDataGroup : public GraphData
{
public:
    GraphDataGroup(const std::string &name, const QColor &color);
    ~GraphDataGroup() override;

    // Appends a member series; a null series is ignored.
    void addSubData(const std::shared_ptr<GraphData> &data);

    std::string name() const override { return m_name; }
    QColor color() const override { return m_color; }
    // Always empty: the points belong to the members.
    const std::vector<GraphPoint> &points() const override { return m_noPoints; }
    const std::vector<std::shared_ptr<GraphData>> &subData() const override { return m_subData; }

private:
    std::string m_name;
    QColor m_color;
    std::vector<std::shared_ptr<GraphData>> m_subData;
    std::vector<GraphPoint> m_noPoints;
};
