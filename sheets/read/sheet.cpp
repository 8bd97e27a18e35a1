#include "read/sheet.h"
#include "read/illuminant.h"

#include "read/doubts.h"
#include "read/statistics.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <map>
#include <set>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kMostWarnings = 20;
constexpr double kFaintest = 5;        // no sheet is darker throughout
constexpr double kLightestPaper = 105; // L*
constexpr std::size_t kLongestInkName = 80;

std::string name_of(const Condition &condition)
{
    return condition ? fmt::format("M{}", *condition) : "no named condition";
}

std::string names_of(const std::set<Condition> &conditions)
{
    std::string out;
    for (const Condition &condition : conditions)
        out += fmt::format("{}{}", out.empty() ? "" : ", ", name_of(condition));
    return out;
}

// Keeps those whose places are wanted.
template <typename Value, typename Wanted> void keep_some(std::vector<Value> &all, Wanted wanted)
{
    std::size_t kept = 0;
    for (std::size_t i = 0; i < all.size(); ++i)
        if (wanted(i)) {
            if (kept != i)
                all[kept] = std::move(all[i]);
            ++kept;
        }
    all.resize(kept);
}

double largest_in(const std::vector<Patch> &patches)
{
    double largest = 0;
    for (const Patch &patch : patches)
        largest = std::max(largest, *std::max_element(patch.refl.begin(), patch.refl.end()));
    return largest;
}

} // namespace

std::string ink_name(std::string_view written) { return cut(printable(written), kLongestInkName); }

const Bands &Sheet::bands_at(const std::vector<double> &wavelengths, std::size_t line)
{
    if (!bands || bands->wavelengths() != wavelengths) {
        bands.emplace(wavelengths, line);
        warn_of(*bands, line);
    }
    return *bands;
}

void Sheet::warn_of(const Bands &used, std::size_t line)
{
    const Source source = used.source();
    if (const auto neighbours = used.out_of_order(); neighbours && !std::exchange(told_order, true))
        warn(line, fmt::format("the wavelengths are out of order, {:g} nm stands before {:g}: each "
                               "value is taken for its own wavelength",
                               neighbours->first, neighbours->second));
    if (source.interpolated && !std::exchange(told_interpolated, true))
        warn(line, "steps of 20 nm: the values between are interpolated by third-order Lagrange "
                   "polynomials (ASTM E2022)");
    if (source.held && !std::exchange(told_held, true))
        warn(line, fmt::format("the range is {:g} to {:g} nm: its last value is held up to {}",
                               source.first_nm, source.last_nm,
                               source.last_nm >= 700   ? "400 nm"
                               : source.first_nm > 400 ? "400 and 700 nm"
                                                       : "700 nm"));
}

void Sheet::add(Patch patch, Condition condition, std::size_t line, std::size_t setup)
{
    if (patches.empty())
        origin = bands ? bands->source() : Source{};
    patch.line = line;
    patches.push_back(std::move(patch));
    conditions.push_back(condition);
    if (told_setups.size() > 1)
        setups.push_back(setup);
}

void Sheet::tell_conditions(const std::vector<Condition> &told)
{
    for (std::size_t i = 0; i < told.size(); ++i)
        if (told[i]) {
            header.keep_of_row(conditions[i], told[i], conditions[i] == header.condition);
            conditions[i] = told[i];
        }
}

std::size_t Sheet::setup_number(const std::string &setup)
{
    const auto [at, added] = setup_numbers.try_emplace(upper(setup), told_setups.size());
    if (added)
        told_setups.push_back(setup);
    return at->second;
}

void Sheet::set_full_scale(double value, std::string_view keyword, std::size_t line)
{
    if (full_scale && *full_scale != value && reading.scale == Scale::automatic)
        throw InputError{line, fmt::format("{} says that white is {:g}, {} said {:g}", keyword,
                                           value, scale_by, *full_scale)};
    full_scale = value;
    scale_by = keyword;
}

void Sheet::set_usual_scale(double value, std::string_view kind)
{
    usual_scale = value;
    usually_by = kind;
}

