// vantrel compare REFERENCE SAMPLE

#include "judge/compare.h"
#include "options.h"
#include "progress.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <memory>

namespace vantrel::program {
namespace {

struct CompareOptions : Options {
    std::string reference, sample;
    std::string pairing = "auto";
    bool force_pairs = false;
    std::string repeats = "mean";
    bool allow_missing = false;
    std::string sample_condition; // the same as of the reference where it is empty
    std::vector<std::string> formulas = {"de2000"};
    std::vector<std::string> weights; // FORMULA=A,B
    std::string second_illuminant;    // its default follows the first
    std::string words = "ab";
    std::optional<double> tolerance;
    std::string tolerances; // a file
    bool substrate_corrected = false;
    bool advice = false;
    bool all = false;
};

// FORMULA=A,B
void set_weights(std::vector<Metric> &metrics, std::string_view wish)
{
    const auto equals = wish.find('=');
    const auto comma = wish.find(',', equals == std::string_view::npos ? 0 : equals);
    const auto number = [&](std::size_t from, std::size_t to) {
        return number_of_option(wish.substr(from, to - from));
    };
    const bool whole = equals != std::string_view::npos && comma != std::string_view::npos;
    const auto lightness = whole ? number(equals + 1, comma) : std::nullopt;
    const auto chroma = whole ? number(comma + 1, wish.size()) : std::nullopt;
    if (!lightness || !chroma)
        throw RequestError{
            fmt::format("--weights takes FORMULA=LIGHTNESS,CHROMA, not {}", in_quotes(wish))};
    weigh(metrics, wish.substr(0, equals), *lightness, *chroma);
}

std::vector<Metric> chosen_metrics(const CompareOptions &options)
{
    std::vector<Metric> metrics = metrics_of(options.formulas);
    for (const std::string &wish : options.weights)
        set_weights(metrics, wish);
    return metrics;
}

std::vector<std::string> pairing_names()
{
    std::vector<std::string> out;
    for (const Pairing pairing : kPairings)
        out.emplace_back(name_of(pairing));
    return out;
}

// Of one of these names.
Pairing pairing_of(const std::string &name)
{
    return *std::find_if(kPairings.begin(), kPairings.end(),
                         [&](Pairing pairing) { return name == name_of(pairing); });
}

Outcome run(const CompareOptions &options)
{
    if (options.tolerance && *options.tolerance < 0)
        throw RequestError{"--tolerance takes a number from 0 up"};
    if (options.force_pairs && options.pairing == "auto")
        throw RequestError{"--force-pairs takes a key named by --pair"};
    const CompareRequest request{
        .pairing = {.by = pairing_of(options.pairing),
                    .force = options.force_pairs,
                    .each = options.repeats == "each"},
        .allow_missing = options.allow_missing,
        .metrics = chosen_metrics(options),
        .illuminant = optional_illuminant(options.illuminant),
        .second_illuminant = optional_illuminant(options.second_illuminant),
        .status = status_of(options.status),
        .words_of_hue = options.words == "hue",
        .tolerance = options.tolerance,
        .tolerances = tolerances_of(options.tolerances),
        .substrate_corrected = options.substrate_corrected,
        .advice = options.advice,
        .paper = options.paper,
        .tell = progress_bar(),
    };
    Measurement reference = sheet_of(options.reference, options, true);
    Options of_sample = options;
    if (!options.sample_condition.empty())
        of_sample.condition = options.sample_condition;
    Measurement sample = sheet_of(options.sample, of_sample, true);
    if (reference.file == sample.file && reference.source.condition != sample.source.condition)
        for (Measurement *sheet : {&reference, &sample})
            sheet->file += fmt::format(" ({})", sheet->source.condition);
    Comparison comparison = compare(reference, sample, request);
    const auto verdict = comparison.corrected ? comparison.corrected->verdict : comparison.verdict;
    std::vector<std::string> warnings = comparison.warnings;
    Outcome outcome =
        outcome_of(std::move(comparison), std::move(warnings), options, {.all_pairs = options.all});
    outcome.within_tolerance = verdict.value_or(Verdict::passed) == Verdict::passed;
    return outcome;
}

constexpr const char *kCompareFooter =
    "Patches pair by name, id, device values or place in the file. auto takes the key that pairs "
    "most,\nunless device values disagree. An aim serves any number of patches; of patches with "
    "the "
    "same name\nthe mean is judged.\n\n"
    "With --tolerance the sheet fails, and the exit status is 1, when any pair is above it in the "
    "first\nformula; with --tolerances when one of the limits fails or could not be judged. Where "
    "patches or\naims find no partner, with limits or without, the verdict is incomplete, and the "
    "exit status 1, unless the "
    "sample is a strip\nof at most half of the aims. With --substrate-corrected the exit status is "
    "that of the "
    "corrected\nverdict. The 95th percentile is the smallest difference that at least 95 % of the "
    "pairs do not\nexceed. CIE94 and CMC weigh by the colour of the reference. Metamerism is the "
    "sum of the two\nDelta E*ab under the two illuminants; DIN 6172 tells how far the difference "
    "moves between them.\nDensities are over each sheet's own paper, in the response that reads "
    "the reference.\n\n"
    "CSV and CGATS have a row for each pair, with the spectrum of the sample, and end with the "
    "verdict\nand the warnings. The fields of the JSON stand in docs/json.md.\n\n"
    "Example:\n"
    "  vantrel compare reference.txt sheet.txt --formula de2000,cmc --weights cmc=1,1 --tolerance "
    "2.0";

} // namespace

Command add_compare(CLI::App &app)
{
    const auto options = std::make_shared<CompareOptions>();
    CLI::App *command =
        app.add_subcommand("compare", "How a sheet differs from its reference, patch by patch");
    command->add_option("REFERENCE", options->reference, "Measurement file to compare with")
        ->required();
    command->add_option("SAMPLE", options->sample, "Measurement file of the sheet")->required();
    add_sheet_options(*command, *options);
    command
        ->add_option("--pair", options->pairing,
                     "Pair patches by: auto, name, id, device (values) or order")
        ->check(CLI::IsMember(pairing_names()))
        ->capture_default_str();
    command->add_flag("--force-pairs", options->force_pairs,
                      "Take pairs too whose device values disagree");
    command
        ->add_option("--repeats", options->repeats,
                     "Judge the mean of several measurements of a patch, or each of them")
        ->check(CLI::IsMember({"mean", "each"}))
        ->capture_default_str();
    command->add_flag("--allow-missing", options->allow_missing,
                      "Patches and aims without a partner leave the verdict complete");
    add_condition_option(*command, "--sample-condition", options->sample_condition,
                         "Measurement condition to read from the sample (default: --condition)");
    command
        ->add_option("--formula", options->formulas,
                     "Colour differences, with commas between: " + formula_keys() +
                         "; the first decides on worst and tolerance")
        ->delimiter(',')
        ->allow_extra_args(false)
        ->capture_default_str();
    command
        ->add_option("--weights", options->weights,
                     "FORMULA=LIGHTNESS,CHROMA: kL and kC of de2000 and de94 (default 1,1), l and "
                     "c of cmc (default 2,1); once for each formula")
        ->allow_extra_args(false);
    command->add_option("--second-illuminant", options->second_illuminant,
                        "Illuminant of the metamerism beside --illuminant (default: A_2DEG or "
                        "A_10DEG, beside these D65_2DEG or D65_10DEG)");
    command
        ->add_option("--words", options->words,
                     "The difference in words: ab along a* and b*, hue as chroma and hue")
        ->check(CLI::IsMember({"ab", "hue"}))
        ->capture_default_str();
    command->add_option("--tolerance", options->tolerance, "Largest difference that is accepted")
        ->check(is_number());
    command->add_option("--tolerances", options->tolerances,
                        "TOML file of limits by group of patches; examples/ has three");
    command->add_flag("--substrate-corrected", options->substrate_corrected,
                      "Judge too by aims that are moved to the sample's paper (ISO 13655)");
    command->add_flag("--advice", options->advice,
                      "Tell the density change that brings each solid nearest to its aim");
    command->add_flag("--all", options->all, "List every pair in the table, not the worst ten");
    command->footer(kCompareFooter);
    return {command, [options] { return run(*options); }};
}

} // namespace vantrel::program
