// vantrel list illuminants|statuses|responses|weights

#include "judge/list.h"
#include "judge/names.h"
#include "options.h"
#include "read/text.h"

#include <fmt/format.h>

#include <memory>

namespace vantrel::program {
namespace {

struct ListOptions : Options {
    std::string what;
    std::string response;
};

std::optional<int> response_of(const std::string &name)
{
    if (name.empty())
        return std::nullopt;
    const auto response = response_named(name);
    if (!response)
        throw RequestError{
            fmt::format("no response {}; there are {}", in_quotes(name), response_names())};
    return response;
}

List list_of(const ListOptions &options)
{
    const auto status =
        options.status.empty() ? std::nullopt : std::optional(status_of(options.status));
    const auto response = response_of(options.response);
    if (options.what == "illuminants")
        return options.illuminant.empty()
                   ? list_illuminants()
                   : list_tristimulus_weights(illuminant_of(options.illuminant));
    if (options.what == "statuses")
        return list_statuses();
    return options.what == "responses" ? list_responses(status)
                                       : list_weights(status.value_or(E_STATUS), response);
}

constexpr const char *kListFooter =
    "illuminants: the combinations of illuminant and observer with their white points; with "
    "--illuminant\nthe weights of one, which sum to its white point. statuses: with the codes of "
    "their responses.\nresponses: the filters of every status, or of --status, with the first "
    "wavelength that they let\nthrough, their peak and the last. weights: the filters of --status "
    "(E_STATUS), all or the one of\n--response, band by band, scaled to a peak of 100.\n\n"
    "Examples:\n  vantrel list illuminants\n"
    "  vantrel list weights --status T_STATUS --response Green";

} // namespace

Command add_list(CLI::App &app)
{
    const auto options = std::make_shared<ListOptions>();
    options->illuminant.clear();
    options->status.clear();
    CLI::App *command = app.add_subcommand(
        "list", "The names of illuminants, statuses and responses, and the tables behind them");
    command->add_option("WHAT", options->what, "illuminants, statuses, responses or weights")
        ->required()
        ->check(CLI::IsMember({"illuminants", "statuses", "responses", "weights"}));
    command->add_option("--illuminant", options->illuminant,
                        "One of the illuminants: " + illuminant_names());
    command->add_option("--status", options->status, "One of the statuses: " + status_names());
    command->add_option("--response", options->response,
                        "One of the responses: " + response_names());
    add_common_options(*command, *options);
    command->footer(kListFooter);
    return {command, [options] { return outcome_of(list_of(*options), {}, *options); }};
}

} // namespace vantrel::program
