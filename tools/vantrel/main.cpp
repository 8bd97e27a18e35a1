// vantrel: what a measured sheet says, from the command line.
//
// Exit status: 0 done; 1 a sheet failed its tolerances or could not be judged whole; 2 the request
// or a file is at fault; 3 the output could not be written.

#include "options.h"
#include "output_file.h"
#include "progress.h"
#include "read/text.h"
#include "system.h"

#include <fmt/format.h>

#include <cstdio>
#include <exception>
#include <new>
#include <sstream>
#include <string_view>

using namespace vantrel::program;

namespace {

enum ExitStatus { done = 0, out_of_tolerance = 1, refused = 2, not_written = 3 };

// An empty value, such as a script's variable that was never set, would switch off what it is for.
void refuse_empty(int count, char **words)
{
    for (int i = 1; i < count; ++i) {
        const std::string_view word = words[i];
        if (word.starts_with("--") && word.ends_with('='))
            throw RequestError{
                fmt::format("{}: its value is empty", printable(word.substr(0, word.size() - 1)))};
        if (word.empty() && i > 1)
            throw RequestError{fmt::format("the word after {} is empty", in_quotes(words[i - 1]))};
    }
}

// Reads the command line and carries it out.
Outcome run(CLI::App &app, int count, char **words)
{
    refuse_empty(count, words);
    app.require_subcommand(1);
    app.set_version_flag("--version", VANTREL_VERSION);
    const Command commands[] = {add_report(app),  add_compare(app), add_run(app),
                                add_predict(app), add_ink(app),     add_list(app)};
    std::vector<std::string> names;
    for (const Command &command : commands)
        names.push_back(command.app->get_name());
    app.footer(
        "Exit status: 0 done; 1 a sheet failed its tolerances or could not be judged whole; 2 "
        "the request\nor a file is at fault; 3 the output could not be written.\n\n"
        "Example:\n  vantrel report two_ink_halftone.txt\n\n"
        "vantrel COMMAND --help tells the options of a command.");
    try {
        app.parse(count, words);
    } catch (const CLI::Success &wish) { // --help, --version
        std::ostringstream text, unused;
        app.exit(wish, text, unused);
        return {[text = text.str()](const Sink &sink) { sink.write(text); }, "", {}};
    } catch (const CLI::RequiredError &) {
        if (!app.get_subcommands().empty()) // one of its own arguments
            throw;
        const auto rest = app.remaining();
        throw RequestError{
            fmt::format("{}; there are {}",
                        rest.empty() ? "a command is required" : "no command " + in_quotes(rest[0]),
                        fmt::join(names, ", "))};
    }
    for (const Command &command : commands)
        if (command.app->parsed())
            return command.run();
    return {};
}

void write(const Outcome &outcome)
{
    OutputFile file(outcome.output);
    const bool on_terminal = outcome.output.empty() && is_terminal(Stream::output);
    outcome.write(
        {[&](std::string_view text) { file.write(text); }, on_terminal ? Tell() : progress_bar()});
    file.finish();
    if (const std::size_t names = file.other_names())
        complain(fmt::format("{} to {} the old content",
                             names == 1 ? "a hard link" : fmt::format("{} hard links", names),
                             printable(outcome.output) + (names == 1 ? " keeps" : " keep")));
}

int exit_status(int count, char **words)
{
    CLI::App app("Colour measurement for the graphic arts.", "vantrel");
    try {
        const Outcome outcome = run(app, count, words);
        for (const std::string &warning : outcome.warnings)
            complain(warning);
        try {
            write(outcome);
        } catch (const OutputError &error) {
            const bool to_file = !outcome.output.empty() && outcome.output != "-";
            complain((to_file ? printable(outcome.output) : "standard output") + ": " +
                     error.reason);
            return not_written;
        }
        return outcome.within_tolerance ? done : out_of_tolerance;
    } catch (const RequestError &error) {
        complain(error.message);
    } catch (const CLI::ParseError &error) {
        complain(printable(error.what()));
    }
    return refused;
}

} // namespace

int main(int count, char **words)
{
    try {
        prepare(words);
        return exit_status(count, words);
    } catch (const std::bad_alloc &) {
        static_cast<void>(std::fputs("vantrel: not enough memory\n", stderr));
    } catch (const std::exception &error) {
        static_cast<void>(std::fprintf(stderr, "vantrel: %s\n", error.what()));
    }
    return refused;
}
