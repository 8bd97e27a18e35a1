#include "options.h"

#include "file.h"
#include "judge/names.h"
#include "progress.h"
#include "read/reader.h"
#include "read/text.h"
#include "system.h"

#include <fmt/format.h>

#include <cstdio>
#include <cstdlib>
#include <optional>

namespace vantrel::program {
void add_common_options(CLI::App &command, Options &options)
{
    command.add_option("--format", options.format, "table, csv, json, cgats or html")
        ->check(CLI::IsMember(std::vector<std::string>(kFormats.begin(), kFormats.end())))
        ->capture_default_str();
    command.add_option("-o,--output", options.output,
                       "Write to this file instead of standard output; it is replaced whole or not "
                       "at all");
    command.add_flag("--no-color", options.no_color, "No colour swatches on a terminal");
}

void add_sheet_options(CLI::App &command, Options &options)
{
    command.add_option(
        "--illuminant", options.illuminant,
        "Illuminant and observer (default: what the file states, or else D50_2DEG): " +
            illuminant_names());
    command.add_option("--status", options.status, "Density status: " + status_names())
        ->capture_default_str();
    command.add_option(
        "--paper", options.paper,
        "The paper's patch by name or id, or none for absolute densities (default: the mean "
        "of the patches without ink, or else the lightest)");
    command
        .add_option("--scale", options.scale,
                    "Scale of a file's reflectances: auto, percent, or fraction for 0 to 1")
        ->check(CLI::IsMember({"auto", "percent", "fraction"}))
        ->capture_default_str();
    add_condition_option(command, "--condition", options.condition,
                         "Measurement condition to read from a file with several: M0, M1, M2 or M3 "
                         "(default: M1, or else the first)");
    add_common_options(command, options);
}

void add_condition_option(CLI::App &command, const std::string &name, std::string &condition,
                          const std::string &description)
{
    command.add_option(name, condition, description)
        ->check(CLI::IsMember({"M0", "M1", "M2", "M3"}, CLI::ignore_case));
}

void add_order_option(CLI::App &command, std::vector<std::string> &order)
{
    command
        .add_option("--order", order,
                    "Inks in the order of printing, by device field or solid, with commas between "
                    "(default: the order of the device fields)")
        ->delimiter(',')
        ->allow_extra_args(false);
}

std::optional<double> number_of_option(std::string_view text)
{
    return text.find(',') == std::string_view::npos ? number_in(text) : std::nullopt;
}

CLI::Validator is_number()
{
    return {[](const std::string &text) {
                return number_of_option(text)
                           ? ""
                           : fmt::format("{} is no number such as 1.5", in_quotes(text));
            },
            ""};
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

std::optional<ILLUM_OBS> optional_illuminant(const std::string &name)
{
    return name.empty() ? std::nullopt : std::optional(illuminant_of(name));
}

Measurement sheet_of(const std::string &path, const Options &options, bool colours)
{
    const std::string file = printable(path);
    try {
        Reading reading;
        if (options.scale != "auto")
            reading.scale = options.scale == "percent" ? Scale::percent : Scale::fraction;
        reading.condition = options.condition;
        reading.colours = colours;
        reading.tell = progress_bar();
        Measurement sheet = read_measurement(read_file(path), reading);
        sheet.file = file;
        return sheet;
    } catch (const InputError &error) {
        throw RequestError{complaint_of(file, error)};
    }
}

Tolerances tolerances_of(const std::string &path)
{
    if (path.empty())
        return {};
    const std::string file = printable(path);
    try {
        Tolerances tolerances = read_tolerances(read_file(path));
        if (tolerances.name.empty())
            tolerances.name = file;
        return tolerances;
    } catch (const InputError &error) {
        throw RequestError{complaint_of(file, error)};
    }
}

bool shows_colour(const Options &options)
{
    const char *terminal = std::getenv("TERM");
    const char *no_color = std::getenv("NO_COLOR");
    return !options.no_color && options.output.empty() && is_terminal(Stream::output) &&
           !(no_color && *no_color) && !(terminal && std::string_view(terminal) == "dumb");
}

void complain(const std::string &message)
{
    wipe_bar();
    static_cast<void>(std::fputs(("vantrel: " + message + "\n").c_str(), stderr));
}

} // namespace vantrel::program
