// What a series of readings says about a process: its mean, its spread and its drift.
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

namespace vantrel::sheets {

// A reading for each sheet, or nothing where the sheet has none.
using Series = std::vector<std::optional<double>>;

// Least squares through (sheet, reading), sheets counted from 0.
struct Drift {
    double slope = 0;       // a sheet
    double uncertainty = 0; // of the slope: half the width of its 95 % interval
    double first = 0;       // of the line, at the first sheet

    double at(double sheet) const { return first + slope * sheet; }
    bool significant() const { return slope > uncertainty || -slope > uncertainty; }
};

struct Trend {
    std::size_t count = 0;
    double mean = 0;
    std::optional<double> deviation; // standard deviation of the sample; from two readings on
    std::optional<Drift> drift;      // from three readings on
};

// Mean and deviation of all readings; the drift of those that are not `apart`. Nothing where the
// series has no reading. NIST/SEMATECH e-Handbook of Statistical Methods, 1.3.5.1 and 4.1.4;
// intervals by Student's t.
std::optional<Trend> trend_of(const Series &series, const std::vector<std::size_t> &apart = {});

// Of the readings there are; nothing is 0.
double median_of(const Series &series);

constexpr std::size_t kFewestOfDrift = 3, kFewestOfOutliers = 5; // readings

// Readings whose modified z-score, 0.6745 (x - median) / MAD, is beyond 8 (Iglewicz and Hoaglin,
// How to Detect and Handle Outliers, 1993, take 3.5 for a single series; of a run dozens are looked
// at), and that are `least` from the median. Where most readings are equal, and the MAD is 0, by
// their x - median over 1.2533 mean absolute deviations beyond 3.5. Nothing of fewer than five.
std::vector<std::size_t> outliers_of(const Series &series, double least);

// The median of the slopes between all pairs of readings, which up to 29 % of wrong ones leave as
// it is (Theil 1950, Sen 1968); 0 of fewer than two.
double median_slope(const Series &series);

// The outliers about the line of the median slope.
std::vector<std::size_t> outliers_about_slope(const Series &series, double least);

// What a reading may be; a missing limit does not bound it.
struct Limits {
    std::optional<double> low, high;

    bool hold(double value) const { return !(low && value < *low) && !(high && value > *high); }
};

// The first sheet whose reading is outside, counted from 0.
std::optional<std::size_t> first_outside(const Series &series, const Limits &limits);

// The sheet at which the drift passes the limit that it runs to, of the next `ahead`; nothing where
// it does not, is not significant, or the last reading is beyond.
std::optional<std::size_t> leaves_at(const Drift &drift, const Limits &limits, const Series &series,
                                     std::size_t ahead);

} // namespace vantrel::sheets
