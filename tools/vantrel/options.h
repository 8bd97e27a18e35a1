// What every command takes, and how its result leaves the program.
#pragma once

#include "judge/tolerances.h"
#include "read/measurement.h"
#include "write/format.h"

#include <CLI/CLI.hpp>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace vantrel::program {

using namespace sheets;

struct Options {
    std::string illuminant; // what the file states, or D50, where it is empty
    std::string status = "E_STATUS";
    std::string paper; // name or id
    std::string scale = "auto";
    std::string condition; // M1 or the only one where it is empty
    std::string format = "table";
    std::string output; // a file; standard output where it is empty
    bool no_color = false;
};

// What a command has to say.
struct Outcome {
    std::function<void(const Sink &)> write; // throws RequestError
    std::string output;                      // as in Options
    std::vector<std::string> warnings;
    bool within_tolerance = true;
};

struct Command {
    CLI::App *app;
    std::function<Outcome()> run; // throws RequestError
};

// The commands; each stands in a file of its own.
Command add_report(CLI::App &app);
Command add_compare(CLI::App &app);
Command add_run(CLI::App &app);
Command add_predict(CLI::App &app);
Command add_ink(CLI::App &app);
Command add_list(CLI::App &app);

// The options that every command has, and those of commands that measure a sheet.
void add_common_options(CLI::App &command, Options &options);
void add_sheet_options(CLI::App &command, Options &options);
void add_condition_option(CLI::App &command, const std::string &name, std::string &condition,
                          const std::string &description);
void add_order_option(CLI::App &command, std::vector<std::string> &order);

// A finite decimal number with a point: commas separate values.
std::optional<double> number_of_option(std::string_view text);
CLI::Validator is_number();

// What the options name; throw RequestError.
ILLUM_OBS illuminant_of(const std::string &name);
int status_of(const std::string &name);

// Nothing where the name is empty.
std::optional<ILLUM_OBS> optional_illuminant(const std::string &name);

// Reads a file; one of colours alone will do where `colours` says so. Throws RequestError.
Measurement sheet_of(const std::string &path, const Options &options, bool colours = false);

// The limits of a TOML file, under its name where it names itself not; none where the path is
// empty. Throws RequestError.
Tolerances tolerances_of(const std::string &path);

bool shows_colour(const Options &options);

// One line on standard error; there is nobody to tell when that cannot be written.
void complain(const std::string &message);

// A result in the format that the options ask for.
template <typename Result>
Outcome outcome_of(Result result, std::vector<std::string> warnings, const Options &options,
                   TableStyle style = {})
{
    style.colour = shows_colour(options);
    if (options.format == "html")
        choose_for_page(result);
    const auto kept = std::make_shared<const Result>(std::move(result)); // std::function copies
    const bool to_file = !options.output.empty() && options.output != "-";
    const auto write = [kept, format = options.format, style, to_file, warnings](const Sink &sink) {
        write_as(format, *kept, sink, style);
        if (to_file && format == "table") // whose readers do not see standard error
            write_warnings(warnings, sink);
    };
    return {write, options.output, std::move(warnings)};
}

} // namespace vantrel::program
