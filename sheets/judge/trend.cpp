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

struct Sums {
    double n = 0, mean_x = 0, mean_y = 0; // x are the sheets
    double sxx = 0, sxy = 0, syy = 0;     // about the means
};

Sums sums_of(const Series &series)
{
    Sums out;
    for (std::size_t x = 0; x < series.size(); ++x)
        if (series[x]) {
            out.n += 1;
            out.mean_x += static_cast<double>(x);
            out.mean_y += *series[x];
        }
    out.mean_x /= out.n;
    out.mean_y /= out.n;
    for (std::size_t x = 0; x < series.size(); ++x)
        if (series[x]) {
            const double dx = static_cast<double>(x) - out.mean_x, dy = *series[x] - out.mean_y;
            out.sxx += dx * dx;
            out.sxy += dx * dy;
            out.syy += dy * dy;
        }
    return out;
}

} // namespace

std::optional<Trend> trend_of(const Series &series, const std::vector<std::size_t> &apart)
{
    const Sums all = sums_of(series);
    if (all.n == 0)
        return std::nullopt;
    Trend out{
        .count = static_cast<std::size_t>(all.n), .mean = all.mean_y, .deviation = {}, .drift = {}};
    if (out.count >= 2)
        out.deviation = std::sqrt(all.syy / (all.n - 1));
    Series near = series;
    for (const std::size_t sheet : apart)
        near[sheet].reset();
    const Sums kept = sums_of(near);
    if (kept.n >= static_cast<double>(kFewestOfDrift)) {
        const double slope = kept.sxy / kept.sxx, freedom = kept.n - 2;
        const double residual =
            std::fmax(kept.syy - slope * kept.sxy, 0) / freedom; // variance about the line
        out.drift = {slope,
                     student(static_cast<std::size_t>(freedom)) * std::sqrt(residual / kept.sxx),
                     kept.mean_y - slope * kept.mean_x};
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
    const double median = median_of(series);
    Series distances;
    double count = 0, sum = 0;
    for (const auto &value : series) {
        distances.push_back(value ? std::optional(std::fabs(*value - median)) : std::nullopt);
        count += value ? 1 : 0;
        sum += distances.back().value_or(0);
    }
    const double mad = median_of(distances);
    const double farthest = mad > 0 ? 8 * mad / 0.6745 : 3.5 * 1.2533 * (sum / count);
    std::vector<std::size_t> out;
    for (std::size_t i = 0; i < series.size(); ++i)
        if (count >= static_cast<double>(kFewestOfOutliers) && distances[i] &&
            *distances[i] >= least && *distances[i] > farthest)
            out.push_back(i);
    return out;
}

double median_slope(const Series &series)
{
    Series slopes;
    for (std::size_t j = 0; j < series.size(); ++j)
        for (std::size_t i = 0; i < j; ++i)
            if (series[i] && series[j])
                slopes.emplace_back((*series[j] - *series[i]) / static_cast<double>(j - i));
    return median_of(slopes);
}

std::vector<std::size_t> outliers_about_slope(const Series &series, double least)
{
    const double slope = median_slope(series);
    Series distances = series;
    for (std::size_t i = 0; i < distances.size(); ++i)
        if (distances[i])
            *distances[i] -= slope * static_cast<double>(i);
    return outliers_of(distances, least);
}

std::optional<std::size_t> first_outside(const Series &series, const Limits &limits)
{
    for (std::size_t sheet = 0; sheet < series.size(); ++sheet)
        if (series[sheet] && !limits.hold(*series[sheet]))
            return sheet;
    return std::nullopt;
}

std::optional<std::size_t> leaves_at(const Drift &drift, const Limits &limits, const Series &series,
                                     std::size_t ahead)
{
    const auto beyond = [&](double value) {
        return drift.slope > 0 ? limits.high && value > *limits.high
                               : limits.low && value < *limits.low;
    };
    const auto last = std::find_if(series.rbegin(), series.rend(),
                                   [](const auto &reading) { return reading.has_value(); });
    if (!drift.significant() || last == series.rend() || beyond(**last))
        return std::nullopt;
    for (std::size_t sheet = series.size(); sheet < series.size() + ahead; ++sheet)
        if (beyond(drift.at(static_cast<double>(sheet))))
            return sheet;
    return std::nullopt;
}

} // namespace vantrel::sheets
