// A comparison as table, JSON and columns.

#include "judge/names.h"
#include "read/text.h"
#include "write/json_text.h"
#include "write/limits.h"
#include "write/result.h"
#include "write/scales.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>
#include <numeric>
#include <utility>

namespace vantrel::sheets {
namespace {

void add_pairs(Lines &lines, const Comparison &comparison, const std::vector<std::size_t> &chosen,
               bool colour)
{
    // A line has 120 columns, 51 of them for what stands behind the differences.
    const std::size_t widest = 69 - (colour ? 10 : 0) - 7 * (comparison.metrics.size() + 3);
    std::size_t width = 5;
    for (const std::size_t i : chosen)
        width = std::max(width, characters(cut(comparison.pairs[i].name(), widest - 1)));
    std::string head = fmt::format("{:<{}}{}", "Patch", width, colour ? "          " : "");
    for (const Metric &metric : comparison.metrics)
        head += fmt::format("{:>7}", names_of(metric.formula).title);
    lines.add(fmt::format("{}{:>7}{:>7}{:>7}{:>4}{:>7}{:>7}  {}", head, "ΔL*", "Δa*", "Δb*", "",
                          "ΔD", "Metam.", "Sample is"));
    for (const std::size_t i : chosen) {
        const PairReport &pair = comparison.pairs[i];
        const CIELABCOORD &aim = pair.reference.colour.lab, &lab = pair.sample.colour.lab;
        std::string line = fmt::format("{:<{}}", cut(pair.name(), widest - 1), width);
        if (colour)
            line += ' ' + swatch(pair.reference.colour.rgb) + swatch(pair.sample.colour.rgb) + ' ';
        for (const double delta_e : pair.delta_e)
            line += fmt::format("{:>7}", fixed(delta_e));
        for (const double difference : {lab.L - aim.L, lab.a - aim.a, lab.b - aim.b})
            line += fmt::format("{:>7}", fixed(difference));
        lines.add(line +
                  fmt::format("{:>4}{:>7}{:>7}  {}",
                              pair.response ? response_code(comparison.status, *pair.response) : "",
                              fixed(pair.density_difference, 3), fixed(pair.metamerism),
                              pair.verbal.value_or("")));
    }
}

void add_statistics(Lines &lines, const Comparison &comparison,
                    const std::vector<Statistics> &statistics)
{
    lines.add(fmt::format("\n{:<22}{:>8}{:>8}{:>8}", "", "mean", "95 %", "largest"));
    for (std::size_t i = 0; i < comparison.metrics.size(); ++i) {
        const Statistics &all = statistics[i];
        lines.add(fmt::format("{:<22}{:>8}{:>8}{:>8}  {}", title_of(comparison.metrics[i]),
                              fixed(all.mean), fixed(all.p95), fixed(all.max),
                              cut(comparison.pairs[all.max_at].name(), kWidestName)));
    }
}

// "by device values (by name 0 of 72 patches; by id 2 of 72 patches, 70 disagreeing)": with the
// keys that did not pair as many.
std::string pairing_of(const Comparison &comparison)
{
    const Coverage &coverage = comparison.coverage;
    std::string others;
    for (const PairingTry &tried : comparison.passed_over)
        if (tried.disagreeing || tried.sample + tried.reference < coverage.patches + coverage.aims)
            others += fmt::format(
                "{}{} {} of {} patches{}", others.empty() ? "" : "; ", phrase_of(tried.by),
                tried.sample, coverage.of_patches,
                tried.disagreeing ? fmt::format(", {} disagreeing", tried.disagreeing) : "");
    return phrase_of(comparison.paired_by) + (others.empty() ? "" : " (" + others + ")");
}

void add_means(Lines &lines, const std::string &file, const std::optional<Means> &means)
{
    if (means)
        lines.add(fmt::format("\nMeans of repeats in {}: {} patches; the widest, {}, has {} up to "
                              "ΔE00 {} from their mean",
                              file, means->patches, cut(means->widest, kWidestInText),
                              means->repeats, fixed(means->spread)));
}

void add_unpaired(Lines &lines, const std::string &file, const std::vector<Unpaired> &unpaired)
{
    if (unpaired.empty())
        return;
    constexpr std::size_t most = 10;
    std::string line = fmt::format("\nWithout a partner in {}: ", file);
    for (std::size_t i = 0; i < unpaired.size() && i < most; ++i)
        line += (i ? ", " : "") + cut(unpaired[i].name, kWidestInText);
    if (unpaired.size() > most)
        line += fmt::format(" and {} more", unpaired.size() - most);
    lines.add(line);
}

// "Failed: 3 of 5 pairs are above ΔE00 2; all 7 limits are held; judged 5 of 5 patches by 5 of 5
// aims"
std::string sentence_of(const std::optional<Verdict> &verdict, const Comparison &comparison,
                        std::size_t above, const std::vector<LimitResult> &limits)
{
    if (!verdict)
        return "No tolerance given; " + told(comparison.coverage);
    std::string word(name_of(*verdict));
    word[0] = static_cast<char>(word[0] - 'a' + 'A');
    std::string reasons;
    if (comparison.tolerance) {
        const std::string title = title_of(comparison.metrics[0]);
        const std::size_t pairs = comparison.pairs.size() + comparison.left_out.count;
        reasons = above ? fmt::format("{} of {} pairs are above {} {:g}", above, pairs, title,
                                      *comparison.tolerance)
                        : fmt::format("no {} is above {:g}", title, *comparison.tolerance);
    }
    if (!comparison.tolerance && limits.empty())
        reasons = "no tolerance given";
    if (!limits.empty())
        reasons += (reasons.empty() ? "" : "; ") + counts_of(limits);
    return fmt::format("{}: {}; {}", word, reasons, told(comparison.coverage));
}

std::string sentence_of(const Comparison &comparison)
{
    return sentence_of(comparison.verdict, comparison, comparison.above, comparison.limits);
}

// "Substrate-corrected: Failed: …", nothing where there is no such verdict.
std::string corrected_sentence_of(const Comparison &comparison)
{
    const auto &corrected = comparison.corrected;
    if (!corrected || !corrected->verdict)
        return {};
    return "Substrate-corrected: " +
           sentence_of(corrected->verdict, comparison, corrected->above, corrected->limits);
}

std::string limits_title(const Comparison &comparison)
{
    return comparison.tolerances.empty() ? "Limits" : "Limits: " + comparison.tolerances;
}

void add_verdicts(Lines &lines, const Comparison &comparison)
{
    add_limits(lines, limits_title(comparison), comparison.limits);
    lines.add('\n' + sentence_of(comparison));
    if (!comparison.corrected)
        return;
    const SubstrateCorrected &corrected = *comparison.corrected;
    lines.add(fmt::format("\nSubstrate-corrected: the aims' paper {} taken to the sample's {}, {} "
                          "fixed",
                          fixed(corrected.aim_paper), fixed(corrected.paper),
                          cut(corrected.darkest, kWidestInText)));
    add_statistics(lines, comparison, corrected.statistics);
    add_limits(lines, limits_title(comparison) + ", substrate-corrected", corrected.limits);
    if (const std::string sentence = corrected_sentence_of(comparison); !sentence.empty())
        lines.add('\n' + sentence);
}

ObjectText side_text(const Side &side)
{
    ObjectText out;
    out.add("id", side.id);
    out.add("name", side.name);
    out.add("rgb", hex(side.colour.rgb));
    out.add("lab", side.colour.lab);
    out.add("density", side.density);
    out.add("refl", side.refl);
    out.add("repeats", side.repeats);
    out.add("spread", side.spread);
    return out;
}

Json means_json(const std::optional<Means> &means)
{
    return means ? Json({{"patches", means->patches},
                         {"widest", means->widest},
                         {"repeats", means->repeats},
                         {"spread", means->spread}})
                 : Json();
}

Json sheet_json(const std::string &file, const PaperChoice &paper)
{
    return {{"file", file}, {"paper", name_json(paper)}, {"paper_chosen", paper.reason}};
}

Json names_json(const std::vector<Unpaired> &unpaired)
{
    Json out = Json::array();
    for (const Unpaired &patch : unpaired)
        out.push_back(patch.name);
    return out;
}

Json tries_json(const std::vector<PairingTry> &tries)
{
    Json out = Json::array();
    for (const PairingTry &tried : tries)
        out.push_back({{"by", name_of(tried.by)},
                       {"aims", tried.reference},
                       {"patches", tried.sample},
                       {"disagreeing", tried.disagreeing}});
    return out;
}

ObjectText pair_text(const PairReport &pair, const Comparison &comparison)
{
    const auto formula = [&](std::size_t i) { return names_of(comparison.metrics[i].formula).key; };
    ObjectText out;
    out.add("name", pair.name());
    out.add("reference", side_text(pair.reference));
    out.add("sample", side_text(pair.sample));
    for (std::size_t i = 0; i < pair.delta_e.size(); ++i)
        out.add(formula(i), pair.delta_e[i]);
    out.add("verbal", pair.verbal);
    out.add("metamerism", pair.metamerism);
    out.add("din6172", pair.din6172);
    out.add("response", response_text(pair.response, comparison.status));
    out.add("density_difference", pair.density_difference);
    if (pair.corrected_aim) {
        ObjectText corrected;
        corrected.add("lab", *pair.corrected_aim);
        for (std::size_t i = 0; i < pair.corrected_delta_e.size(); ++i)
            corrected.add(formula(i), pair.corrected_delta_e[i]);
        out.add("corrected", corrected);
    }
    return out;
}

Json statistics_json(const Comparison &comparison, const std::vector<Statistics> &statistics)
{
    Json out = Json::object();
    for (std::size_t i = 0; i < statistics.size(); ++i)
        out[std::string(names_of(comparison.metrics[i].formula).key)] = {
            {"mean", statistics[i].mean},
            {"p95", statistics[i].p95},
            {"max", statistics[i].max},
            {"max_patch", comparison.pairs[statistics[i].max_at].name()}};
    return out;
}

Json corrected_json(const Comparison &comparison)
{
    if (!comparison.corrected)
        return {};
    const SubstrateCorrected &corrected = *comparison.corrected;
    return {{"reference_paper", lab_json(corrected.aim_paper)},
            {"sample_paper", lab_json(corrected.paper)},
            {"darkest", corrected.darkest},
            {"verdict", corrected.verdict ? Json(name_of(*corrected.verdict)) : Json()},
            {"limits", limits_json(corrected.limits)},
            {"statistics", statistics_json(comparison, corrected.statistics)}};
}

} // namespace

void write_table(const Comparison &comparison, const Sink &sink, const TableStyle &style)
{
    std::string paper = over(comparison.reference_paper);
    if (const std::string own = over(comparison.sample_paper); own != paper)
        paper += ", the sample " + own;
    Lines lines(sink);
    lines.add(fmt::format("{} against {}: {} {} {}", comparison.sample, comparison.reference,
                          comparison.pairs.size(), comparison.pairs.size() == 1 ? "pair" : "pairs",
                          pairing_of(comparison)));
    lines.add(fmt::format("{}, metamerism with {}; {} {}", said(comparison.illuminant),
                          name_of(comparison.second_illuminant), status_name(comparison.status),
                          paper));
    if (style.all_pairs) {
        std::vector<std::size_t> all(comparison.pairs.size());
        std::iota(all.begin(), all.end(), 0u);
        lines.add("");
        add_pairs(lines, comparison, all, style.colour);
    }
    lines.add(fmt::format("\nThe worst {} by {}", comparison.worst.size(),
                          title_of(comparison.metrics[0])));
    add_pairs(lines, comparison, comparison.worst, style.colour);
    add_statistics(lines, comparison, comparison.statistics);
    if (const auto &papers = comparison.papers)
        lines.add(
            fmt::format("\nBetween the papers: ΔE00 {}{}", fixed(papers->de00),
                        papers->metamerism ? ", metamerism " + fixed(papers->metamerism) : ""));
    add_tones(lines, comparison.tones);
    add_greys(lines, comparison.greys);
    add_advice(lines, "Advice for the solids", comparison.advice);
    add_means(lines, comparison.reference, comparison.reference_means);
    add_means(lines, comparison.sample, comparison.sample_means);
    add_unpaired(lines, comparison.reference, comparison.only_reference);
    add_unpaired(lines, comparison.sample, comparison.only_sample);
    add_verdicts(lines, comparison);
}

void write_json(const Comparison &comparison, const Sink &sink)
{
    Json names = Json::array(), labels = Json::object(), weights = Json::object();
    for (const Metric &metric : comparison.metrics) {
        const std::string name(names_of(metric.formula).key);
        names.push_back(name);
        labels[name] = title_of(metric);
        if (metric.formula != Formula::de76)
            weights[name] = {metric.lightness, metric.chroma};
    }
    Json head = {
        {"command", "compare"},
        {"verdict", comparison.verdict ? Json(name_of(*comparison.verdict)) : Json()},
        {"says", sentence_of(comparison)},
        {"judged", coverage_json(comparison.coverage)},
        {"warnings", comparison.warnings},
        {"reference", sheet_json(comparison.reference, comparison.reference_paper)},
        {"sample", sheet_json(comparison.sample, comparison.sample_paper)},
        {"papers", comparison.papers
                       ? Json({{"de00", comparison.papers->de00},
                               {"metamerism", or_null(comparison.papers->metamerism)}})
                       : Json()},
        {"illuminant", name_of(comparison.illuminant)},
        {"illuminant_by", comparison.illuminant.by},
        {"second_illuminant", name_of(comparison.second_illuminant)},
        {"status", status_name(comparison.status)},
        {"paired_by", name_of(comparison.paired_by)},
        {"passed_over", tries_json(comparison.passed_over)},
        {"formulas", names},
        {"labels", labels},
        {"weights", weights},
        {"tolerance", or_null(comparison.tolerance)},
        {"passed", comparison.verdict ? Json(*comparison.verdict == Verdict::passed) : Json()},
        {"tolerances", comparison.tolerances.empty() ? Json() : Json(comparison.tolerances)},
        {"limits", limits_json(comparison.limits)},
        {"corrected", corrected_json(comparison)},
        {"statistics", statistics_json(comparison, comparison.statistics)},
        {"means",
         {{"reference", means_json(comparison.reference_means)},
          {"sample", means_json(comparison.sample_means)}}},
        {"worst", comparison.worst},
        {"unpaired",
         {{"reference", names_json(comparison.only_reference)},
          {"sample", names_json(comparison.only_sample)}}},
    };
    head["tone_values"] = tones_json(comparison.tones);
    head["greys"] = greys_json(comparison.greys);
    if (!comparison.advice.empty())
        add_advice(head, comparison.advice);
    add_left_out(head, comparison.left_out);
    write_with_array(
        head, "pairs", comparison.pairs.size(),
        [&](std::size_t i) { return pair_text(comparison.pairs[i], comparison).whole(); }, sink);
    sink.write("\n");
}

namespace {

// The patches of either sheet that were not judged.
Flat flat_of_unpaired(const Comparison &comparison)
{
    const std::vector<Unpaired> &sample = comparison.only_sample,
                                &reference = comparison.only_reference;
    const auto of_sample = [&sample](std::string Unpaired::*text) {
        return [&sample, text](std::size_t i) {
            return i < sample.size() ? sample[i].*text : std::string();
        };
    };
    const auto of_reference = [&sample, &reference](std::string Unpaired::*text) {
        return [&sample, &reference, text](std::size_t i) {
            return i < sample.size() ? std::string() : reference[i - sample.size()].*text;
        };
    };
    Flat flat;
    flat.description =
        fmt::format("Without a partner in {} and {}", comparison.sample, comparison.reference);
    flat.rows = sample.size() + reference.size();
    flat.text("id", "SAMPLE_ID", of_sample(&Unpaired::id));
    flat.text("name", "SAMPLE_NAME", of_sample(&Unpaired::name));
    flat.text("reference_id", "REFERENCE_ID", of_reference(&Unpaired::id));
    flat.text("reference_name", "REFERENCE_NAME", of_reference(&Unpaired::name));
    flat.text("verdict", "VERDICT", [](std::size_t) { return "no partner"; });
    return flat;
}

std::string word_of(const std::optional<Verdict> &verdict)
{
    return verdict ? std::string(name_of(*verdict)) : std::string();
}

// What the verdicts rest on, and the warnings.
Flat flat_of_statements(const Comparison &comparison)
{
    std::vector<Statement> rows;
    rows.push_back({"Verdict", word_of(comparison.verdict), sentence_of(comparison)});
    if (const std::string sentence = corrected_sentence_of(comparison); !sentence.empty())
        rows.push_back({"Verdict", word_of(comparison.corrected->verdict), sentence});
    if (!comparison.advice.empty())
        rows.push_back({"Advice", "", advice_from()});
    for (const std::string &warning : comparison.warnings)
        rows.push_back({"Warning", "", warning});
    return flat_of(std::move(rows),
                   comparison.warnings.empty() ? "Verdict" : "Verdict and warnings");
}

} // namespace

std::vector<Flat> flat_of(const Comparison &comparison)
{
    const std::vector<PairReport> &pairs = comparison.pairs;
    Flat flat;
    flat.description =
        fmt::format("{} against {}, {}: {}, {}. {}", comparison.sample, comparison.reference,
                    pairing_of(comparison), name_of(comparison.illuminant),
                    status_name(comparison.status), sentence_of(comparison));
    if (const std::string sentence = corrected_sentence_of(comparison); !sentence.empty())
        flat.description += ". " + sentence;
    flat.rows = pairs.size();
    flat.text("id", "SAMPLE_ID", [&pairs](std::size_t i) { return pairs[i].sample.id; });
    flat.text("name", "SAMPLE_NAME", [&pairs](std::size_t i) { return pairs[i].sample.name; });
    flat.text("reference_id", "REFERENCE_ID",
              [&pairs](std::size_t i) { return pairs[i].reference.id; });
    flat.text("reference_name", "REFERENCE_NAME",
              [&pairs](std::size_t i) { return pairs[i].reference.name; });
    flat.colour("", [&pairs](std::size_t i) { return &pairs[i].sample.colour; });
    flat.colour("reference_", [&pairs](std::size_t i) { return &pairs[i].reference.colour; });
    for (std::size_t k = 0; k < comparison.metrics.size(); ++k) {
        const FormulaNames &names = names_of(comparison.metrics[k].formula);
        flat.number(std::string(names.key), std::string(names.cgats),
                    [&pairs, k](std::size_t i) { return pairs[i].delta_e[k]; });
    }
    if (comparison.corrected)
        for (std::size_t k = 0; k < comparison.metrics.size(); ++k) {
            const FormulaNames &names = names_of(comparison.metrics[k].formula);
            flat.number("corrected_" + std::string(names.key),
                        "CORRECTED_" + std::string(names.cgats),
                        [&pairs, k](std::size_t i) { return pairs[i].corrected_delta_e[k]; });
        }
    flat.text("verbal", "VERBAL", [&pairs](std::size_t i) { return pairs[i].verbal.value_or(""); });
    flat.number("metamerism", "METAMERISM",
                [&pairs](std::size_t i) { return pairs[i].metamerism; });
    flat.number("din6172", "DIN6172", [&pairs](std::size_t i) { return pairs[i].din6172; });
    flat.text("response", "RESPONSE", [&comparison](std::size_t i) {
        const auto &response = comparison.pairs[i].response;
        return response ? response_name(comparison.status, *response) : "";
    });
    flat.number("density", "DENSITY", [&pairs](std::size_t i) { return pairs[i].sample.density; });
    flat.number("reference_density", "REFERENCE_DENSITY",
                [&pairs](std::size_t i) { return pairs[i].reference.density; });
    flat.exact("repeats", "REPEATS",
               [&pairs](std::size_t i) { return static_cast<double>(pairs[i].sample.repeats); });
    flat.number("spread", "SPREAD", [&pairs](std::size_t i) { return pairs[i].sample.spread; });
    flat.exact("reference_repeats", "REFERENCE_REPEATS",
               [&pairs](std::size_t i) { return static_cast<double>(pairs[i].reference.repeats); });
    flat.number("reference_spread", "REFERENCE_SPREAD",
                [&pairs](std::size_t i) { return pairs[i].reference.spread; });
    flat.same("paper", "PAPER", said(comparison.sample_paper));
    flat.same("reference_paper", "REFERENCE_PAPER", said(comparison.reference_paper));
    flat.same("verdict", "VERDICT", word_of(comparison.verdict));
    if (pairs.front().sample.refl)
        flat.spectrum(
            [&pairs](std::size_t i) -> const Spectrum & { return *pairs[i].sample.refl; });
    std::vector<Flat> tables = {flat};
    if (!comparison.only_sample.empty() || !comparison.only_reference.empty())
        tables.push_back(flat_of_unpaired(comparison));
    if (!comparison.tones.empty())
        tables.push_back(flat_of(comparison.tones));
    if (!comparison.greys.empty())
        tables.push_back(flat_of(comparison.greys));
    if (!comparison.advice.empty())
        tables.push_back(flat_of(comparison.advice, "Advice for the solids"));
    if (!comparison.limits.empty())
        tables.push_back(flat_of(comparison.limits, "reference", limits_title(comparison)));
    if (comparison.corrected && !comparison.corrected->limits.empty())
        tables.push_back(flat_of(comparison.corrected->limits, "substrate-corrected",
                                 limits_title(comparison) + ", substrate-corrected"));
    tables.push_back(flat_of_statements(comparison));
    return tables;
}

} // namespace vantrel::sheets
