#include "judge/run.h"

#include "judge/dates.h"
#include "judge/run_limits.h"
#include "read/text.h"

#include <fmt/format.h>
#include <fmt/ranges.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <numeric>
#include <set>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kAhead = 10; // sheets for which the drift is followed

OverZones over_zones(const ZoneReading &reading)
{
    Series values;
    OverZones out{.value = reading.value,
                  .low = reading.value,
                  .high = reading.value,
                  .deviation = {},
                  .zones = reading.zones};
    for (const auto &[zone, value] : reading.zones) {
        values.emplace_back(value);
        out.low = std::fmin(values.size() > 1 ? out.low : value, value);
        out.high = std::fmax(values.size() > 1 ? out.high : value, value);
    }
    if (!values.empty())
        out.deviation = trend_of(values)->deviation;
    return out;
}

// By how much each zone of each sheet is off the middle of the sheet's zones.
std::map<int, Series> zone_series(const RunSeries &series)
{
    std::map<int, Series> out;
    for (std::size_t i = 0; i < series.sheets.size(); ++i) {
        if (!series.sheets[i])
            continue;
        Series values;
        for (const auto &[zone, value] : series.sheets[i]->zones)
            values.emplace_back(value);
        const double middle = median_of(values);
        for (const auto &[zone, value] : series.sheets[i]->zones) {
            Series &own = out[zone];
            own.resize(series.sheets.size());
            own[i] = value - middle;
        }
    }
    return out;
}

// Zones that are apart from the others on most sheets, and zones of single sheets that are apart
// from the same zone on the others.
void find_odd_zones(RunSeries &series)
{
    const double least = apart_by(series.measurand.attribute);
    Series middles;
    std::vector<int> zones;
    for (const auto &[zone, own] : zone_series(series)) {
        zones.push_back(zone);
        middles.emplace_back(median_of(own));
        for (const std::size_t sheet : outliers_about_slope(own, least))
            series.zone_outliers.push_back({sheet, zone, *own[sheet] - median_of(own)});
    }
    const double middle = median_of(middles);
    for (const std::size_t i : outliers_of(middles, least))
        series.odd_zones[zones[i]] = *middles[i] - middle;
}

} // namespace

RunJudge::RunJudge(Measurement aims, RunRequest request)
    : aims(std::move(aims)), request(std::move(request))
{
    for (Patch &patch : this->aims.patches)
        take_zone(patch);
}

void RunJudge::add(const Measurement &sheet)
{
    try {
        std::vector<std::string> told; // by compare() too
        if (!illuminant)
            illuminant = illuminant_for(request.illuminant, {&aims, &sheet}, told);
        CompareRequest beside;
        beside.metrics = {usual_metric(Formula::de2000)};
        beside.illuminant = illuminant->illuminant;
        beside.status = request.status;
        beside.tolerances = request.tolerances;
        beside.advice = true;
        beside.paper = request.paper;
        // Before the entry: GCC 12 destroys twice what an aggregate holds when a member throws.
        SheetReadings readings = readings_of(aims, sheet, beside, request.order);
        Entry entry{.sheet = {.file = sheet.file, .created = sheet.origin.created},
                    .readings = std::move(readings),
                    .origin = sheet.origin,
                    .condition = sheet.source.condition};
        entry.sheet.coverage = entry.readings.coverage;
        entry.sheet.verdict = entry.readings.verdict;
        std::set<int> zones;
        for (const ZoneReading &reading : entry.readings.readings)
            for (const auto &[zone, value] : reading.zones)
                zones.insert(zone);
        entry.sheet.zones.assign(zones.begin(), zones.end());
        if (entries.empty())
            unserved = entry.readings.unserved;
        std::erase_if(unserved, [&own = entry.readings.unserved](const std::string &aim) {
            return std::find(own.begin(), own.end(), aim) == own.end();
        });
        entry.readings.unserved = {};
        entries.push_back(std::move(entry));
    } catch (const RequestError &error) {
        add_unread(error.message.starts_with(sheet.file)
                       ? error.message
                       : fmt::format("{}: {}", sheet.file, error.message));
    }
}

void RunJudge::add_unread(const std::string &reason) { unread.push_back(reason); }

