#include "write/table_text.h"

#include "read/illuminant.h"
#include "read/text.h"
#include "write/result.h"

#include <fmt/format.h>

#include <algorithm>

namespace vantrel::sheets {

std::string fixed(const std::optional<double> &value, int decimals)
{
    if (!value)
        return "";
    std::string out = fmt::format("{:.{}f}", *value, decimals);
    return out.find_first_of("123456789in") == std::string::npos && out[0] == '-' ? out.substr(1)
                                                                                  : out;
}

std::string fixed(const CIELABCOORD &lab)
{
    return fmt::format("{} {} {}", fixed(lab.L), fixed(lab.a), fixed(lab.b));
}

std::string said(const PaperChoice &paper)
{
    return fmt::format("{} ({})", paper.exists() ? cut(paper.name, kWidestInText) : "no paper",
                       paper.reason);
}

std::string over(const PaperChoice &paper)
{
    return (paper.exists() ? "over " : "absolute, ") + said(paper);
}

std::string said(const IlluminantChoice &choice)
{
    return fmt::format("{}{}", name_of(choice.illuminant),
                       choice.by == "file" ? " as the file says" : "");
}

std::size_t characters(const std::string &text)
{
    return static_cast<std::size_t>(
        std::count_if(text.begin(), text.end(), [](char c) { return (c & 0xC0) != 0x80; }));
}

std::string swatch(const Rgb &rgb)
{
    return fmt::format("\x1b[48;2;{};{};{}m    \x1b[0m", rgb.red, rgb.green, rgb.blue);
}

void add_advice(Lines &lines, const std::string &title, const std::vector<SolidAdvice> &advice)
{
    if (advice.empty())
        return;
    lines.add(
        fmt::format("\n{:<24}{:>8}{:>16}{:>12}", title, "ΔE00", "density change", "ΔE00 after"));
    for (const SolidAdvice &solid : advice) {
        const Advice &one = solid.advice;
        lines.add(fmt::format(
            "{:<24}{:>8}{:>16}{:>12}  {}", cut(name_of(solid), 23), fixed(one.de00),
            fmt::format("{}{}", one.density_change > 0 ? "+" : "", fixed(one.density_change, 3)),
            fixed(one.de00_after), words_of(one)));
    }
    lines.add(std::string(kAdviceFrom));
    lines.add(std::string(kAdviceElse));
}

void write_warnings(const std::vector<std::string> &warnings, const Sink &sink)
{
    if (warnings.empty())
        return;
    Lines lines(sink);
    lines.add("\nWarnings");
    for (const std::string &warning : warnings)
        lines.add("- " + warning);
}

void Lines::add(std::string line)
{
    line.resize(line.find_last_not_of(' ') + 1);
    sink.write(line + '\n');
}

} // namespace vantrel::sheets
