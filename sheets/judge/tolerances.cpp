#include "judge/tolerances.h"

#include "read/text.h"

#include <fmt/format.h>
#include <fmt/ranges.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <iterator>
#include <toml++/toml.h>

namespace vantrel::sheets {
namespace {

struct Words {
    std::string_view key, title;
};

// Each in the order of its enumeration.
constexpr Words groups[] = {
    {"all", "All"},
    {"paper", "Paper"},
    {"solids", "Solids"},
    {"overprints", "Overprints"},
    {"tints", "Tints"},
    {"near-neutrals", "Near-neutrals"},
    {"spots", "Spot colours"},
};
constexpr Words quantities[] = {
    {"", ""}, // a formula has words of its own
    {"dl", "ΔL*"},     {"dh", "ΔH*ab"},   {"dch", "ΔCh"},
    {"density", "ΔD"}, {"gain", "Δgain"}, {"spread", "Spread of gain"},
};
constexpr Words statistics[] = {{"maximum", "largest"}, {"mean", "mean"}, {"p95", "95 %"}};

template <typename Value, std::size_t count>
const Words &words_of(const Words (&table)[count], Value value)
{
    return table[static_cast<std::size_t>(value)];
}

template <std::size_t count> std::string keys_of(const Words (&table)[count])
{
    std::string out;
    for (const Words &words : table)
        if (!words.key.empty())
            out += fmt::format("{}{}", out.empty() ? "" : ", ", words.key);
    return out;
}

std::size_t line_of(const toml::node &node) { return node.source().begin.line; }

// One [[limit]] of the file.
class Entry {
public:
    explicit Entry(const toml::table &table) : table(table) {}

    [[noreturn]] void refuse(std::string_view key, const std::string &reason) const
    {
        const toml::node *node = table.get(key);
        throw InputError{node ? line_of(*node) : line_of(table), reason};
    }

    bool has(std::string_view key) const { return table.contains(key); }

    std::string text(std::string_view key) const
    {
        const auto value = table[key].value_exact<std::string>();
        if (!value || value->empty())
            refuse(key, fmt::format("{} is to be text in quotes", key));
        return *value;
    }

    double number(std::string_view key) const
    {
        const auto value = table[key].is_number() ? table[key].value<double>() : std::nullopt;
        if (!value || !std::isfinite(*value))
            refuse(key, fmt::format("{} is to be a number", key));
        return *value;
    }

    std::optional<double> optional_number(std::string_view key) const
    {
        return has(key) ? std::optional(number(key)) : std::nullopt;
    }

    // One of the words of a table.
    template <typename Value, std::size_t count>
    Value word(std::string_view key, const Words (&words)[count]) const
    {
        const std::string wish = text(key);
        for (const Words &row : words)
            if (row.key == wish)
                return static_cast<Value>(&row - words);
        refuse(key, fmt::format("no {} {}; there are {}", key, in_quotes(wish), keys_of(words)));
    }

    void check_keys() const
    {
        constexpr std::string_view known[] = {"group",   "ink",       "nominal", "formula",
                                              "weights", "statistic", "aim",     "value"};
        for (const auto &[key, value] : table)
            if (std::find(std::begin(known), std::end(known), key.str()) == std::end(known))
                throw InputError{key.source().begin.line,
                                 fmt::format("no key {} in a limit; there are {}",
                                             in_quotes(key.str()), fmt::join(known, ", "))};
        for (const std::string_view key : {"group", "formula", "statistic", "value"})
            if (!has(key))
                refuse(key, fmt::format("a limit without {}", key));
    }