void RunJudge::sort_by_date(Run &run)
{
    std::vector<std::array<std::optional<Date>, 2>> dates;
    std::vector<std::string> undated;
    bool known = true, of_one_kind = true;
    std::string ambiguous;
    for (const Entry &entry : entries) {
        const std::string &created = entry.sheet.created;
        dates.push_back(dates_in(created));
        if (created.empty())
            undated.push_back(entry.sheet.file);
        else if (!dates.back()[0])
            run.warnings.push_back(fmt::format("{}: {} is no date that is known", entry.sheet.file,
                                               in_quotes(created)));
        else if (ambiguous.empty() && dates.back()[0]->seconds != dates.back()[1]->seconds)
            ambiguous = fmt::format("{} of {}", in_quotes(created), entry.sheet.file);
        known = known && dates.back()[0];
        of_one_kind = of_one_kind && known && dates.back()[0]->kind == dates[0][0]->kind;
    }
    if (entries.size() == 1)
        return;
    std::array<std::vector<std::size_t>, 2> orders;
    for (std::size_t way = 0; known && way < orders.size(); ++way) {
        orders[way].resize(entries.size());
        std::iota(orders[way].begin(), orders[way].end(), 0U);
        std::stable_sort(orders[way].begin(), orders[way].end(), [&](std::size_t a, std::size_t b) {
            return dates[a][way]->seconds < dates[b][way]->seconds;
        });
    }
    run.by_date = of_one_kind && orders[0] == orders[1];
    if (!undated.empty())
        run.warnings.push_back("without a date: " + listed(undated));
    if (!run.by_date) {
        run.warnings.push_back(fmt::format(
            "the sheets stand as they were named: {}",
            !known         ? "not each has a date that is known"
            : !of_one_kind ? "not all dates have a time of day, or not all a time zone"
                           : ambiguous + " does not tell whether day or month comes first"));
        return;
    }
    std::vector<Entry> sorted;
    std::vector<std::string> same;
    for (const std::size_t place : orders[0]) {
        const auto same_date = [&](std::size_t other) {
            return other != place && dates[other][0]->seconds == dates[place][0]->seconds;
        };
        if (std::any_of(orders[0].begin(), orders[0].end(), same_date))
            same.push_back(entries[place].sheet.file);
        sorted.push_back(std::move(entries[place]));
    }
    entries = std::move(sorted);
    if (!same.empty())
        run.warnings.push_back(
            fmt::format("of one date, and as they were named: {}", listed(same)));
}

// By attribute, then as the sheets first have them.
void RunJudge::add_series(Run &run) const
{
    std::map<Measurand, std::size_t> places;
    for (std::size_t i = 0; i < entries.size(); ++i)
        for (const ZoneReading &reading : entries[i].readings.readings) {
            const auto [place, is_new] = places.try_emplace(reading.measurand, run.series.size());
            if (is_new)
                run.series.push_back({.measurand = reading.measurand,
                                      .aim = reading.aim,
                                      .sheets = decltype(RunSeries::sheets)(entries.size())});
            run.series[place->second].sheets[i] = over_zones(reading);
        }
    std::stable_sort(run.series.begin(), run.series.end(), [](const auto &a, const auto &b) {
        return a.measurand.attribute < b.measurand.attribute;
    });
}

void RunJudge::judge(RunSeries &series) const
{
    for (const Tolerance &limit : request.tolerances.limits)
        bound(series, limit);
    Series values;
    for (const auto &sheet : series.sheets)
        values.push_back(sheet ? std::optional(sheet->value) : std::nullopt);
    series.outliers = outliers_about_slope(values, apart_by(series.measurand.attribute));
    series.trend = trend_of(values, series.outliers).value();
    find_odd_zones(series);
    if (!series.limits)
        return;
    series.first_outside = first_outside(values, *series.limits);
    if (series.trend.drift) {
        for (const std::size_t sheet : series.outliers)
            values[sheet].reset();
        series.leaves_at = leaves_at(*series.trend.drift, *series.limits, values, kAhead);
    }
}

