#include <vexa/graph/axis.h>

#include <cmath>
#include <cstdio>
#include <limits>
#include <stdexcept>

namespace {

// Far more than any real axis has (at most ten); stops runaway loops on huge values
// whose steps vanish in the floating-point rounding.
constexpr int MaxTicks = 1000;

} // namespace

Axis::Axis(double min, double max, const std::string &name)
    : m_name(name)
    , m_fixedMin(std::make_shared<const double>(min))
    , m_fixedMax(std::make_shared<const double>(max))
{
}

Axis::Axis(double min, Mode, const std::string &name)
    : m_name(name)
    , m_fixedMin(std::make_shared<const double>(min))
{
}

Axis::Axis(Mode, Mode, const std::string &name)
    : m_name(name)
{
}

Axis::Axis(Mode, double max, const std::string &name)
    : m_name(name)
    , m_fixedMax(std::make_shared<const double>(max))
{
}

const std::pair<double, double> &Axis::range() const
{
    if (!m_range)
        throw std::logic_error("Axis range not calculated");
    return *m_range;
}

double Axis::min() const
{
    return range().first;
}

double Axis::max() const
{
    return range().second;
}

void Axis::calculateRange(double smallest, double largest, bool found)
{
    const double min = m_fixedMin ? *m_fixedMin : (found ? smallest : 0.0);
    const double max = m_fixedMax ? *m_fixedMax : (found ? largest + 0.05 * (largest - smallest) : 0.0);
    m_range = std::make_pair(min, max);
}

double Axis::tickStep() const
{
    return tickStep(range().first, range().second);
}

std::vector<double> Axis::ticks() const
{
    return ticks(range().first, range().second);
}

std::string Axis::tickLabel(double value) const
{
    return tickLabel(value, tickStep());
}

double Axis::tickStep(double min, double max)
{
    const double span = max - min;
    if (!std::isfinite(span) || !(span > 0.0))
        return std::numeric_limits<double>::quiet_NaN();
    double step = std::pow(10.0, std::floor(std::log10(span)));
    const double n = max / step - min / step;
    if (n < 1.25)
        step = step / 5.0;
    else if (n < 3.01)
        step = step * 0.5;
    return step;
}

std::vector<double> Axis::ticks(double min, double max)
{
    std::vector<double> result;
    const double step = tickStep(min, max);
    if (!(step > 0.0) || !std::isfinite(step))
        return result;
    const double first = std::ceil(min / step);
    const double last = std::floor(max / step) + 1e-10;
    for (int i = 0; i < MaxTicks; ++i) {
        const double k = first + i;
        if (!(last > k))
            break;
        const double value = k * step;
        if (!result.empty() && !(value > result.back()))
            break; // k no longer grows: the values are too large for the step
        result.push_back(value);
    }
    return result;
}

std::string Axis::tickLabel(double value, double step)
{
    char buffer[512];
    if (std::floor(std::log10(step)) >= 0.7) {
        // Adding 0.0 turns the −0 of a small negative value into 0.
        std::snprintf(buffer, sizeof buffer, "%.0f", std::trunc(value) + 0.0);
        return buffer;
    }
    std::snprintf(buffer, sizeof buffer, "%f", value);
    std::string text(buffer);
    const double keep = 4.0 - std::floor(std::log10(step));
    if (keep >= 0.0 && keep < double(text.size()))
        text.resize(size_t(keep));
    return text;
}
