#pragma once

#include <vexa/vexa_export.h>
#include <vexa/graph/graphpoint.h>

#include <QColor>

#include <memory>
#include <string>
#include <vector>

// A named, coloured series of a LineGraphView: its own points and, for a group, the
// member series that share its legend entry.
class VEXA_EXPORT GraphData
{
public:
    virtual ~GraphData();
    virtual std::string name() const = 0;
    virtual QColor color() const = 0;
    virtual const std::vector<GraphPoint> &points() const = 0;
    virtual const std::vector<std::shared_ptr<GraphData>> &subData() const = 0;
};
