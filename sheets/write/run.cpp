// A press run as table, JSON and columns.

#include "judge/names.h"
#include "read/text.h"
#include "write/json_text.h"
#include "write/limits.h"
#include "write/result.h"
#include "write/table_text.h"

#include <fmt/format.h>
#include <fmt/ranges.h>

#include <algorithm>
#include <cmath>
#include <tuple>
#include <utility>

namespace vantrel::sheets {
namespace {

std::string shown(const RunSeries &series, const std::optional<double> &value)
{
    return fixed(value, decimals_of(series.measurand.attribute));
}

// A slope adds up over the sheets: one decimal more.
std::string slope_shown(const RunSeries &series, double value)
{
    return fixed(value, decimals_of(series.measurand.attribute) + 1);
}

// "1.411 to 1.511", "up to 3.50"
std::string limits_of(const RunSeries &series)
{
    if (!series.limits)
        return "";
    const Limits &limits = *series.limits;
    return limits.low
               ? fmt::format("{} to {}", shown(series, limits.low), shown(series, limits.high))
               : "up to " + shown(series, limits.high);
}

// "6, 9"
std::string numbers_of(const std::vector<std::size_t> &sheets)
{
    std::string out;
    for (const std::size_t sheet : sheets)
        out += fmt::format("{}{}", out.empty() ? "" : ", ", sheet + 1);
    return out;
}

// "rises 0.012 ± 0.003 a sheet without sheet 6"; empty where it does neither.
std::string drift_of(const RunSeries &series)
{
    const auto &drift = series.trend.drift;
    if (!drift || !drift->significant())
        return "";
    const auto &apart = series.outliers;
    return fmt::format("{} {} ± {} a sheet{}", drift->slope > 0 ? "rises" : "falls",
                       slope_shown(series, std::fabs(drift->slope)),
                       slope_shown(series, drift->uncertainty),
                       apart.empty() ? ""
                                     : fmt::format(" without sheet{} {}",
                                                   apart.size() > 1 ? "s" : "", numbers_of(apart)));
}

std::string sheet_of(const Run &run, std::size_t sheet)
{
    return fmt::format("sheet {} ({})", sheet + 1, run.sheets[sheet].file);
}

// What the series says of the press, in words; empty where it says nothing.
std::string finding_of(const Run &run, const RunSeries &series)
{
    const auto &limits = series.limits;
    const std::string title = series.measurand.title();
    std::string drift = drift_of(series);
    if (series.leaves_at)
        drift +=
            fmt::format("; it leaves {} at sheet {}",
                        shown(series, series.trend.drift->slope > 0 ? limits->high : limits->low),
                        *series.leaves_at + 1);
    if (series.first_outside) {
        const std::size_t sheet = *series.first_outside;
        return fmt::format("{} {} {} with {} at {}{}{}", title, limits->low ? "left" : "exceeded",
                           limits->low ? limits_of(series) : shown(series, limits->high),
                           shown(series, series.sheets[sheet]->value), sheet_of(run, sheet),
                           drift.empty() ? "" : "; it ", drift);
    }
    const bool unlimited = series.measurand.attribute == Attribute::density && !limits;
    return (series.leaves_at || unlimited) && !drift.empty() ? fmt::format("{} {}", title, drift)
                                                             : "";
}

// "Solids ΔE00, largest: above 3.5 from sheet 8 (sheet_08.txt) on, at most 3.61 at M100"; empty
// where the limit is held.
std::string finding_of(const Run &run, const LimitResult &worst, const LimitPlaces &places)
{
    const std::string title = fmt::format("{} {}, {}", patches_of(worst.limit),
                                          title_of(worst.limit), title_of(worst.limit.statistic));
    if (places.first_failed)
        return fmt::format("{}: above {:g} first at {}, at most {} at {} on sheet {}", title,
                           worst.limit.limit, sheet_of(run, *places.first_failed),
                           fixed(worst.measured, decimals_of(worst)), worst.worst,
                           places.worst + 1);
    if (worst.verdict == Verdict::passed)
        return "";
    const std::string reason =
        worst.note.empty() ? fmt::format("{} of {} could be judged", worst.judged, worst.patches)
                           : worst.note;
    return fmt::format("{}: {} on {}", title, reason, sheet_of(run, places.worst));
}

// Zones that leave the limits of the mean before it does; empty where none does.
std::string zones_outside(const Run &run, const RunSeries &series)
{
    std::size_t first = series.first_outside.value_or(series.sheets.size());
    std::vector<std::string> zones;
    for (std::size_t i = 0; series.limits && i < first; ++i)
        if (series.sheets[i])
            for (const auto &[zone, value] : series.sheets[i]->zones)
                if (!series.limits->hold(value)) {
                    zones.push_back(fmt::format("zone {} with {}", zone, shown(series, value)));
                    first = i;
                }
    if (zones.empty())
        return "";
    return fmt::format("{}: outside {} at {}: {}; the limit is for the mean of zones",
                       series.measurand.title(),
                       series.limits->low ? limits_of(series) : shown(series, series.limits->high),
                       sheet_of(run, first), listed(zones));
}

// Sheets and zones that stand apart, each with its readings.
void add_oddities(const Run &run, std::vector<std::string> &out)
{
    std::map<std::size_t, std::vector<std::string>> sheets;
    std::map<int, std::vector<std::string>> zones;
    for (const RunSeries &series : run.series) {
        for (const std::size_t sheet : series.outliers)
            sheets[sheet].push_back(fmt::format("{} {}", series.measurand.title(),
                                                shown(series, series.sheets[sheet]->value)));
        for (const auto &[zone, difference] : series.odd_zones)
            zones[zone].push_back(fmt::format("{} {}{}", series.measurand.title(),
                                              difference > 0 ? "+" : "",
                                              shown(series, difference)));
    }
    std::map<std::pair<std::size_t, int>, std::vector<std::string>> single;
    for (const RunSeries &series : run.series)
        for (const auto &[sheet, zone, difference] : series.zone_outliers)
            single[{sheet, zone}].push_back(fmt::format("{} {}{}", series.measurand.title(),
                                                        difference > 0 ? "+" : "",
                                                        shown(series, difference)));
    for (const auto &[sheet, titles] : sheets)
        out.push_back(fmt::format("{} stands apart from the others: {}", sheet_of(run, sheet),
                                  listed(titles)));
    for (const auto &[zone, titles] : zones)
        out.push_back(fmt::format("zone {} prints unlike the others: {}", zone, listed(titles)));
    for (const auto &[place, titles] : single)
        out.push_back(fmt::format("zone {} of {} prints unlike that of the other sheets: {}",
                                  place.second, sheet_of(run, place.first), listed(titles)));
}

std::vector<std::string> findings_of(const Run &run)
{
    std::vector<std::string> out;
    const auto add = [&out](std::string finding) {
        if (!finding.empty())
            out.push_back(std::move(finding));
    };
    for (const RunSeries &series : run.series) {
        add(finding_of(run, series));
        add(zones_outside(run, series));
    }
    for (std::size_t i = 0; i < run.limits.size(); ++i)
        if (!run.limit_places[i].is_told)
            add(finding_of(run, run.limits[i], run.limit_places[i]));
    add_oddities(run, out);
    for (const std::string &gap : run.gaps)
        out.push_back(gap);
    for (const std::string &reason : run.unread)
        out.push_back("not judged: " + reason);
    return out;
}

std::string counted(std::size_t number, const char *noun)
{
    return fmt::format("{} {}{}", number, noun, number == 1 ? "" : "s");
}

std::string head_of(const Run &run)
{
    std::string out = fmt::format("{} {}, aims {}", run.sheets.size(),
                                  run.sheets.size() == 1 ? "sheet" : "sheets", run.aims);
    if (run.by_date)
        out += fmt::format(", {} to {}", run.sheets.front().created, run.sheets.back().created);
    else if (run.sheets.size() > 1)
        out += ", as they were named";
    else if (const std::string &created = run.sheets[0].created; !created.empty())
        out += ", " + created;
    out += fmt::format("\n{}, {}", said(run.illuminant), status_name(run.status));
    for (const auto &[what, text] : {std::pair{"job", &run.job},
                                     {"instrument", &run.instrument},
                                     {"condition", &run.condition}})
        if (!text->empty())
            out += fmt::format("; {} {}", what, *text);
    return out;
}

std::string word_of(const Run &run)
{
    return run.verdict ? std::string(name_of(*run.verdict)) : "none";
}

// "judged 108 of 108 patches by 18 of 18 aims on each sheet"
std::string coverage_of(const Run &run)
{
    const auto fewer = [](const RunSheet &one, const RunSheet &other) {
        const auto judged = [](const Coverage &coverage) {
            return std::tuple(coverage.no_repeats == 0, coverage.aims, coverage.patches);
        };
        return judged(one.coverage) < judged(other.coverage);
    };
    const auto [least, most] = std::minmax_element(run.sheets.begin(), run.sheets.end(), fewer);
    const bool zoned = std::any_of(run.sheets.begin(), run.sheets.end(),
                                   [](const RunSheet &sheet) { return sheet.zones.size() > 1; });
    return fmt::format("{}{}{}", told(least->coverage),
                       fewer(*least, *most) ? fmt::format(" on sheet {}, more on others",
                                                          least - run.sheets.begin() + 1)
                                            : " on each sheet",
                       zoned ? ", zones by their mean" : "");
}

// "failed: 2 of 5 limits failed on 9 sheets; 1 sheet could not be judged; 1 gap; judged …"
std::string sentence_of(const Run &run)
{
    std::string out = run.limits.empty()
                          ? word_of(run) + (run.verdict ? ": " : ", ") + "no limits are set"
                          : fmt::format("{}: {} on {}", word_of(run), counts_of(run.limits),
                                        counted(run.sheets.size(), "sheet"));
    if (!run.unread.empty())
        out += fmt::format("; {} could not be judged", counted(run.unread.size(), "sheet"));
    if (!run.gaps.empty())
        out += "; " + counted(run.gaps.size(), "gap");
    return out + "; " + coverage_of(run);
}

void add_series(Lines &lines, const Run &run)
{
    lines.add("");
    lines.add(fmt::format("{:<36}{:>9}{:>18}{:>9}{:>8}{:>9}{:>8}{:>9}{:>8}", "Reading", "Aim",
                          "Limits", "Mean", "SD", "Slope", "±", "Last", "Zones±"));
    for (const RunSeries &series : run.series) {
        const Trend &trend = series.trend;
        const auto &last = series.sheets.back();
        const auto drift = [&](double Drift::*of) {
            return trend.drift ? slope_shown(series, (*trend.drift).*of) : "";
        };
        lines.add(fmt::format(
            "{:<36}{:>9}{:>18}{:>9}{:>8}{:>9}{:>8}{:>9}{:>8}", cut(series.measurand.title(), 35),
            shown(series, series.aim), limits_of(series), shown(series, trend.mean),
            shown(series, trend.deviation), drift(&Drift::slope), drift(&Drift::uncertainty),
            last ? shown(series, last->value) : "", last ? shown(series, last->deviation) : ""));
    }
}

std::string limits_title(const Run &run)
{
    return "Limits: " + run.tolerances + ", on the sheet that is farthest from each";
}

Json number_of(const std::optional<std::size_t> &sheet)
{
    return sheet ? Json(*sheet + 1) : Json();
}

Json series_json(const RunSeries &series)
{
    const auto per_sheet = [&](auto value) {
        Json out = Json::array();
        for (const auto &sheet : series.sheets)
            out.push_back(sheet ? Json(value(*sheet)) : Json());
        return out;
    };
    const auto zones_json = [](const std::map<int, double> &zones) {
        Json out = Json::object();
        for (const auto &[zone, value] : zones)
            out[std::to_string(zone)] = value;
        return out;
    };
    Json outliers = Json::array(), zone_outliers = Json::array();
    for (const std::size_t sheet : series.outliers)
        outliers.push_back(sheet + 1);
    for (const auto &[sheet, zone, difference] : series.zone_outliers)
        zone_outliers.push_back({{"sheet", sheet + 1}, {"zone", zone}, {"difference", difference}});
    const auto drift = [&](double Drift::*of) {
        return series.trend.drift ? Json((*series.trend.drift).*of) : Json();
    };
    const auto limit = [&](std::optional<double> Limits::*of) {
        return series.limits ? or_null((*series.limits).*of) : Json();
    };
    const Measurand &measurand = series.measurand;
    return {{"title", measurand.title()},
            {"attribute", key_of(measurand.attribute)},
            {"subject", measurand.subject},
            {"nominal", measurand.nominal},
            {"sctv", measurand.sctv},
            {"decimals", decimals_of(measurand.attribute)},
            {"aim", or_null(series.aim)},
            {"low", limit(&Limits::low)},
            {"high", limit(&Limits::high)},
            {"mean", series.trend.mean},
            {"deviation", or_null(series.trend.deviation)},
            {"slope", drift(&Drift::slope)},
            {"slope_uncertainty", drift(&Drift::uncertainty)},
            {"first_outside", number_of(series.first_outside)},
            {"leaves_at", number_of(series.leaves_at)},
            {"outliers", outliers},
            {"odd_zones", zones_json(series.odd_zones)},
            {"zone_outliers", zone_outliers},
            {"values", per_sheet([](const OverZones &sheet) { return sheet.value; })},
            {"lowest", per_sheet([](const OverZones &sheet) { return sheet.low; })},
            {"highest", per_sheet([](const OverZones &sheet) { return sheet.high; })},
            {"spread", per_sheet([](const OverZones &sheet) { return or_null(sheet.deviation); })},
            {"zones", per_sheet([&](const OverZones &sheet) { return zones_json(sheet.zones); })}};
}

Json sheet_json(const RunSheet &sheet)
{
    return {{"file", sheet.file},
            {"created", sheet.created},
            {"verdict", sheet.verdict ? Json(name_of(*sheet.verdict)) : Json()},
            {"judged", coverage_json(sheet.coverage)},
            {"zones", sheet.zones}};
}

// Verdict, findings and warnings as rows.
Flat flat_of_statements(const Run &run)
{
    std::vector<Statement> rows = {{"Verdict", word_of(run), sentence_of(run)},
                                   {"Job", "", run.job},
                                   {"Instrument", "", run.instrument},
                                   {"Condition", "", run.condition}};
    for (const std::string &finding : findings_of(run))
        rows.push_back({"Finding", "", finding});
    if (!run.advice.empty())
        rows.push_back({"Advice", "", advice_from()});
    for (const std::string &warning : run.warnings)
        rows.push_back({"Warning", "", warning});
    if (std::any_of(run.sheets.begin(), run.sheets.end(),
                    [](const RunSheet &sheet) { return !sheet.zones.empty(); }))
        rows.push_back({"Warning", "",
                        "the readings of single zones are left out here: --format json "
                        "and html have them"});
    return flat_of(std::move(rows), "Verdict, findings and warnings");
}

// "1, 2, 3"
std::string joined(const std::vector<int> &zones)
{
    return fmt::format("{}", fmt::join(zones, ", "));
}

Flat flat_of_sheets(const Run &run)
{
    const std::vector<RunSheet> &sheets = run.sheets;
    Flat flat;
    flat.description = "Sheets";
    flat.rows = sheets.size();
    flat.text("name", "FILE", [&sheets](std::size_t i) { return sheets[i].file; });
    flat.exact("sheet", "SHEET", [](std::size_t i) { return static_cast<double>(i + 1); });
    flat.text("created", "CREATED", [&sheets](std::size_t i) { return sheets[i].created; });
    flat.text("zones", "ZONES", [&sheets](std::size_t i) { return joined(sheets[i].zones); });
    flat.text("verdict", "VERDICT", [&sheets](std::size_t i) {
        return sheets[i].verdict ? std::string(name_of(*sheets[i].verdict)) : "";
    });
    flat.text("note", "NOTE", [&sheets](std::size_t i) { return told(sheets[i].coverage); });
    return flat;
}

} // namespace

void write_table(const Run &run, const Sink &sink, const TableStyle &)
{
    Lines lines(sink);
    lines.add(head_of(run));
    lines.add("Verdict: " + sentence_of(run));
    for (const std::string &finding : findings_of(run))
        lines.add("- " + finding);
    add_series(lines, run);
    std::vector<std::string> sheets;
    for (const LimitPlaces &places : run.limit_places)
        sheets.push_back(fmt::format("sheet {}", places.worst + 1));
    add_limits(lines, limits_title(run), run.limits, sheets);
    add_advice(lines, "Solids of the last sheet", run.advice);
}

void write_json(const Run &run, const Sink &sink)
{
    Json sheets = Json::array(), limits = limits_json(run.limits);
    for (const RunSheet &sheet : run.sheets)
        sheets.push_back(sheet_json(sheet));
    for (std::size_t i = 0; i < limits.size(); ++i) {
        limits[i]["sheet"] = run.limit_places[i].worst + 1;
        limits[i]["first_failed"] = number_of(run.limit_places[i].first_failed);
    }
    Json head = {{"command", "run"},
                 {"aims", run.aims},
                 {"illuminant", name_of(run.illuminant)},
                 {"illuminant_by", run.illuminant.by},
                 {"status", status_name(run.status)},
                 {"job", run.job},
                 {"instrument", run.instrument},
                 {"condition", run.condition},
                 {"verdict", run.verdict ? Json(word_of(run)) : Json()},
                 {"says", sentence_of(run)},
                 {"findings", findings_of(run)},
                 {"warnings", run.warnings},
                 {"by_date", run.by_date},
                 {"sheets", sheets},
                 {"unread", run.unread},
                 {"gaps", run.gaps},
                 {"tolerances", run.tolerances.empty() ? Json() : Json(run.tolerances)},
                 {"limits", limits}};
    add_advice(head, run.advice);
    write_with_array(
        head, "series", run.series.size(),
        [&](std::size_t i) { return series_json(run.series[i]).dump(); }, sink);
    sink.write("\n");
}

std::vector<Flat> flat_of(const Run &run)
{
    Flat flat;
    flat.description =
        fmt::format("Run of {} sheets, aims {}, {}, {}. Verdict: {}", run.sheets.size(), run.aims,
                    name_of(run.illuminant), status_name(run.status), sentence_of(run));
    flat.rows = run.series.size();
    const std::vector<RunSeries> &all = run.series;
    const auto number = [&](const char *name, auto get) {
        flat.number(name, upper(name),
                    [&all, get](std::size_t i) -> std::optional<double> { return get(all[i]); });
    };
    const auto limit = [](std::optional<double> Limits::*of) {
        return [of](const RunSeries &series) {
            return series.limits ? (*series.limits).*of : std::nullopt;
        };
    };
    const auto drift = [](double Drift::*of) {
        return [of](const RunSeries &series) {
            return series.trend.drift ? std::optional((*series.trend.drift).*of) : std::nullopt;
        };
    };
    const auto sheet = [&](const char *name, std::optional<std::size_t> RunSeries::*of) {
        flat.exact(name, upper(name), [&all, of](std::size_t i) -> std::optional<double> {
            const auto found = all[i].*of;
            return found ? std::optional(static_cast<double>(*found + 1)) : std::nullopt;
        });
    };
    flat.text("name", "SAMPLE_NAME", [&all](std::size_t i) { return all[i].measurand.title(); });
    flat.text("attribute", "ATTRIBUTE",
              [&all](std::size_t i) { return std::string(key_of(all[i].measurand.attribute)); });
    flat.text("subject", "SUBJECT", [&all](std::size_t i) { return all[i].measurand.subject; });
    flat.exact("nominal", "NOMINAL", [&all](std::size_t i) { return all[i].measurand.nominal; });
    number("aim", [](const RunSeries &series) { return series.aim; });
    number("low", limit(&Limits::low));
    number("high", limit(&Limits::high));
    number("mean", [](const RunSeries &series) { return series.trend.mean; });
    number("deviation", [](const RunSeries &series) { return series.trend.deviation; });
    number("slope", drift(&Drift::slope));
    number("slope_uncertainty", drift(&Drift::uncertainty));
    sheet("first_outside", &RunSeries::first_outside);
    sheet("leaves_at", &RunSeries::leaves_at);
    flat.text("outliers", "OUTLIERS",
              [&all](std::size_t i) { return numbers_of(all[i].outliers); });
    for (std::size_t k = 0; k < run.sheets.size(); ++k)
        flat.number(fmt::format("{} {}", k + 1, run.sheets[k].file), fmt::format("SHEET_{}", k + 1),
                    [&all, k](std::size_t i) -> std::optional<double> {
                        const auto &one = all[i].sheets[k];
                        return one ? std::optional(one->value) : std::nullopt;
                    });
    for (std::size_t k = 0; k < run.sheets.size(); ++k)
        flat.number(fmt::format("{} zones SD", k + 1), fmt::format("ZONES_SD_{}", k + 1),
                    [&all, k](std::size_t i) {
                        const auto &one = all[i].sheets[k];
                        return one ? one->deviation : std::nullopt;
                    });
    std::vector<Flat> tables = {flat, flat_of_sheets(run)};
    if (!run.advice.empty())
        tables.push_back(flat_of(run.advice, "Solids of the last sheet"));
    if (!run.limits.empty()) {
        tables.push_back(flat_of(run.limits, "aims", limits_title(run)));
        const std::vector<LimitPlaces> &places = run.limit_places;
        tables.back().exact("sheet", "SHEET", [&places](std::size_t i) {
            return static_cast<double>(places[i].worst + 1);
        });
    }
    tables.push_back(flat_of_statements(run));
    return tables;
}

} // namespace vantrel::sheets
