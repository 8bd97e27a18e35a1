#include "judge/names.h"

#include "read/text.h"

#include <fmt/format.h>

#include <iterator>

namespace vantrel::sheets {
namespace {

// In the order of the statuses.
constexpr std::string_view statuses[] = {
    "A_STATUS",         "E_STATUS",    "I_STATUS",          "T_STATUS",    "SPECTRAL_STATUS",
    "SPECTRALX_STATUS", "HIFI_STATUS", "HEXACHROME_STATUS", "CCR1_STATUS", "CCR2_STATUS",
};
static_assert(std::size(statuses) == NUM_STATUSES);

// In the order of the responses.
constexpr struct {
    std::string_view name;
    std::string_view code;
} responses[] = {
    {"Visual", "V"},  {"Red", "R"},           {"Green", "G"},
    {"Blue", "B"},    {"HiFi 1", "H1"},       {"HiFi 2", "H2"},
    {"HiFi 3", "H3"}, {"Hexachrome 1", "X1"}, {"Hexachrome 2", "X2"},
};
static_assert(std::size(responses) == NUM_RESPONSES);

bool is_band(int status, int response) { return status == SPECTRALX_STATUS && response != 0; }

} // namespace

std::optional<int> status_named(std::string_view name)
{
    for (int i = 0; i < NUM_STATUSES; ++i)
        if (equal_ignoring_case(statuses[i], name) ||
            equal_ignoring_case(statuses[i], std::string(name) + "_STATUS"))
            return i;
    return std::nullopt;
}

std::string_view status_name(int status) { return statuses[status]; }

std::string status_names() { return fmt::format("{}", fmt::join(statuses, ", ")); }

bool has_response(int status, int response)
{
    if (status == SPECTRAL_STATUS || status == SPECTRALX_STATUS)
        return false;
    const bool hifi = response >= HIFI1_RESPONSE && response <= HIFI3_RESPONSE;
    const bool hexachrome = response == HEXACHROME1_RESPONSE || response == HEXACHROME2_RESPONSE;
    return !(hifi || hexachrome) || (hifi && status == HIFI_STATUS) ||
           (hexachrome && status == HEXACHROME_STATUS);
}

std::optional<int> response_named(std::string_view name)
{
    for (int i = 0; i < NUM_RESPONSES; ++i)
        if (equal_ignoring_case(responses[i].name, name) ||
            equal_ignoring_case(responses[i].code, name))
            return i;
    return std::nullopt;
}

std::string response_names()
{
    std::string out;
    for (const auto &response : responses)
        out += fmt::format("{}{}", out.empty() ? "" : ", ", response.name);
    return out;
}

std::string response_name(int status, int response)
{
    if (status == SPECTRAL_STATUS)
        return fmt::format("{} nm", response);
    return is_band(status, response) ? fmt::format("band {}", response)
                                     : std::string(responses[response].name);
}

std::string response_code(int status, int response)
{
    if (status == SPECTRAL_STATUS)
        return fmt::format("{}", response);
    return is_band(status, response) ? fmt::format("b{}", response)
                                     : std::string(responses[response].code);
}

} // namespace vantrel::sheets