void Sheet::warn(std::size_t line, const std::string &text)
{
    if (warnings.size() < kMostWarnings)
        warnings.push_back(fmt::format("{} {}", line ? fmt::format("{}:", line) : "", text));
    else if (warnings.size() == kMostWarnings)
        warnings.emplace_back(" more warnings are left out");
}

// Of several conditions one is kept: the one asked for, or else M1, which the standards of printing
// ask for, or else that of the first patch.
void Sheet::choose_condition()
{
    const std::set<Condition> present(conditions.begin(), conditions.end());
    Condition chosen = condition_in(reading.condition);
    if (chosen && !present.contains(chosen))
        throw InputError{0, fmt::format("no spectra under {}; the file has {}", name_of(chosen),
                                        names_of(present))};
    if (!chosen) {
        chosen = present.contains(1) ? 1 : conditions.front();
        if (present.size() > 1)
            warn(0, fmt::format("spectra under {}: those under {} are read, --condition chooses",
                                names_of(present), name_of(chosen)));
    }
    keep_some(patches, [&](std::size_t i) { return conditions[i] == chosen; });
    if (chosen)
        origin.condition = name_of(chosen);
    if (!setups.empty()) {
        keep_some(setups, [&](std::size_t i) { return conditions[i] == chosen; });
        choose_setup();
    }
}

// That of the first patch.
void Sheet::choose_setup()
{
    const std::size_t chosen = setups.front();
    origin.setup = told_setups[chosen];
    const auto other = std::find_if(setups.begin(), setups.end(),
                                    [=](std::size_t setup) { return setup != chosen; });
    if (other == setups.end())
        return;
    const auto told = [&](std::size_t setup) {
        return told_setups[setup].empty()
                   ? "none named"
                   : fmt::format("\"{}\"", cut(printable(told_setups[setup]), 120));
    };
    const auto left =
        setups.size() - static_cast<std::size_t>(std::count(setups.begin(), setups.end(), chosen));
    warn(patches[static_cast<std::size_t>(other - setups.begin())].line,
         fmt::format("geometry and backing of the first patch: {}; spectra of others, such as {}, "
                     "left out: {}",
                     told(chosen), told(*other), left));
    keep_some(patches, [&](std::size_t i) { return setups[i] == chosen; });
}

void Sheet::leave_out(std::string_view statistic, std::size_t line)
{
    left_out.push_back(in_quotes(statistic));
    left_out_line = left_out_line ? std::min(left_out_line, line) : line;
}

// Rows that are named as statistics and are those of the other rows, or have no device values where
// all patches above have some.
void Sheet::leave_out_statistics()
{
    constexpr std::ptrdiff_t kRowsOfStatistics = 12; // at the end, under any name
    std::vector<std::pair<Patch *, Statistic>> rows;
    std::vector<const Patch *> others;
    for (Patch &patch : patches) {
        auto statistic = statistic_named(patch.name);
        statistic = statistic ? statistic : statistic_named(patch.id);
        if (!statistic && patches.data() + patches.size() - &patch <= kRowsOfStatistics)
            statistic = statistic_in_words_of(patch.name);
        if (statistic)
            rows.emplace_back(&patch, *statistic);
        else
            others.push_back(&patch);
    }
    if (rows.empty())
        return;
    const bool devices =
        !others.empty() && std::none_of(others.begin(), others.end(),
                                        [](const Patch *patch) { return patch->device.empty(); });
    const std::size_t last = others.empty() ? 0 : others.back()->line;
    Statistics statistics(std::move(others), kind);
    std::vector<bool> is_out(patches.size());
    const Patch *kept = nullptr; // the first
    std::size_t count = 0;
    for (const auto &[row, statistic] : rows) {
        const std::string name = row->name.empty() ? row->id : row->name;
        const bool named = statistic_named(name).has_value();
        const bool holds = statistics.holds(statistic, *row);
        const bool by_place = named && devices && row->device.empty() && row->line > last;
        if (holds) {
            leave_out(name, row->line);
        } else if (by_place) {
            warn(row->line,
                 fmt::format("{} left out: named as a statistic and without the device values that "
                             "all patches have, though it is none of the other rows",
                             in_quotes(name)));
        } else if (named) {
            kept = kept ? kept : row;
            ++count;
        }
        is_out[static_cast<std::size_t>(row - patches.data())] = holds || by_place;
    }
    if (kept)
        warn(kept->line,
             fmt::format("{} is named as a statistic, but is none of the other rows{}: read as a "
                         "patch",
                         in_quotes(kept->name.empty() ? kept->id : kept->name), and_more(count)));
    keep_some(patches, [&](std::size_t i) { return !is_out[i]; });
}

