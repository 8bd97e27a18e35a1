// A comparison as table, JSON and rows.

#include "judge/compare.h"
#include "judge/names.h"
#include "read/text.h"
#include "write/json_text.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>
#include <numeric>

namespace vantrel::sheets {
namespace {

// ΔE00, ΔE CMC(2:1), ΔE94 (kL 2, kC 1)
std::string full_title(const Metric &metric)
{
    std::string title(title_of(metric.formula));
    if (metric.formula == Formula::cmc)
        return fmt::format("{}({:g}:{:g})", title, metric.lightness, metric.chroma);
    if (metric.lightness == 1 && metric.chroma == 1)
        return title;
    return fmt::format("{} (kL {:g}, kC {:g})", title, metric.lightness, metric.chroma);
}

std::optional<double> density_difference(const PairReport &pair)
{
    if (!pair.reference.density || !pair.sample.density)
        return std::nullopt;
    return *pair.sample.density - *pair.reference.density;
}

void add_pairs(Lines &lines, const Comparison &comparison, const std::vector<std::size_t> &chosen,
               bool colour)
{
    // A line has 120 columns, 51 of them for what stands behind the differences.
    const std::size_t widest = 69 - (colour ? 10 : 0) - 7 * (comparison.metrics.size() + 3);
    std::size_t width = 5;
    for (const std::size_t i : chosen)
        width = std::max(width, characters(cut(comparison.pairs[i].reference.name, widest - 1)));
    std::string head = fmt::format("{:<{}}{}", "Patch", width, colour ? "          " : "");
    for (const Metric &metric : comparison.metrics)
        head += fmt::format("{:>7}", title_of(metric.formula));
    lines.add(fmt::format("{}{:>7}{:>7}{:>7}{:>4}{:>7}{:>7}  {}", head, "ΔL*", "Δa*", "Δb*", "",
                          "ΔD", "Metam.", "Sample is"));
    for (const std::size_t i : chosen) {
        const PairReport &pair = comparison.pairs[i];
        const CIELABCOORD &aim = pair.reference.colour.lab, &lab = pair.sample.colour.lab;
        std::string line = fmt::format("{:<{}}", cut(pair.reference.name, widest - 1), width);
        if (colour)
            line += ' ' + swatch(pair.reference.colour.rgb) + swatch(pair.sample.colour.rgb) + ' ';
        for (const double delta_e : pair.delta_e)
            line += fmt::format("{:>7}", fixed(delta_e));
        for (const double difference : {lab.L - aim.L, lab.a - aim.a, lab.b - aim.b})
            line += fmt::format("{:>7}", fixed(difference));
        lines.add(line +
                  fmt::format("{:>4}{:>7}{:>7}  {}",
                              pair.response ? response_code(comparison.status, *pair.response) : "",
                              fixed(density_difference(pair), 3), fixed(pair.metamerism),
                              pair.verbal));
    }
}

void add_statistics(Lines &lines, const Comparison &comparison)
{
    lines.add(fmt::format("\n{:<22}{:>8}{:>8}{:>8}", "", "mean", "95 %", "largest"));
    for (std::size_t i = 0; i < comparison.metrics.size(); ++i) {
        const Statistics &all = comparison.statistics[i];
        lines.add(fmt::format("{:<22}{:>8}{:>8}{:>8}  {}", full_title(comparison.metrics[i]),
                              fixed(all.mean), fixed(all.p95), fixed(all.max),
                              cut(comparison.pairs[all.max_pair].reference.name, kWidestName)));
    }
}

void add_unpaired(Lines &lines, const std::string &file, const std::vector<std::string> &names)
{
    if (names.empty())
        return;
    constexpr std::size_t most = 10;
    std::string line = fmt::format("\nWithout a partner in {}: ", file);
    for (std::size_t i = 0; i < names.size() && i < most; ++i)
        line += (i ? ", " : "") + cut(names[i], kWidestInText);
    if (names.size() > most)
        line += fmt::format(" and {} more", names.size() - most);
    lines.add(line);
}

void add_verdict(Lines &lines, const Comparison &comparison)
{
    if (!comparison.tolerance)
        return;
    const auto above = std::count_if(
        comparison.pairs.begin(), comparison.pairs.end(),
        [&](const PairReport &pair) { return !(pair.delta_e[0] <= *comparison.tolerance); });
    const std::string title = full_title(comparison.metrics[0]);
    lines.add(comparison.passed()
                  ? fmt::format("\nPassed: no {} is above {:g}", title, *comparison.tolerance)
                  : fmt::format("\nFailed: {} of {} pairs are above {} {:g}", above,
                                comparison.pairs.size(), title, *comparison.tolerance));
}

Json side_json(const Side &side)
{
    return {{"id", side.id},
            {"name", side.name},
            {"rgb", hex(side.colour.rgb)},
            {"lab", lab_json(side.colour.lab)},
            {"density", or_null(side.density)},
            {"refl", side.refl}};
}

Json pair_json(const PairReport &pair, const Comparison &comparison)
{
    Json out = {{"name", pair.reference.name},
                {"reference", side_json(pair.reference)},
                {"sample", side_json(pair.sample)}};
    for (std::size_t i = 0; i < pair.delta_e.size(); ++i)
        out[std::string(name_of(comparison.metrics[i].formula))] = pair.delta_e[i];
    out["verbal"] = pair.verbal;
    out["metamerism"] = pair.metamerism;
    out["din6172"] = pair.din6172;
    out["response"] =
        pair.response ? Json(response_name(comparison.status, *pair.response)) : Json();
    out["density_difference"] = or_null(density_difference(pair));
    return out;
}

} // namespace

void write_table(const Comparison &comparison, const Sink &sink, bool colour)
{
    std::string paper = cut(comparison.reference_paper, kWidestInText);
    if (comparison.sample_paper != comparison.reference_paper)
        paper += ", the sample over " + cut(comparison.sample_paper, kWidestInText);
    Lines lines(sink);
    lines.add(fmt::format("{} against {}: {} {} by {}", comparison.sample, comparison.reference,
                          comparison.pairs.size(), comparison.pairs.size() == 1 ? "pair" : "pairs",
                          name_of(comparison.paired_by)));
    lines.add(fmt::format("{}, metamerism with {}; {} over {}", name_of(comparison.illuminant),
                          name_of(comparison.second_illuminant), status_name(comparison.status),
                          paper));
    if (comparison.list_all) {
        std::vector<std::size_t> all(comparison.pairs.size());
        std::iota(all.begin(), all.end(), 0u);
        lines.add("");
        add_pairs(lines, comparison, all, colour);
    }
    lines.add(fmt::format("\nThe worst {} by {}", comparison.worst.size(),
                          full_title(comparison.metrics[0])));
    add_pairs(lines, comparison, comparison.worst, colour);
    add_statistics(lines, comparison);
    add_unpaired(lines, comparison.reference, comparison.only_reference);
    add_unpaired(lines, comparison.sample, comparison.only_sample);
    add_verdict(lines, comparison);
}

void write_json(const Comparison &comparison, const Sink &sink)
{
    Json names = Json::array(), weights = Json::object(), statistics = Json::object();
    for (std::size_t i = 0; i < comparison.metrics.size(); ++i) {
        const Metric &metric = comparison.metrics[i];
        const std::string name(name_of(metric.formula));
        const Statistics &all = comparison.statistics[i];
        names.push_back(name);
        if (metric.formula != Formula::de76)
            weights[name] = {metric.lightness, metric.chroma};
        statistics[name] = {{"mean", all.mean},
                            {"p95", all.p95},
                            {"max", all.max},
                            {"max_patch", comparison.pairs[all.max_pair].reference.name}};
    }
    const Json head = {
        {"command", "compare"},
        {"reference", {{"file", comparison.reference}, {"paper", comparison.reference_paper}}},
        {"sample", {{"file", comparison.sample}, {"paper", comparison.sample_paper}}},
        {"illuminant", name_of(comparison.illuminant)},
        {"second_illuminant", name_of(comparison.second_illuminant)},
        {"status", status_name(comparison.status)},
        {"paired_by", name_of(comparison.paired_by)},
        {"formulas", names},
        {"weights", weights},
        {"tolerance", or_null(comparison.tolerance)},
        {"passed", comparison.tolerance ? Json(comparison.passed()) : Json()},
        {"statistics", statistics},
        {"worst", comparison.worst},
        {"unpaired",
         {{"reference", comparison.only_reference}, {"sample", comparison.only_sample}}},
    };
    write_with_array(
        head, "pairs", comparison.pairs.size(),
        [&](std::size_t i) { return pair_json(comparison.pairs[i], comparison); }, sink);
    sink.write("\n");
}

std::vector<Flat> flat_of(const Comparison &comparison)
{
    Flat flat;
    flat.description = fmt::format("{} against {}: {}, {}", comparison.sample, comparison.reference,
                                   name_of(comparison.illuminant), status_name(comparison.status));
    flat.fields = {{"id", "SAMPLE_ID", true},
                   {"name", "SAMPLE_NAME", true},
                   {"reference_id", "REFERENCE_ID", true},
                   {"reference_name", "REFERENCE_NAME", true}};
    add_colour_fields(flat.fields, "");
    add_colour_fields(flat.fields, "reference_");
    constexpr const char *cgats[] = {"LAB_DE_2000", "LAB_DE_CMC", "LAB_DE_94", "LAB_DE"};
    for (const Metric &metric : comparison.metrics)
        flat.fields.push_back({std::string(name_of(metric.formula)),
                               cgats[static_cast<std::size_t>(metric.formula)]});
    flat.fields.push_back({"verbal", "VERBAL", true});
    flat.fields.push_back({"metamerism", "METAMERISM"});
    flat.fields.push_back({"din6172", "DIN6172"});
    flat.fields.push_back({"response", "RESPONSE", true});
    flat.fields.push_back({"density", "DENSITY"});
    flat.fields.push_back({"reference_density", "REFERENCE_DENSITY"});
    add_spectrum_fields(flat.fields);
    flat.spectra = true;
    flat.rows = comparison.pairs.size();
    flat.row = [&comparison](std::size_t i) {
        const PairReport &pair = comparison.pairs[i];
        Row row = {pair.sample.id, pair.sample.name, pair.reference.id, pair.reference.name};
        add_colour_cells(row, pair.sample.colour);
        add_colour_cells(row, pair.reference.colour);
        for (const double delta_e : pair.delta_e)
            row.push_back(cell(delta_e));
        row.push_back(pair.verbal);
        row.push_back(cell(pair.metamerism));
        row.push_back(cell(pair.din6172));
        row.push_back(pair.response ? response_name(comparison.status, *pair.response) : "");
        row.push_back(cell(pair.sample.density));
        row.push_back(cell(pair.reference.density));
        add_spectrum_cells(row, pair.sample.refl);
        return row;
    };
    return {flat};
}

} // namespace vantrel::sheets