    Metric weighted(Metric metric) const
    {
        const toml::array *weights = table["weights"].as_array();
        const bool two = weights && weights->size() == 2 && weights->get(0)->is_number() &&
                         weights->get(1)->is_number();
        if (!two || metric.formula == Formula::de76)
            refuse("weights", "weights are two numbers above 0, of de2000, cmc or de94");
        metric.lightness = *weights->get(0)->value<double>();
        metric.chroma = *weights->get(1)->value<double>();
        if (!(metric.lightness > 0 && metric.chroma > 0))
            refuse("weights", "weights are two numbers above 0, of de2000, cmc or de94");
        return metric;
    }

private:
    const toml::table &table;
};

void read_formula(const Entry &entry, Tolerance &limit)
{
    const std::string key = entry.text("formula");
    if (const auto formula = formula_named(key)) {
        limit.metric = usual_metric(*formula);
        if (entry.has("weights"))
            limit.metric = entry.weighted(limit.metric);
        return;
    }
    const auto *found = std::find_if(std::begin(quantities) + 1, std::end(quantities),
                                     [&](const Words &words) { return words.key == key; });
    if (found == std::end(quantities))
        entry.refuse("formula", fmt::format("no formula {}; there are {}, {}", in_quotes(key),
                                            formula_keys(), keys_of(quantities)));
    limit.quantity = static_cast<Quantity>(found - quantities);
    if (entry.has("weights"))
        entry.refuse("weights", fmt::format("{} has no weights", key));
}

// A limit that could never find a patch is a mistake.
void check_sense(const Entry &entry, const Tolerance &limit)
{
    const bool of_one_ink =
        limit.group == Group::solids || limit.group == Group::tints || limit.group == Group::spots;
    const bool of_gain = limit.quantity == Quantity::gain || limit.quantity == Quantity::spread;
    if (!limit.ink.empty() && (!of_one_ink || limit.quantity == Quantity::spread))
        entry.refuse("ink", "an ink is for limits of solids, tints or spots, not for a spread");
    if (limit.nominal && limit.group != Group::tints)
        entry.refuse("nominal", "a nominal value is for limits of tints");
    if (of_gain && limit.group != Group::tints)
        entry.refuse("group", fmt::format("{} is of tints", key_of(limit)));
    if (limit.quantity == Quantity::density && limit.group == Group::paper)
        entry.refuse("group", "densities are over the paper, which has none");
    if (limit.aim && limit.quantity != Quantity::density && limit.quantity != Quantity::gain)
        entry.refuse("aim", "an aim is for density or gain; colours have those of the reference");
    if (!(limit.limit >= 0))
        entry.refuse("value", "value is to be a number from 0 up");
}

Tolerance limit_of(const toml::table &table)
{
    const Entry entry(table);
    entry.check_keys();
    Tolerance limit;
    limit.group = entry.word<Group>("group", groups);
    read_formula(entry, limit);
    limit.statistic = entry.word<Statistic>("statistic", statistics);
    limit.limit = entry.number("value");
    if (entry.has("ink"))
        limit.ink = entry.text("ink");
    limit.nominal = entry.optional_number("nominal");
    limit.aim = entry.optional_number("aim");
    check_sense(entry, limit);
    return limit;
}

toml::table parsed(std::string_view text)
{
    try {
        return toml::parse(text);
    } catch (const toml::parse_error &error) {
        throw InputError{error.source().begin.line, printable(error.description())};
    }
}

} // namespace

Tolerances read_tolerances(std::string_view text)
{
    const toml::table file = parsed(text);
    Tolerances out;
    for (const auto &[key, value] : file) {
        if (key == "name" && value.is_string())
            out.name = printable(value.ref<std::string>());
        else if (key == "limit" && value.is_array_of_tables())
            for (const toml::node &limit : *value.as_array())
                out.limits.push_back(limit_of(*limit.as_table()));
        else
            throw InputError{line_of(value), fmt::format("{} is none of name = \"…\" and [[limit]]",
                                                         in_quotes(key.str()))};
    }
    if (out.limits.empty())
        throw InputError{0, "no [[limit]] in this file"};
    return out;
}

std::string_view key_of(Group group) { return words_of(groups, group).key; }

std::string_view key_of(Statistic statistic) { return words_of(statistics, statistic).key; }

std::string key_of(const Tolerance &limit)
{
    return std::string(limit.quantity == Quantity::colour_difference
                           ? names_of(limit.metric.formula).key
                           : words_of(quantities, limit.quantity).key);
}

std::string patches_of(const Tolerance &limit)
{
    std::string out(words_of(groups, limit.group).title);
    if (!limit.ink.empty())
        out += ' ' + printable(limit.ink);
    if (limit.nominal)
        out += fmt::format(" of {:g} %", *limit.nominal);
    return out;
}

std::string title_of(const Tolerance &limit)
{
    std::string title = limit.quantity == Quantity::colour_difference
                            ? title_of(limit.metric)
                            : std::string(words_of(quantities, limit.quantity).title);
    return limit.aim ? fmt::format("{} from {:g}", title, *limit.aim) : title;
}

std::string_view title_of(Statistic statistic) { return words_of(statistics, statistic).title; }

} // namespace vantrel::sheets
