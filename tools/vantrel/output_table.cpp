#include <algorithm>
#include <cmath>
#include <iterator>

#include <fmt/format.h>

#include "names.h"
#include "report.h"
#include "text.h"

namespace {

constexpr std::size_t widest_name = 40;

// Two decimals without a minus before zero.
std::string fixed(double value)
{
    return fmt::format("{:.2f}", std::abs(value) < 0.005 ? 0.0 : value);
}

std::size_t characters(const std::string &text)
{
    return static_cast<std::size_t>(
        std::count_if(text.begin(), text.end(), [](char c) { return (c & 0xC0) != 0x80; }));
}

} // namespace

std::string as_table(const Report &report, bool colour)
{
    std::string out =
        fmt::format("{}: {} patches, {}, ΔE00 to {}\n", report.file, report.patches.size(),
                    name_of(report.illuminant), cut(report.paper, widest_name));
    const Source &source = report.source;
    if (source.first_nm != 400 || source.last_nm != 700 || source.bands != VANTREL_BANDS)
        out +=
            fmt::format("Of {} values from {:g} to {:g} nm, the 31 from 400 to 700 nm are used\n",
                        source.bands, source.first_nm, source.last_nm);
    if (source.scaled)
        out += "The file's reflectance factors are brought to percent\n";

    std::size_t width = 5;
    for (const PatchReport &patch : report.patches)
        width = std::max(width, characters(cut(patch.name, widest_name)));
    const auto put = std::back_inserter(out);
    fmt::format_to(put, "\n{:<{}} {}{:>8}{:>8}{:>8}{:>8}{:>8}{:>8}\n", "Patch", width,
                   colour ? "    " : "", "L*", "a*", "b*", "C*", "h", "ΔE00");
    for (const PatchReport &patch : report.patches) {
        fmt::format_to(put, "{:<{}} ", cut(patch.name, widest_name), width);
        if (colour)
            fmt::format_to(put, "\x1b[48;2;{};{};{}m    \x1b[0m", patch.red, patch.green,
                           patch.blue);
        for (const double value :
             {patch.lab.L, patch.lab.a, patch.lab.b, patch.lch.C, patch.lch.h, patch.to_paper})
            fmt::format_to(put, "{:>8}", fixed(value));
        out += '\n';
    }
    return out;
}
