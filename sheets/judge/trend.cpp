#include "judge/trend.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace vantrel::sheets {
namespace {

// Student's t at 0.975, by degrees of freedom from 1 on.
constexpr std::array<double, 30> kStudent = {
    12.706, 4.303, 3.182, 2.776, 2.571, 2.447, 2.365, 2.306, 2.262, 2.228,
    2.201,  2.179, 2.160, 2.145, 2.131, 2.120, 2.110, 2.101, 2.093, 2.086,
    2.080,  2.074, 2.069, 2.064, 2.060, 2.056, 2.052, 2.048, 2.045, 2.042};

// Beyond the table by its expansion in 1/df (Abramowitz and Stegun 26.7.5).
double student(std::size_t freedom)
{
    return freedom <= kStudent.size() ? kStudent[freedom - 1]
                                      : 1.95996 + 2.37227 / static_cast<double>(freedom);
}

} // namespace

std::optional<Trend> trend_of(const Series &series)
{
    double n = 0, sum_x = 0, sum_y = 0;
    for (std::size_t x = 0; x < series.size(); ++x)
        if (series[x]) {
            n += 1;
            sum_x += static_cast<double>(x);
            sum_y += *series[x];
        }
    if (n == 0)
        return std::nullopt;
    const double mean_x = sum_x / n, mean_y = sum_y / n;
    double sxx = 0, sxy = 0, syy = 0;
    for (std::size_t x = 0; x < series.size(); ++x)
        if (series[x]) {
            const double dx = static_cast<double>(x) - mean_x, dy = *series[x] - mean_y;
            sxx += dx * dx;
            sxy += dx * dy;
            syy += dy * dy;
        }
    Trend out{.count = static_cast<std::size_t>(n), .mean = mean_y, .deviation = {}, .drift = {}};
    if (out.count >= 2)
        out.deviation = std::sqrt(syy / (n - 1));
    if (out.count >= 3) {
        const double slope = sxy / sxx;
        const double residual =
            std::fmax(syy - slope * sxy, 0) / (n - 2); // variance about the line
        out.drift = {slope, student(out.count - 2) * std::sqrt(residual / sxx),
                     mean_y - slope * mean_x};
    }
    return out;
}

double median_of(const Series &series)
{
    std::vector<double> values;
    for (const auto &value : series)
        if (value)
            values.push_back(*value);
    if (values.empty())
        return 0;
    std::sort(values.begin(), values.end());
    const std::size_t half = values.size() / 2;
    return values.size() % 2 ? values[half] : (values[half - 1] + values[half]) / 2;
}

std::vector<std::size_t> outliers_of(const Series &series, double least)
{
    constexpr std::size_t fewest = 5;
    constexpr double farthest = 8;
    const double median = median_of(series);
    Series distances;
    for (const auto &value : series)
        distances.push_back(value ? std::optional(std::fabs(*value - median)) : std::nullopt);
    const double mad = median_of(distances);
    std::vector<std::size_t> out;
    const auto readings = std::count_if(series.begin(), series.end(),
                                        [](const auto &value) { return value.has_value(); });
    if (static_cast<std::size_t>(readings) < fewest || !(mad > 0))
        return out;
    for (std::size_t i = 0; i < series.size(); ++i)
        if (distances[i] && *distances[i] >= least && 0.6745 * *distances[i] > farthest * mad)
            out.push_back(i);
    return out;
}

std::vector<std::size_t> outliers_about(const Series &series, const Trend &trend, double least)
{
    Series distances = series;
    if (trend.drift && trend.drift->significant())
        for (std::size_t i = 0; i < distances.size(); ++i)
            if (distances[i])
                *distances[i] -= trend.drift->at(static_cast<double>(i));
    return outliers_of(distances, least);
}

std::optional<std::size_t> first_outside(const Series &series, const Limits &limits)
{
    for (std::size_t sheet = 0; sheet < series.size(); ++sheet)
        if (series[sheet] && !limits.hold(*series[sheet]))
            return sheet;
    return std::nullopt;
}

std::optional<std::size_t> leaves_at(const Drift &drift, const Limits &limits, std::size_t sheets,
                                     std::size_t ahead)
{
    if (!drift.significant() || !limits.hold(drift.at(static_cast<double>(sheets) - 1)))
        return std::nullopt;
    for (std::size_t sheet = sheets; sheet < sheets + ahead; ++sheet)
        if (!limits.hold(drift.at(static_cast<double>(sheet))))
            return sheet;
    return std::nullopt;
}

} // namespace vantrel::sheets
