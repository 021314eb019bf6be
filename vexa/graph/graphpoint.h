#pragma once

// One (x, y) point of a line graph series.
class GraphPoint
{
public:
    GraphPoint() = default;
    GraphPoint(double x, double y)
        : m_x(x)
        , m_y(y)
    {
    }

    double x() const { return m_x; }
    double y() const { return m_y; }

private:
    double m_x = 0.0;
    double m_y = 0.0;
};