// What a sheet lacks of what any other has.
void RunJudge::find_gaps(Run &run) const
{
    for (std::size_t i = 0; i < entries.size(); ++i) {
        std::vector<std::string> lacking;
        struct Zone {
            std::size_t readings = 0; // of all
            std::vector<std::string> lacking;
        };
        std::map<int, Zone> zones;
        for (const RunSeries &series : run.series) {
            std::set<int> known;
            for (const auto &sheet : series.sheets)
                if (sheet)
                    for (const auto &[zone, value] : sheet->zones)
                        known.insert(zone);
            if (!series.sheets[i])
                lacking.push_back(series.measurand.title());
            else
                for (const int zone : known) {
                    zones[zone].readings += 1;
                    if (!series.sheets[i]->zones.contains(zone))
                        zones[zone].lacking.push_back(series.measurand.title());
                }
        }
        const std::string &file = entries[i].sheet.file;
        if (const std::size_t means = entries[i].sheet.coverage.no_repeats)
            run.gaps.push_back(fmt::format("{}: {} mean{} of no repeats, not judged", file, means,
                                           means == 1 ? "" : "s"));
        if (!lacking.empty())
            run.gaps.push_back(fmt::format("{}: no {}", file, listed(lacking)));
        std::map<std::string, std::vector<int>> same; // zones by what they lack
        for (const auto &[number, zone] : zones)
            if (zone.lacking.size() == zone.readings)
                same["missing"].push_back(number);
            else if (!zone.lacking.empty())
                same["without " + listed(zone.lacking)].push_back(number);
        for (const auto &[what, numbers] : same)
            run.gaps.push_back(fmt::format("{}: zone{} {} {}", file, numbers.size() == 1 ? "" : "s",
                                           fmt::join(numbers, ", "), what));
    }
}

void RunJudge::add_limits(Run &run) const
{
    for (std::size_t k = 0; k < request.tolerances.limits.size(); ++k) {
        LimitResult worst = entries[0].readings.limits[k];
        LimitPlaces places;
        for (std::size_t i = 0; i < entries.size(); ++i) {
            const LimitResult &result = entries[i].readings.limits[k];
            const bool worse_verdict = worse(result.verdict, worst.verdict) != worst.verdict;
            const bool farther = result.verdict == worst.verdict &&
                                 result.measured > worst.measured; // none is least
            if (worse_verdict || farther) {
                worst = result;
                places.worst = i;
            }
            if (result.verdict == Verdict::failed && !places.first_failed)
                places.first_failed = i;
        }
        places.is_told =
            std::any_of(run.series.begin(), run.series.end(), [&](const RunSeries &series) {
                return series.first_outside && is_about(worst.limit, series.measurand);
            });
        run.limits.push_back(std::move(worst));
        run.limit_places.push_back(places);
    }
    if (!run.limits.empty())
        run.verdict = Verdict::passed;
    const auto take = [&run](const std::optional<Verdict> &verdict) {
        if (verdict)
            run.verdict = worse(run.verdict.value_or(*verdict), *verdict);
    };
    if (!run.unread.empty() || !run.gaps.empty())
        take(Verdict::incomplete);
    for (const RunSheet &sheet : run.sheets)
        take(sheet.verdict);
}

// Of how few sheets no more can be said.
void RunJudge::warn_of_few(Run &run) const
{
    const std::size_t sheets = entries.size();
    if (sheets < kFewestOfOutliers)
        run.warnings.push_back(fmt::format(
            "{} sheet{}: {}that a sheet stands apart is told of {} or more", sheets,
            sheets == 1 ? "" : "s",
            sheets < kFewestOfDrift ? fmt::format("a slope is told of {} or more, ", kFewestOfDrift)
                                    : "",
            kFewestOfOutliers));
    std::size_t zones = 0;
    for (const RunSheet &sheet : run.sheets)
        zones = std::max(zones, sheet.zones.size());
    if (zones > 1 && zones < kFewestOfOutliers)
        run.warnings.push_back(
            fmt::format("{} zones: that a zone prints unlike the others is told of {} or more",
                        zones, kFewestOfOutliers));
}

