// vantrel: what a measured sheet says, from the command line.
//
// Exit status: 0 done; 1 the output could not be written; 2 the request or the file is at fault.

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <string>
#include <unistd.h>

#include <CLI/CLI.hpp>
#include <fmt/format.h>

#include "cgats.h"
#include "file.h"
#include "names.h"
#include "report.h"
#include "text.h"

namespace {

// A request that cannot be met: the message.
struct RequestError {
    std::string message;
};

struct Options {
    std::string file;
    std::string illuminant = "D50_2DEG";
    std::string paper; // name or id; the first patch where it is empty
    std::string format = "table";
    bool no_color = false;
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

const Patch &paper_of(const Measurement &sheet, const Options &options)
{
    if (options.paper.empty())
        return sheet.patches.front();
    for (const Patch &patch : sheet.patches)
        if (patch.name == options.paper)
            return patch;
    for (const Patch &patch : sheet.patches)
        if (patch.id == options.paper)
            return patch;
    std::string names;
    for (std::size_t i = 0; i < sheet.patches.size() && i < 8; ++i)
        names += (i ? ", " : "") + in_quotes(sheet.patches[i].name);
    throw RequestError{fmt::format("{} holds no patch {}; its patches are {}{}",
                                   printable(options.file), in_quotes(options.paper), names,
                                   sheet.patches.size() > 8 ? ", …" : "")};
}

std::string run_report(const Options &options)
{
    const auto illuminant = illuminant_named(options.illuminant);
    if (!illuminant)
        throw RequestError{fmt::format("no illuminant {}; there are {}",
                                       in_quotes(options.illuminant), illuminant_names())};
    const Measurement sheet = read_cgats(read_file(options.file));
    const std::string file = printable(options.file);
    const Report report = report_of(sheet, file, *illuminant, paper_of(sheet, options));
    for (const std::string &warning : sheet.warnings)
        complain(fmt::format("{}:{}", file, warning));
    if (options.format == "json")
        return as_json(report);
    return options.format == "csv" ? as_csv(report) : as_table(report, shows_colour(options));
}

// Reads the command line and carries it out; the result is the text to print.
std::string run(CLI::App &app, Options &options, int count, char **words)
{
    app.require_subcommand(1);
    app.set_version_flag("--version", VANTREL_VERSION);
    CLI::App *report = app.add_subcommand("report", "The colour of every patch of a sheet");
    report->add_option("FILE", options.file, "Measurement file: CGATS text with spectra")
        ->required();
    report
        ->add_option("--illuminant", options.illuminant,
                     "Illuminant and observer: " + illuminant_names())
        ->capture_default_str();
    report->add_option("--paper", options.paper,
                       "The paper's patch by name or id (default: the first patch)");
    report->add_option("--format", options.format, "table, csv or json")
        ->check(CLI::IsMember({"table", "csv", "json"}))
        ->capture_default_str();
    report->add_flag("--no-color", options.no_color, "No colour swatches on a terminal");
    report->footer("Example:\n  vantrel report two_ink_halftone.txt --illuminant D65_10DEG "
                   "--paper Paper --format csv");
    app.footer("Example:\n  vantrel report two_ink_halftone.txt\n\n"
               "vantrel COMMAND --help tells the options of a command.");
    try {
        app.parse(count, words);
    } catch (const CLI::Success &wish) { // --help, --version
        std::ostringstream text, unused;
        app.exit(wish, text, unused);
        return text.str();
    }
    return run_report(options);
}

// The exit status.
int status_of(int count, char **words)
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
        return status_of(count, words);
    } catch (const std::bad_alloc &) {
        static_cast<void>(std::fputs("vantrel: not enough memory\n", stderr));
    } catch (const std::exception &error) {
        static_cast<void>(std::fprintf(stderr, "vantrel: %s\n", error.what()));
    }
    return 2;
}
