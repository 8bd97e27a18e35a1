// vantrel: what a measured sheet says, from the command line.
//
// Exit status: 0 done; 1 the output could not be written; 2 the request or the file is at fault.

#include <cmath>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <string>
#include <unistd.h>
#include <vector>

#include <CLI/CLI.hpp>
#include <fmt/format.h>

#include "cgats.h"
#include "file.h"
#include "inks.h"
#include "names.h"
#include "predict.h"
#include "report.h"
#include "text.h"

namespace {

struct Options {
    std::string file;
    std::string illuminant = "D50_2DEG";
    std::string paper; // name or id; the first patch where it is empty
    std::string format = "table";
    bool no_color = false;
    std::vector<std::string> order; // of printing
    std::string status = "E_STATUS";
    double n_factor = 1;
    std::string second_paper;           // none where it is empty
    std::string second_illuminant;      // its default follows the first
    std::vector<std::string> ink_tints; // NAME:PERCENT
};

// One line on standard error; there is nobody to tell when that cannot be written.
void complain(const std::string &message)
{
    static_cast<void>(std::fputs(("vantrel: " + message + "\n").c_str(), stderr));
}

bool shows_colour(const Options &options)
{
    const char *terminal = std::getenv("TERM");
    const char *no_color = std::getenv("NO_COLOR");
    return !options.no_color && isatty(STDOUT_FILENO) && !(no_color && *no_color) &&
           !(terminal && std::string_view(terminal) == "dumb");
}

ILLUM_OBS illuminant_of(const std::string &name)
{
    const auto illuminant = illuminant_named(name);
    if (!illuminant)
        throw RequestError{
            fmt::format("no illuminant {}; there are {}", in_quotes(name), illuminant_names())};
    return *illuminant;
}

int status_of(const std::string &name)
{
    const auto status = status_named(name);
    if (!status)
        throw RequestError{
            fmt::format("no status {}; there are {}", in_quotes(name), status_names())};
    return *status;
}

// Illuminant A beside daylight and lamps, D65 beside A, with the same observer.
ILLUM_OBS usual_second(ILLUM_OBS first)
{
    const bool ten_degrees = first % 2 == 1;
    if (first == A_2DEG || first == A_10DEG)
        return ten_degrees ? D65_10DEG : D65_2DEG;
    return ten_degrees ? A_10DEG : A_2DEG;
}

Measurement sheet_of(const Options &options)
{
    Measurement sheet = read_cgats(read_file(options.file));
    sheet.file = printable(options.file);
    return sheet;
}

const Patch &paper_of(const Measurement &sheet, const Options &options)
{
    return options.paper.empty() ? sheet.patches.front() : patch_named(sheet, options.paper);
}

template <typename Result>
std::string formatted(const Result &result, const Measurement &sheet, const Options &options)
{
    for (const std::string &warning : sheet.warnings)
        complain(fmt::format("{}:{}", sheet.file, warning));
    if (options.format == "json")
        return as_json(result);
    return options.format == "csv" ? as_csv(result) : as_table(result, shows_colour(options));
}

std::string run_report(const Options &options)
{
    if (!(options.n_factor > 0) || !std::isfinite(options.n_factor))
        throw RequestError{"--n-factor takes a number above 0"};
    Request request;
    request.illuminant = illuminant_of(options.illuminant);
    request.status = status_of(options.status);
    request.n_factor = options.n_factor;
    request.second_illuminant = options.second_illuminant.empty()
                                    ? usual_second(request.illuminant)
                                    : illuminant_of(options.second_illuminant);
    const Measurement sheet = sheet_of(options);
    request.paper = &paper_of(sheet, options);
    if (!options.second_paper.empty())
        request.second_paper = &patch_named(sheet, options.second_paper);
    return formatted(report_of(sheet, Inks(sheet, options.order), request), sheet, options);
}

std::string run_predict(const Options &options)
{
    const ILLUM_OBS illuminant = illuminant_of(options.illuminant);
    const Measurement sheet = sheet_of(options);
    const Inks inks(sheet, options.order);
    const Patch &paper = paper_of(sheet, options);
    return formatted(options.ink_tints.empty()
                         ? predict_overprints(sheet, inks, paper, illuminant)
                         : predict(sheet, inks, paper, illuminant, options.ink_tints),
                     sheet, options);
}

CLI::App *add_command(CLI::App &app, const char *name, const char *description, Options &options)
{
    CLI::App *command = app.add_subcommand(name, description);
    command->add_option("FILE", options.file, "Measurement file: CGATS text with spectra")
        ->required();
    command
        ->add_option("--illuminant", options.illuminant,
                     "Illuminant and observer: " + illuminant_names())
        ->capture_default_str();
    command->add_option("--paper", options.paper,
                        "The paper's patch by name or id (default: the first patch)");
    command
        ->add_option("--order", options.order,
                     "Inks in the order of printing, by device field or solid, with commas between "
                     "(default: the order of the device fields)")
        ->delimiter(',')
        ->allow_extra_args(false);
    command->add_option("--format", options.format, "table, csv or json")
        ->check(CLI::IsMember({"table", "csv", "json"}))
        ->capture_default_str();
    command->add_flag("--no-color", options.no_color, "No colour swatches on a terminal");
    return command;
}

void add_report(CLI::App &app, Options &options)
{
    CLI::App *report =
        add_command(app, "report",
                    "The colour, density and print attributes of every patch of a sheet", options);
    report->add_option("--status", options.status, "Density status: " + status_names())
        ->capture_default_str();
    report->add_option("--n-factor", options.n_factor, "Yule-Nielsen factor of the dot areas")
        ->capture_default_str();
    report->add_option("--second-paper", options.second_paper,
                       "Patch to tell the paper's metamerism against, by name or id");
    report->add_option("--second-illuminant", options.second_illuminant,
                       "Illuminant of that metamerism beside --illuminant (default: A_2DEG or "
                       "A_10DEG, beside these D65_2DEG or D65_10DEG)");
    report->footer(
        "The response that reads a patch is V(isual), R(ed), G(reen), B(lue), H1 to H3 (HiFi), X1 "
        "or "
        "X2\n(Hexachrome), a wavelength in nm under SPECTRAL_STATUS, a band (b0 is 400 nm, b30 700 "
        "nm) under\nSPECTRALX_STATUS. Densities are over the paper under every status. Dot area "
        "and "
        "gain are those\nof tints of one ink, in the response of its solid; print contrast that of "
        "tints from 75 to 80 %;\ntrap (Preucil) that of two solids, in the response of the second "
        "ink. Device values tell the inks.\n\n"
        "JSON, for each patch, null where it makes no sense: lab, lch (h in degrees), rgb, "
        "de00_to_paper,\nresponse, response_id, density; in percent dot_area, dot_gain, "
        "print_contrast, hue_error, grayness,\ntrap. For the paper: lab, brightness (percent), "
        "whiteness or the reason no_whiteness, metamerism\n(sum of two Delta E*ab; DIN 6172).\n\n"
        "Example:\n  vantrel report two_ink_halftone.txt --status T_STATUS "
        "--paper Paper --format csv");
}

CLI::App *add_predict(CLI::App &app, Options &options)
{
    CLI::App *predict = add_command(
        app, "predict", "The colour that inks will have as tints and over one another", options);
    predict
        ->add_option("--ink", options.ink_tints,
                     "NAME:PERCENT, once for each of one to three inks in the order of printing. "
                     "NAME is the solid's patch by name or id, or the ink's device field. Without "
                     "any, every measured overprint of two or three inks is predicted")
        ->allow_extra_args(false);
    predict->footer(
        "Two models stand side by side: tints as halftones, which mix ink and paper by area, and "
        "as "
        "thinner\nfilms. Where the file holds the same combination, its colour and the difference "
        "are shown.\n\n"
        "JSON, for each prediction: inks (name, percent); for halftone and film lab, rgb, refl (31 "
        "bands in\npercent), de00_to_measured; measured (name, lab, rgb) or null.\n\n"
        "Example:\n  vantrel predict two_ink_halftone.txt --ink \"Magenta 100:40\" --ink "
        "CMYK_Y:70");
    return predict;
}

// Reads the command line and carries it out; the result is the text to print.
std::string run(CLI::App &app, Options &options, int count, char **words)
{
    app.require_subcommand(1);
    app.set_version_flag("--version", VANTREL_VERSION);
    add_report(app, options);
    const CLI::App *predict = add_predict(app, options);
    app.footer("Example:\n  vantrel report two_ink_halftone.txt\n\n"
               "vantrel COMMAND --help tells the options of a command.");
    try {
        app.parse(count, words);
    } catch (const CLI::Success &wish) { // --help, --version
        std::ostringstream text, unused;
        app.exit(wish, text, unused);
        return text.str();
    }
    return predict->parsed() ? run_predict(options) : run_report(options);
}

// The exit status.
int exit_status(int count, char **words)
{
    Options options;
    CLI::App app("Colour measurement for the graphic arts.", "vantrel");
    try {
        const std::string problem = write_output(run(app, options, count, words));
        if (problem.empty())
            return 0;
        complain("standard output: " + problem);
        return 1;
    } catch (const InputError &error) {
        const std::string line = error.line ? fmt::format(":{}", error.line) : "";
        complain(printable(options.file) + line + ": " + error.reason);
    } catch (const RequestError &error) {
        complain(error.message);
    } catch (const CLI::ParseError &error) {
        complain(printable(error.what()));
    }
    return 2;
}

} // namespace

int main(int count, char **words)
{
    static_cast<void>(std::signal(SIGPIPE, SIG_IGN)); // a lost reader is an error of writing
    try {
        return exit_status(count, words);
    } catch (const std::bad_alloc &) {
        static_cast<void>(std::fputs("vantrel: not enough memory\n", stderr));
    } catch (const std::exception &error) {
        static_cast<void>(std::fprintf(stderr, "vantrel: %s\n", error.what()));
    }
    return 2;
}
