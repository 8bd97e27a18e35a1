// vantrel report FILE…

#include "judge/report.h"
#include "options.h"
#include "progress.h"
#include "read/text.h"
#include "system.h"

#include <fmt/format.h>

#include <memory>

namespace vantrel::program {
namespace {

struct ReportOptions : Options {
    std::vector<std::string> files;
    std::vector<std::string> order; // of printing
    double n_factor = 1;
    std::string second_paper;      // none where it is empty
    std::string second_illuminant; // its default follows the first
    std::string advice;            // file of the aims; none where it is empty
};

// NAME, or FILE:NAME where there is such a file.
struct SecondPaper {
    std::optional<Measurement> sheet;
    std::string name;
};

SecondPaper second_paper_of(const ReportOptions &options)
{
    const std::string &text = options.second_paper;
    for (std::size_t colon = text.rfind(':'); colon != std::string::npos && colon > 0;
         colon = text.rfind(':', colon - 1)) {
        const std::string path = text.substr(0, colon);
        if (is_regular_file(path))
            return {sheet_of(path, options, true), text.substr(colon + 1)};
    }
    return {std::nullopt, text};
}

// FILE:NAME without such a file may be the name of a patch.
void require_patch_or_file(const Measurement &sheet, const std::string &paper)
{
    if (const auto colon = paper.rfind(':');
        colon != std::string::npos && !find_patch(sheet, paper))
        throw RequestError{fmt::format("--second-paper: there is no file {}, and {} holds no patch "
                                       "{}",
                                       in_quotes(paper.substr(0, colon)), sheet.file,
                                       in_quotes(paper))};
}

Outcome run(const ReportOptions &options)
{
    if (!(options.n_factor > 0))
        throw RequestError{"--n-factor takes a number above 0"};
    const SecondPaper second = second_paper_of(options);
    const std::optional<Measurement> aims =
        options.advice.empty() ? std::nullopt
                               : std::optional(sheet_of(options.advice, options, true));
    const ReportRequest request{
        .illuminant = optional_illuminant(options.illuminant),
        .status = status_of(options.status),
        .paper = options.paper,
        .n_factor = options.n_factor,
        .order = options.order,
        .second_paper = second.name,
        .second_sheet = second.sheet ? &*second.sheet : nullptr,
        .second_illuminant = optional_illuminant(options.second_illuminant),
        .aims = aims ? &*aims : nullptr,
        .tell = progress_bar(),
    };
    std::vector<Report> sheets;
    std::vector<std::string> warnings;
    for (const std::string &file : files_of(options.files)) {
        Measurement sheet = sheet_of(file, options, true);
        if (!second.sheet)
            require_patch_or_file(sheet, second.name);
        sheets.push_back(report_of(std::move(sheet), request));
        for (const std::string &warning : sheets.back().warnings)
            warnings.push_back(warning);
    }
    return outcome_of(std::move(sheets), std::move(warnings), options);
}

constexpr const char *kReportFooter =
    "The response that reads a patch is V(isual), R(ed), G(reen), B(lue), H1 to H3 (HiFi), X1 or "
    "X2\n(Hexachrome), a wavelength in nm under SPECTRAL_STATUS, a band (b0 is 400 nm, b30 700 nm) "
    "under\nSPECTRALX_STATUS. Densities are over the paper under every status. Dot area and gain "
    "are those\nof tints of one ink, in the response of its solid; print contrast that of tints "
    "from 75 to 80 %;\ntrap (Preucil) that of two solids, in the response of the second ink. "
    "Device values tell the inks.\n\n"
    "Output as CSV and CGATS has a row for each patch, with its device values and its spectrum in\n"
    "percent. The fields of the JSON stand in docs/json.md.\n\n"
    "Example:\n"
    "  vantrel report two_ink_halftone.txt --status T_STATUS --paper Paper\n"
    "  vantrel report monday.txt tuesday.txt --format csv -o week.csv";

} // namespace

Command add_report(CLI::App &app)
{
    const auto options = std::make_shared<ReportOptions>();
    CLI::App *command = app.add_subcommand(
        "report", "The colour, density and print attributes of every patch of a sheet");
    command
        ->add_option("FILE", options->files,
                     "Measurement files: CGATS text, CSV or CxF with spectra; - is standard input")
        ->required();
    add_sheet_options(*command, *options);
    add_order_option(*command, options->order);
    command->add_option("--n-factor", options->n_factor, "Yule-Nielsen factor of the dot areas")
        ->check(is_number())
        ->capture_default_str();
    command->add_option(
        "--second-paper", options->second_paper,
        "Paper to compare with, by name or id, or FILE:NAME for one of another file "
        "(FILE: for its paper): colour difference and metamerism");
    command->add_option("--second-illuminant", options->second_illuminant,
                        "Illuminant of that metamerism beside --illuminant (default: A_2DEG or "
                        "A_10DEG, beside these D65_2DEG or D65_10DEG)");
    command->add_option("--advice", options->advice,
                        "Measurement file of aims: tell the density change that brings each solid "
                        "nearest to its aim");
    command->footer(kReportFooter);
    return {command, [options] { return run(*options); }};
}

} // namespace vantrel::program
