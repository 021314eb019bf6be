#pragma once

#include <vexa/vexa_export.h>

#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

// One axis of a LineGraphView: a name, an optional fixed minimum and maximum (an end
// without a fixed value is automatic) and the range the view calculated at its last
// paint.
//
// Ticks fall on 1, 2 or 5 times a power of ten: step = 10^floor(log10(max − min)),
// divided by 5 when that gives fewer than 1.25 steps and halved when it gives fewer than
// 3.01. Labels of steps of 10 and more show the integer part; finer labels show "%f"
// cut to 4 − floor(log10(step)) characters, so larger values keep fewer decimals.
class VEXA_EXPORT Axis
{
public:
    // Marks an end as automatic.
    enum Mode { Automatic };

    Axis(double min, double max, const std::string &name = std::string());
    Axis(double min, Mode max, const std::string &name = std::string());
    Axis(Mode min, Mode max, const std::string &name = std::string());
    Axis(Mode min, double max, const std::string &name = std::string());

    const std::string &name() const { return m_name; }
    void setName(const std::string &name) { m_name = name; }

    // The fixed ends; null for an automatic end.
    std::shared_ptr<const double> fixedMin() const { return m_fixedMin; }
    std::shared_ptr<const double> fixedMax() const { return m_fixedMax; }
    bool isFixed() const { return m_fixedMin && m_fixedMax; }

    // The calculated range. min(), max(), tickStep() and ticks() throw std::logic_error
    // "Axis range not calculated" before a range was calculated.
    bool hasRange() const { return m_range.has_value(); }
    double min() const;
    double max() const;
    // Applies the range rules to the smallest and largest data value found (found false:
    // there was none): a fixed end is kept; an automatic minimum is the smallest value,
    // an automatic maximum the largest plus 5 % of (largest − smallest), headroom on top
    // only; an automatic end without data is 0.
    void calculateRange(double smallest, double largest, bool found);
    void setRange(double min, double max) { m_range = std::make_pair(min, max); }
    void clearRange() { m_range.reset(); }

    double tickStep() const;
    std::vector<double> ticks() const;
    // The label of a tick of this axis.
    std::string tickLabel(double value) const;

    // The same rules for any range. A range that is empty, reversed or not finite has no
    // ticks (and a NaN step).
    static double tickStep(double min, double max);
    static std::vector<double> ticks(double min, double max);
    static std::string tickLabel(double value, double step);

private:
    const std::pair<double, double> &range() const;

    std::string m_name;
    std::shared_ptr<const double> m_fixedMin;
    std::shared_ptr<const double> m_fixedMax;
    std::optional<std::pair<double, double>> m_range;
};
