#include "read/statistics.h"

#include "read/text.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <numeric>
#include <string>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kFewest = 2; // that a statistic is told by

struct Word {
    std::string_view key;
    Statistic statistic;
};
constexpr std::array words = {Word{"AVERAGE", Statistic::mean},
                              Word{"AVG", Statistic::mean},
                              Word{"MEAN", Statistic::mean},
                              Word{"MITTELWERT", Statistic::mean},
                              Word{"MITTEL", Statistic::mean},
                              Word{"DURCHSCHNITT", Statistic::mean},
                              Word{"MOYENNE", Statistic::mean},
                              Word{"Ø", Statistic::mean},
                              Word{"MEDIA", Statistic::mean},
                              Word{"PROMEDIO", Statistic::mean},
                              Word{"MW", Statistic::mean},
                              Word{"MEDIAN", Statistic::median},
                              Word{"MEDIANE", Statistic::median},
                              Word{"MéDIANE", Statistic::median},
                              Word{"MIN", Statistic::least},
                              Word{"MINIMUM", Statistic::least},
                              Word{"MAX", Statistic::most},
                              Word{"MAXIMUM", Statistic::most},
                              Word{"RANGE", Statistic::range},
                              Word{"SPANNWEITE", Statistic::range},
                              Word{"STDDEV", Statistic::deviation},
                              Word{"STDEV", Statistic::deviation},
                              Word{"STD", Statistic::deviation},
                              Word{"SD", Statistic::deviation},
                              Word{"STANDARDDEVIATION", Statistic::deviation},
                              Word{"STANDARDABWEICHUNG", Statistic::deviation},
                              Word{"STDABW", Statistic::deviation},
                              Word{"ECARTTYPE", Statistic::deviation},
                              Word{"éCARTTYPE", Statistic::deviation},
                              Word{"ÉCARTTYPE", Statistic::deviation},
                              Word{"SUM", Statistic::sum},
                              Word{"SUMME", Statistic::sum},
                              Word{"SOMME", Statistic::sum},
                              Word{"TOTAL", Statistic::sum},
                              Word{"COUNT", Statistic::count},
                              Word{"ANZAHL", Statistic::count}};
constexpr std::size_t kLongest = 24; // of a text with such a word

double statistic_of(std::vector<double> column, Statistic statistic, bool sample)
{
    const auto n = static_cast<double>(column.size());
    const double sum = std::accumulate(column.begin(), column.end(), 0.0);
    const auto [least, most] = std::minmax_element(column.begin(), column.end());
    switch (statistic) {
    case Statistic::mean:
        return sum / n;
    case Statistic::least:
        return *least;
    case Statistic::most:
        return *most;
    case Statistic::range:
        return *most - *least;
    case Statistic::sum:
        return sum;
    case Statistic::count:
        return n;
    case Statistic::deviation: {
        double squares = 0;
        for (const double value : column)
            squares += (value - sum / n) * (value - sum / n);
        return std::sqrt(squares / (sample ? n - 1 : n));
    }
    case Statistic::median:
        break;
    }
    std::sort(column.begin(), column.end());
    return (column[(column.size() - 1) / 2] + column[column.size() / 2]) / 2;
}

// One in the last decimal place that the values are written with; of values that were brought to
// other bands a small part.
double last_place(const std::vector<double> &values)
{
    constexpr double kFinest = 1e-9, kPart = 1e-4;
    double place = 1;
    const auto is_whole = [&](double value) {
        return std::abs(value / place - std::round(value / place)) < 1e-3;
    };
    while (place > kFinest && !std::all_of(values.begin(), values.end(), is_whole))
        place /= 10;
    return place > kFinest ? place : kPart * *std::max_element(values.begin(), values.end());
}

} // namespace

std::optional<Statistic> statistic_named(std::string_view text)
{
    constexpr std::string_view beginnings = "ACDEMPRSTacdemprst\xc3"; // with É and Ø
    if (text.empty() || text.size() > kLongest ||
        beginnings.find(text[0]) == std::string_view::npos)
        return std::nullopt;
    std::string key = letters(text);
    std::erase_if(key, [](char c) { return c == '.' || c == ':'; });
    const auto *const word =
        std::find_if(words.begin(), words.end(), [&](const Word &it) { return it.key == key; });
    return word == words.end() ? std::nullopt : std::optional(word->statistic);
}

std::optional<Statistic> statistic_in_words_of(std::string_view text)
{
    constexpr std::string_view between = " _-()=:,";
    while (!text.empty()) {
        const std::string_view word = text.substr(0, text.find_first_of(between));
        if (const auto statistic = statistic_named(word))
            return statistic;
        text.remove_prefix(std::min(word.size() + 1, text.size()));
    }
    return std::nullopt;
}

std::vector<double> Statistics::values_of(const Patch &patch) const
{
    if (kind != Kind::colours)
        return {patch.refl.begin(), patch.refl.end()};
    const CIELABCOORD lab = patch.lab.value_or(CIELABCOORD{});
    return {lab.L, lab.a, lab.b};
}

const std::vector<double> &Statistics::of_patches(Statistic statistic, bool sample)
{
    const auto [at, added] = found.try_emplace({statistic, sample});
    if (!added)
        return at->second;
    std::vector<std::vector<double>> columns(values_of(*patches[0]).size());
    for (const Patch *patch : patches) {
        const std::vector<double> values = values_of(*patch);
        for (std::size_t i = 0; i < values.size(); ++i)
            columns[i].push_back(values[i]);
    }
    for (std::vector<double> &column : columns)
        at->second.push_back(statistic_of(std::move(column), statistic, sample));
    return at->second;
}

bool Statistics::holds(Statistic statistic, const Patch &row)
{
    if (patches.size() < kFewest)
        return false;
    const std::vector<double> values = values_of(row);
    const double own = last_place(values), theirs = last_place(values_of(*patches[0]));
    // the patches may have been rounded after it was computed; one of them is chosen as it stands
    const bool chosen = statistic == Statistic::least || statistic == Statistic::most;
    const double tolerance = chosen ? 0.51 * own
                             : statistic == Statistic::sum
                                 ? theirs * std::sqrt(static_cast<double>(patches.size()))
                                 : std::max(own, theirs);
    const auto is_of = [&](const std::vector<double> &expected) {
        return std::equal(values.begin(), values.end(), expected.begin(),
                          [&](double a, double b) { return std::abs(a - b) <= tolerance; });
    };
    return is_of(of_patches(statistic, true)) || is_of(of_patches(statistic, false));
}

} // namespace vantrel::sheets
