#include "write/limits.h"

#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <memory>
#include <utility>

namespace vantrel::sheets {
namespace {

// "12", or "9 of 12" where some could not be judged.
std::string judged_of(const LimitResult &result)
{
    return result.judged == result.patches ? fmt::format("{}", result.judged)
                                           : fmt::format("{} of {}", result.judged, result.patches);
}

} // namespace

int decimals_of(const LimitResult &result)
{
    return result.limit.quantity == Quantity::density ? 3 : 2;
}

void add_limits(Lines &lines, const std::string &title, const std::vector<LimitResult> &limits,
                const std::vector<std::string> &places)
{
    if (limits.empty())
        return;
    std::size_t patches = 0, quantity = 0;
    for (const LimitResult &result : limits) {
        patches = std::max(patches, characters(cut(patches_of(result.limit), kWidestInText)));
        quantity = std::max(quantity, characters(title_of(result.limit)));
    }
    lines.add(fmt::format("\n{}\n{:<{}}{:<{}}{:<8}{:>10}{:>9}{:>8}{:>8}  {:<11}{}", title,
                          "Patches", patches + 2, "", quantity + 2, "", "judged", "measured",
                          "limit", "margin", "verdict", "largest at"));
    for (std::size_t i = 0; i < limits.size(); ++i) {
        const LimitResult &result = limits[i];
        const int decimals = decimals_of(result);
        std::string said = cut(result.worst, 20);
        for (const std::string &more : {places.empty() ? "" : places[i], result.note})
            if (!more.empty())
                said += (said.empty() ? "" : "; ") + more;
        lines.add(fmt::format("{:<{}}{:<{}}{:<8}{:>10}{:>9}{:>8}{:>8}  {:<11}{}",
                              cut(patches_of(result.limit), kWidestInText), patches + 2,
                              title_of(result.limit), quantity + 2,
                              title_of(result.limit.statistic), judged_of(result),
                              fixed(result.measured, decimals), fixed(result.limit.limit, decimals),
                              fixed(result.margin(), decimals), name_of(result.verdict), said));
    }
}

std::string counts_of(const std::vector<LimitResult> &limits)
{
    const auto count = [&](Verdict verdict) {
        return std::count_if(limits.begin(), limits.end(),
                             [&](const LimitResult &result) { return result.verdict == verdict; });
    };
    const auto failed = count(Verdict::failed), incomplete = count(Verdict::incomplete);
    std::string out;
    if (failed)
        out = fmt::format("{} of {} limits failed", failed, limits.size());
    if (incomplete)
        out += out.empty()
                   ? fmt::format("{} of {} limits could not be judged", incomplete, limits.size())
                   : fmt::format(", {} could not be judged", incomplete);
    if (!out.empty())
        return out;
    return limits.size() == 1 ? "the limit is held"
                              : fmt::format("all {} limits are held", limits.size());
}

// "judged 160 of 160 patches by 20 of 72 aims, as a strip"
std::string told(const Coverage &coverage)
{
    std::string out = fmt::format("judged {} of {} patches by {} of {} aims", coverage.patches,
                                  coverage.of_patches, coverage.aims, coverage.of_aims);
    if (coverage.is_strip())
        out += ", as a strip of them";
    else if (coverage.allow_missing)
        out += ", which is allowed";
    if (coverage.no_repeats > 0)
        out += fmt::format(", with {} mean{} of no repeats", coverage.no_repeats,
                           coverage.no_repeats == 1 ? "" : "s");
    return out;
}

Json coverage_json(const Coverage &coverage)
{
    return {{"patches", coverage.patches},
            {"of_patches", coverage.of_patches},
            {"aims", coverage.aims},
            {"of_aims", coverage.of_aims},
            {"strip", coverage.is_strip()},
            {"allow_missing", coverage.allow_missing},
            {"no_repeats", coverage.no_repeats}};
}

Json limits_json(const std::vector<LimitResult> &limits)
{
    Json out = Json::array();
    for (const LimitResult &result : limits) {
        const Tolerance &limit = result.limit;
        out.push_back({{"patches", patches_of(limit)},
                       {"label", title_of(limit)},
                       {"group", key_of(limit.group)},
                       {"ink", limit.ink.empty() ? Json() : Json(printable(limit.ink))},
                       {"nominal", or_null(limit.nominal)},
                       {"formula", key_of(limit)},
                       {"statistic", key_of(limit.statistic)},
                       {"aim", or_null(limit.aim)},
                       {"found", result.patches},
                       {"judged", result.judged},
                       {"measured", or_null(result.measured)},
                       {"limit", limit.limit},
                       {"margin", or_null(result.margin())},
                       {"verdict", name_of(result.verdict)},
                       {"max_patch", result.worst.empty() ? Json() : Json(result.worst)},
                       {"note", result.note.empty() ? Json() : Json(result.note)}});
    }
    return out;
}

Flat flat_of(const std::vector<LimitResult> &limits, const std::string &aims,
             const std::string &description)
{
    Flat flat;
    flat.description = description;
    flat.rows = limits.size();
    flat.text("name", "LIMIT", [&limits](std::size_t i) { return patches_of(limits[i].limit); });
    flat.text("aims", "AIMS", [aims](std::size_t) { return aims; });
    flat.text("formula", "FORMULA", [&limits](std::size_t i) { return title_of(limits[i].limit); });
    flat.text("statistic", "STATISTIC",
              [&limits](std::size_t i) { return std::string(key_of(limits[i].limit.statistic)); });
    flat.exact("found", "FOUND",
               [&limits](std::size_t i) { return static_cast<double>(limits[i].patches); });
    flat.exact("judged", "JUDGED",
               [&limits](std::size_t i) { return static_cast<double>(limits[i].judged); });
    flat.number("measured", "MEASURED", [&limits](std::size_t i) { return limits[i].measured; });
    flat.number("value", "VALUE", [&limits](std::size_t i) { return limits[i].limit.limit; });
    flat.number("margin", "MARGIN", [&limits](std::size_t i) { return limits[i].margin(); });
    flat.text("verdict", "VERDICT",
              [&limits](std::size_t i) { return std::string(name_of(limits[i].verdict)); });
    flat.text("max_patch", "MAX_PATCH", [&limits](std::size_t i) { return limits[i].worst; });
    flat.text("note", "NOTE", [&limits](std::size_t i) { return limits[i].note; });
    return flat;
}

Flat flat_of(std::vector<Statement> statements, const std::string &description)
{
    const auto rows = std::make_shared<const std::vector<Statement>>(std::move(statements));
    Flat flat;
    flat.description = description;
    flat.rows = rows->size();
    flat.text("name", "STATEMENT", [rows](std::size_t i) { return (*rows)[i].name; });
    flat.text("verdict", "VERDICT", [rows](std::size_t i) { return (*rows)[i].verdict; });
    flat.text("note", "NOTE", [rows](std::size_t i) { return (*rows)[i].note; });
    return flat;
}

} // namespace vantrel::sheets