// For the last sheet, even if that is unlike the others.
void RunJudge::add_advice(Run &run) const
{
    run.advice = entries.back().readings.advice;
    const std::size_t last = entries.size() - 1;
    const bool apart =
        std::any_of(run.series.begin(), run.series.end(), [last](const RunSeries &series) {
            return std::find(series.outliers.begin(), series.outliers.end(), last) !=
                   series.outliers.end();
        });
    if (apart && !run.advice.empty())
        run.warnings.push_back(fmt::format("the advice is for the last sheet, {}, which stands "
                                           "apart from the others",
                                           entries[last].sheet.file));
}

// Sheets of one run are of one job, read by one instrument in one way, and no two are one.
void RunJudge::compare_origins(Run &run) const
{
    const Entry &first = entries.front();
    const auto all = [this](const auto &of) {
        std::vector<std::string> out;
        for (const Entry &entry : entries)
            if (std::find(out.begin(), out.end(), of(entry)) == out.end())
                out.push_back(of(entry));
        if (out.size() > 1)
            std::replace(out.begin(), out.end(), std::string(), std::string("not told"));
        return listed(out);
    };
    run.job = all([](const Entry &entry) { return entry.origin.job; });
    run.instrument = all([](const Entry &entry) { return entry.origin.instrument; });
    run.condition = all([](const Entry &entry) { return entry.condition; });
    for (std::size_t i = 1; i < entries.size(); ++i) {
        const Entry &entry = entries[i];
        const auto differs = [&](const char *what, const std::string &own,
                                 const std::string &of_first) {
            if (own != of_first)
                run.warnings.push_back(fmt::format("{}: {} \"{}\", of {} \"{}\"", entry.sheet.file,
                                                   what, own, first.sheet.file, of_first));
        };
        differs("job", entry.origin.job, first.origin.job);
        differs("instrument", entry.origin.instrument, first.origin.instrument);
        differs("condition", entry.condition, first.condition);
        for (std::size_t k = 0; k < i; ++k)
            if (entries[k].readings.readings == entry.readings.readings) {
                run.warnings.push_back(fmt::format("{} and {} read the same to the last digit",
                                                   entries[k].sheet.file, entry.sheet.file));
                break;
            }
    }
}

// Each once; what is said of several sheets with the number of the others.
void RunJudge::add_warnings(Run &run) const
{
    std::vector<std::pair<std::string, std::size_t>> all; // without the sheet; how many sheets
    std::map<std::string, std::size_t> places;
    std::vector<std::string> first;
    for (const Entry &entry : entries)
        for (const std::string &warning : entry.readings.warnings) {
            const std::size_t at = warning.find(entry.sheet.file);
            const bool own = at != std::string::npos;
            std::string text = warning;
            if (own)
                text.erase(at, entry.sheet.file.size());
            const auto [place, is_new] = places.try_emplace(text, all.size());
            if (is_new) {
                all.emplace_back(text, 0);
                first.push_back(warning);
            }
            all[place->second].second += own;
        }
    for (std::size_t i = 0; i < all.size(); ++i)
        run.warnings.push_back(all[i].second > 1 ? fmt::format("{} (and so of {} more sheets)",
                                                               first[i], all[i].second - 1)
                                                 : first[i]);
}

Run RunJudge::result()
{
    if (entries.empty())
        throw RequestError{unread.empty() ? "there is no sheet"
                           : unread.size() == 1
                               ? "the sheet cannot be judged; " + unread[0]
                               : fmt::format("none of the {} sheets can be judged; {}",
                                             unread.size(), listed(unread, "; "))};
    Run run{.aims = aims.file,
            .illuminant = *illuminant,
            .status = request.status,
            .sheets = {},
            .unread = unread,
            .tolerances = request.tolerances.name,
            .limits = {},
            .limit_places = {},
            .series = {},
            .advice = {},
            .gaps = {},
            .warnings = {},
            .verdict = {}};
    sort_by_date(run);
    for (const Entry &entry : entries)
        run.sheets.push_back(entry.sheet);
    add_series(run);
    for (RunSeries &series : run.series)
        judge(series);
    find_gaps(run);
    add_limits(run);
    add_advice(run);
    if (!unserved.empty())
        run.warnings.push_back(fmt::format("{}: no sheet has {}", aims.file, listed(unserved)));
    warn_of_few(run);
    compare_origins(run);
    add_warnings(run);
    return run;
}

} // namespace vantrel::sheets
