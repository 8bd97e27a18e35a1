// vantrel ink FILE --patch NAME

#include "judge/ink.h"
#include "options.h"

#include <memory>

namespace vantrel::program {
namespace {

struct InkOptions : Options {
    std::string file;
    std::string patch, against;
    std::vector<std::string> order; // of printing
};

Outcome run(const InkOptions &options)
{
    const InkRequest request{
        .patch = options.patch,
        .against = options.against,
        .illuminant = optional_illuminant(options.illuminant),
        .status = status_of(options.status),
        .paper = options.paper,
        .order = options.order,
    };
    PatchStudy study = study_of(sheet_of(options.file, options), request);
    std::vector<std::string> warnings = study.warnings;
    return outcome_of(std::move(study), std::move(warnings), options);
}

constexpr const char *kInkFooter =
    "Densities are over the paper. Brightness and the whiteness of ASTM E313 describe the patch as "
    "a\npaper. With --against there are, under every illuminant, the difference from that patch "
    "(Delta E00)\nand the metamerism of the two beside --illuminant (sum of two Delta E*ab; DIN "
    "6172), and for each\nband its share in the difference along a* and b* as a signed weight, the "
    "largest 100: positive where\nthe patch is redder, or yellower.\n\n"
    "CSV and CGATS hold one table after the other: spectra, bands, densities, colours; the first "
    "column of\nthe CSV names the table. The fields of the JSON stand in docs/json.md.\n\n"
    "Example:\n  vantrel ink two_ink_halftone.txt --patch \"Magenta 100\" --against \"Magenta 90\"";

} // namespace

Command add_ink(CLI::App &app)
{
    const auto options = std::make_shared<InkOptions>();
    CLI::App *command = app.add_subcommand(
        "ink", "Everything about one patch: spectrum, densities, colours, differences");
    command
        ->add_option("FILE", options->file,
                     "Measurement file: CGATS text, CSV or CxF with spectra; - is standard input")
        ->required();
    command->add_option("--patch", options->patch, "The patch by name or id")->required();
    command->add_option("--against", options->against, "Another patch to set it beside");
    add_sheet_options(*command, *options);
    add_order_option(*command, options->order);
    command->footer(kInkFooter);
    return {command, [options] { return run(*options); }};
}

} // namespace vantrel::program
