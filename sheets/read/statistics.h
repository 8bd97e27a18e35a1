// Rows of a sheet that are means and other statistics of its patches.
#pragma once

#include "read/measurement.h"

#include <cstddef>
#include <map>
#include <optional>
#include <string_view>
#include <utility>
#include <vector>

namespace vantrel::sheets {

enum class Statistic { mean, median, least, most, range, deviation, sum, count };

// The statistic that a text names as a whole: "Average", "Std. Dev.", "Mittelwert".
std::optional<Statistic> statistic_named(std::string_view text);

// That of any of its words: "Mean of 20", "AVG_ALL".
std::optional<Statistic> statistic_in_words_of(std::string_view text);

// Whether rows are statistics of patches, to the last place of what they are written with.
class Statistics {
public:
    Statistics(std::vector<const Patch *> patches, Kind kind)
        : patches(std::move(patches)), kind(kind)
    {
    }
    bool holds(Statistic statistic, const Patch &row);

private:
    std::vector<double> values_of(const Patch &patch) const;
    const std::vector<double> &of_patches(Statistic statistic, bool sample);

    std::vector<const Patch *> patches;
    Kind kind;
    std::map<std::pair<Statistic, bool>, std::vector<double>> found;
};

} // namespace vantrel::sheets
