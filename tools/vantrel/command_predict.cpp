// vantrel predict FILE

#include "judge/predict.h"
#include "options.h"
#include "read/text.h"

#include <fmt/format.h>

#include <cmath>
#include <memory>

namespace vantrel::program {
namespace {

struct PredictOptions : Options {
    std::string file;
    std::vector<std::string> order;     // of printing
    std::vector<std::string> ink_tints; // NAME:PERCENT
};

// NAME:PERCENT
InkTint ink_tint(std::string_view wish)
{
    const auto colon = wish.rfind(':');
    if (colon == std::string_view::npos)
        throw RequestError{fmt::format("--ink takes NAME:PERCENT, not {}", in_quotes(wish))};
    const auto percent = number_of_option(wish.substr(colon + 1));
    if (!percent || *percent < 0 || *percent > 100 || *percent != std::floor(*percent))
        throw RequestError{fmt::format("--ink takes a whole percentage from 0 to 100, not {}",
                                       in_quotes(wish.substr(colon + 1)))};
    return {std::string(wish.substr(0, colon)), static_cast<int>(*percent)};
}

Outcome run(const PredictOptions &options)
{
    PredictRequest request{
        .illuminant = optional_illuminant(options.illuminant),
        .status = status_of(options.status),
        .paper = options.paper,
        .order = options.order,
        .inks = {},
    };
    for (const std::string &wish : options.ink_tints)
        request.inks.push_back(ink_tint(wish));
    Predictions predictions = predict(sheet_of(options.file, options), request);
    std::vector<std::string> warnings = predictions.warnings;
    return outcome_of(std::move(predictions), std::move(warnings), options);
}

constexpr const char *kPredictFooter =
    "Three models stand side by side: tints as halftones, which mix ink and paper by area; as "
    "thinner\nfilms, both of up to three inks; and calibrated, the Yule-Nielsen-Neugebauer model "
    "with the dots, the\nn, the overprints and the mid-tones of the sheet itself. It predicts a "
    "combination as if the sheet did\nnot hold it, and tells its error on those that the sheet "
    "holds. Where the file holds the combination,\nits colour and the difference are shown.\n\n"
    "CSV, CGATS and JSON (its fields stand in docs/json.md) hold the predicted spectra too; in CSV "
    "and\nCGATS each prediction is a row for each model.\n\n"
    "Example:\n  vantrel predict two_ink_halftone.txt --ink \"Magenta 100:40\" --ink CMYK_Y:70";

} // namespace

Command add_predict(CLI::App &app)
{
    const auto options = std::make_shared<PredictOptions>();
    CLI::App *command = app.add_subcommand(
        "predict", "The colour that inks will have as tints and over one another");
    command
        ->add_option("FILE", options->file,
                     "Measurement file: CGATS text, CSV or CxF with spectra; - is standard input")
        ->required();
    add_sheet_options(*command, *options);
    add_order_option(*command, options->order);
    command
        ->add_option("--ink", options->ink_tints,
                     "NAME:PERCENT, once for each of one to four inks in the order of printing. "
                     "NAME is the solid's patch by name or id, or the ink's device field. Without "
                     "any, every measured overprint of two to four inks is predicted")
        ->allow_extra_args(false);
    command->footer(kPredictFooter);
    return {command, [options] { return run(*options); }};
}

} // namespace vantrel::program