// The place stands for an id that is missing, and the id for a name. Whether any patch has either.
bool Sheet::name_patches()
{
    bool named = false;
    for (std::size_t i = 0; i < patches.size(); ++i) {
        auto &[id, name, refl, device, lab, line] = patches[i];
        named = named || !id.empty() || !name.empty();
        if (id.empty())
            id = std::to_string(i + 1);
        if (name.empty())
            name = id;
    }
    return named;
}

// Paper with optical brightener reads up to 1.4.
double Sheet::largest_fraction() const { return fractions ? 3 : 2; }

void Sheet::bring_to_percent()
{
    const double largest = largest_in(patches);
    if (reading.scale != Scale::automatic) {
        full_scale = reading.scale == Scale::fraction ? 1 : 100;
        scale_by = "--scale";
    } else if (full_scale || usual_scale) {
        if (!full_scale) {
            full_scale = usual_scale;
            scale_by = usually_by;
        }
        const double percent = largest / *full_scale * 100;
        if (percent > 300 || percent <= 2)
            warn(0, fmt::format("by {} the largest reflectance is {:.3g} %; --scale sets the scale",
                                scale_by, percent));
    } else {
        full_scale = largest <= largest_fraction() ? 1 : 100;
        scale_by = "values";
    }
    origin.scale_by = scale_by;
    origin.scaled = *full_scale != 100;
    const double factor = 100 / *full_scale;
    for (Patch &patch : patches)
        for (double &value : patch.refl) {
            if (origin.scaled)
                value *= factor;
            if (!(std::abs(value) <= kLargest))
                throw InputError{patch.line, "a value is too large in percent"};
        }
    warn_of_scale(largest);
}

void Sheet::bring_inks_to_percent()
{
    double largest = 0;
    for (const Patch &patch : patches)
        for (const auto &[field, value] : patch.device)
            largest = std::max(largest, value);
    if (largest > 1)
        return;
    for (Patch &patch : patches)
        for (auto &[field, value] : patch.device)
            value = std::round(value * 1e8) / 1e6; // 0.07 is 7 %
}

// Nothing reflects this much: few papers and no inks have an L* above 105.
void Sheet::warn_of_scale(double largest)
{
    const bool guessed = scale_by == "values";
    const char *as = origin.scaled ? "a fraction" : "a percentage";
    if (guessed && largest < kFaintest && !(fractions && origin.scaled)) {
        warn(0, fmt::format("no keyword tells the scale: the largest reflectance, {:.3g}, is taken "
                            "for {}; --scale sets the scale",
                            largest, as));
        return;
    }
    if (largest * 100 / *full_scale <= kLightestPaper)
        return;
    for (const Patch &patch : patches) {
        std::array<double, 3> lab{};
        if (ReflToCIELAB(patch.refl.data(), D50_2DEG, lab.data()) && lab[0] > kLightestPaper) {
            const std::string how =
                guessed ? fmt::format("no keyword tells the scale: taken for {},", as)
                        : "by " + scale_by;
            warn(patch.line, fmt::format("{} the patch has an L* of {:.1f}; --scale sets the scale",
                                         how, lab[0]));
            return;
        }
    }
}

