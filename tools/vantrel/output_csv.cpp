#include <iterator>

#include <fmt/format.h>

#include "report.h"

namespace {

// RFC 4180: quoted where it holds a separator or a quote, quotes doubled.
std::string field(const std::string &text)
{
    if (text.find_first_of(",\"") == std::string::npos)
        return text;
    std::string out = "\"";
    for (const char c : text)
        out += c == '"' ? "\"\"" : std::string(1, c);
    return out + '"';
}

} // namespace

std::string as_csv(const Report &report)
{
    std::string out = "id,name,rgb,L,a,b,C,h,dE00_paper\n";
    for (const PatchReport &patch : report.patches)
        fmt::format_to(std::back_inserter(out),
                       "{},{},#{:02x}{:02x}{:02x},{:.4f},{:.4f},{:.4f},{:.4f},{:.4f},{:.4f}\n",
                       field(patch.id), field(patch.name), patch.red, patch.green, patch.blue,
                       patch.lab.L, patch.lab.a, patch.lab.b, patch.lch.C, patch.lch.h,
                       patch.to_paper);
    return out;
}