// X, Y and Z become L*a*b* under the illuminant that the file states, or else D50 and 2 degrees.
void Sheet::bring_to_lab(const Colours &colours)
{
    double largest = 0;
    for (const Patch &patch : patches)
        if (patch.lab)
            largest = std::max(largest, patch.lab->a); // Y
    const double factor = largest <= largest_fraction() ? 100 : 1;
    if (factor != 1)
        warn(0,
             fmt::format("the largest Y is {:.3g}: X, Y and Z are taken for fractions", largest));
    for (Patch &patch : patches)
        if (patch.lab) {
            const std::array<double, 3> xyz = {patch.lab->L * factor, patch.lab->a * factor,
                                               patch.lab->b * factor};
            std::array<double, 3> lab{};
            XYZToCIELab(xyz.data(), colours.illuminant.value_or(D50_2DEG), lab.data());
            patch.lab = {lab[0], lab[1], lab[2]};
        }
}

Measurement Sheet::measurement()
{
    if (patches.empty() && !left_out.empty())
        throw InputError{left_out_line, fmt::format("no patches, but {}", listed(left_out))};
    if (patches.empty())
        throw InputError{0, "neither spectra nor L*a*b* nor XYZ in this file"};
    if (kind == Kind::colours && !reading.colours)
        throw InputError{0, fmt::format("{} {} of {}, no spectra", patches.size(),
                                        patches.size() == 1 ? "patch" : "patches", colour_space)};
    choose_condition();
    leave_out_statistics();
    if (!left_out.empty())
        warn(left_out_line,
             fmt::format("{} left out: no patch, but {} of the other rows", listed(left_out),
                         left_out.size() == 1 ? "a statistic" : "statistics"));
    const bool has_ids = std::any_of(patches.begin(), patches.end(),
                                     [](const Patch &patch) { return !patch.id.empty(); });
    const bool named = name_patches();
    if (kind != Kind::colours)
        bring_to_percent();
    const Colours colours = header.colours();
    if (!header.other_illuminant.empty())
        warn(0, fmt::format("the illuminant is said to be {}, and {} elsewhere: the first is taken",
                            in_quotes(header.illuminant), in_quotes(header.other_illuminant)));
    if (kind == Kind::colours && header.illuminant.empty() && colours.illuminant)
        warn(0, fmt::format("it does not say for which illuminant its colours are, only the "
                            "observer; {} is taken",
                            sheets::name_of(*colours.illuminant)));
    if (!header.later_illuminant.empty())
        warn(0, fmt::format("a later table names the illuminant {}, the first none: D50 is taken "
                            "for both; --illuminant chooses",
                            in_quotes(header.later_illuminant)));
    if (!header.other_observer.empty())
        warn(0, fmt::format("the observer is said to be {}, and {} elsewhere: the first is taken",
                            in_quotes(header.observer), in_quotes(header.other_observer)));
    if (!header.other_condition.empty())
        warn(0, fmt::format("the condition is said to be {}, and {} elsewhere: the first is taken",
                            name_of(header.condition), in_quotes(header.other_condition)));
    if (const auto &told = header.told_apart;
        told && !(told->by_keyword && origin.condition == name_of(told->given)))
        warn(0, fmt::format("the condition of a patch is said to be {} by {} and {} by {}column: "
                            "the latter is taken",
                            name_of(told->given), told->by_keyword ? "a keyword" : "a column",
                            name_of(told->own), told->by_keyword ? "a " : "another "));
    if (!header.several_conditions.empty() && header.condition)
        warn(0, fmt::format("several conditions in {}: {} is taken",
                            in_quotes(header.several_conditions), name_of(header.condition)));
    if (!header.unknown_filter.empty())
        warn(0, fmt::format("the filter or condition {} tells none that is known here (M0 to M3)",
                            in_quotes(header.unknown_filter)));
    if (xyz)
        bring_to_lab(colours);
    for (const Doubt &doubt : doubts_about(patches, kind, origin.held))
        warn(doubt.line, doubt.text);
    if (kind == Kind::transmission)
        warn(0, "transmission, not reflectance: there is no paper");
    return {.file = {},
            .patches = std::move(patches),
            .named = named,
            .has_ids = has_ids,
            .kind = kind,
            .collection = collection,
            .source = std::move(origin),
            .colours = colours,
            .origin = std::move(header.origin),
            .warnings = std::move(warnings)};
}

} // namespace vantrel::sheets
