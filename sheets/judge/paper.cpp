#include "judge/paper.h"

#include "judge/colour.h"
#include "judge/repeats.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>

namespace vantrel::sheets {
namespace {

constexpr double kChromaOfPaper = 12; // C*: more than white stock for print has
constexpr double kSpreadOfPaper = 1;  // ΔE00: more than places of one sheet differ
constexpr double kBelowPaper = -0.02; // densities

using Places = std::vector<std::size_t>;

template <typename Condition> Places places_where(const Measurement &sheet, Condition holds)
{
    Places out;
    for (std::size_t i = 0; i < sheet.patches.size(); ++i)
        if (holds(sheet.patches[i]))
            out.push_back(i);
    return out;
}

Places places_named(const Measurement &sheet, std::string_view name)
{
    Places out = places_where(sheet, [&](const Patch &patch) { return patch.name == name; });
    if (out.empty())
        out = places_where(sheet, [&](const Patch &patch) { return patch.id == name; });
    if (out.empty())
        patch_named(sheet, name); // throws
    return out;
}

// The largest RGB value of a scale, where the sheet's values reach its end.
std::optional<double> white_of_rgb(const Measurement &sheet)
{
    double largest = 0;
    for (const Patch &patch : sheet.patches)
        for (const auto &[field, value] : patch.device)
            if (!is_ink(field))
                largest = std::max(largest, value);
    for (const double end : {1.0, 100.0, 255.0, 65535.0})
        if (largest == end)
            return end;
    return std::nullopt;
}

// Whether the patch's device values say that nothing is printed: no ink, or the white of RGB.
bool is_bare(const Patch &patch, const std::optional<double> &white)
{
    const bool has_inks = std::any_of(patch.device.begin(), patch.device.end(),
                                      [](const auto &value) { return is_ink(value.first); });
    return !patch.device.empty() &&
           std::all_of(patch.device.begin(), patch.device.end(), [&](const auto &value) {
               return is_ink(value.first) ? value.second == 0 : has_inks || value.second == white;
           });
}

std::size_t lightest_of(const Measurement &sheet, ILLUM_OBS illuminant)
{
    std::size_t lightest = 0;
    double most = lab_of(sheet, sheet.patches[0], illuminant).L;
    for (std::size_t i = 1; i < sheet.patches.size(); ++i)
        if (const double lightness = lab_of(sheet, sheet.patches[i], illuminant).L;
            lightness > most) {
            most = lightness;
            lightest = i;
        }
    return lightest;
}

// Several patches that differ are two stocks on one sheet, or a scratch: the mean is neither.
Paper paper_at(const Measurement &sheet, const Places &places, const std::string &reason,
               ILLUM_OBS illuminant, std::vector<std::string> &warnings)
{
    const Repeats mean = mean_of(sheet, places, illuminant);
    if (mean.spread > kSpreadOfPaper)
        warnings.push_back(fmt::format("{}: the {} patches that stand for the paper are up to ΔE00 "
                                       "{:.1f} from their mean; --paper chooses",
                                       sheet.file, mean.count, *mean.spread));
    return {{mean.patch.name,
             mean.count == 1 ? reason : fmt::format("mean of {} {}", mean.count, reason)},
            mean.patch.refl,
            sheet.kind == Kind::colours ? mean.patch.lab : std::nullopt};
}

Paper no_paper(const std::string &reason)
{
    Paper out{{{}, reason}, {}, {}};
    out.refl.fill(100);
    return out;
}

void warn_of_lightest(const Measurement &sheet, const Paper &paper, ILLUM_OBS illuminant,
                      std::vector<std::string> &warnings)
{
    const double chroma = lch_of(lab_of(paper, illuminant)).C;
    std::string doubt;
    if (std::any_of(sheet.patches.begin(), sheet.patches.end(),
                    [](const Patch &patch) { return !patch.device.empty(); }))
        doubt = "no patch is without ink";
    if (chroma > kChromaOfPaper)
        doubt += fmt::format("{}its C* is {:.1f}", doubt.empty() ? "" : ", and ", chroma);
    if (!doubt.empty())
        warnings.push_back(fmt::format(
            "{}: {} stands for the paper as the lightest patch, but {}; --paper chooses",
            sheet.file, in_quotes(paper.choice.name), doubt));
}

} // namespace

CIELABCOORD lab_of(const Paper &paper, ILLUM_OBS illuminant)
{
    return paper.lab ? *paper.lab : lab_of(paper.refl, illuminant);
}

Paper paper_of(const Measurement &sheet, std::string_view name, ILLUM_OBS illuminant,
               std::vector<std::string> &warnings)
{
    if (name == "none")
        return no_paper("as asked for");
    if (!name.empty())
        return paper_at(sheet, places_named(sheet, name), "by name", illuminant, warnings);
    if (sheet.kind == Kind::transmission)
        return no_paper("transmission");
    const auto white = white_of_rgb(sheet);
    const Places bare =
        places_where(sheet, [&](const Patch &patch) { return is_bare(patch, white); });
    if (!bare.empty())
        return paper_at(sheet, bare, "without ink", illuminant, warnings);
    if (sheet.collection)
        return no_paper("a collection of colours");
    Paper out =
        paper_at(sheet, {lightest_of(sheet, illuminant)}, "the lightest", illuminant, warnings);
    warn_of_lightest(sheet, out, illuminant, warnings);
    return out;
}

void require_paper(const PaperChoice &paper, const std::string &file, std::string_view what)
{
    if (!paper.exists())
        throw RequestError{
            fmt::format("{}: there is no paper ({}), which {} takes; --paper names it", file,
                        paper.reason, what)};
}

void warn_of_paper(const std::string &file, const PaperChoice &paper,
                   const std::vector<std::optional<double>> &densities,
                   std::vector<std::string> &warnings)
{
    const auto below = static_cast<std::size_t>(
        std::count_if(densities.begin(), densities.end(), [](const std::optional<double> &density) {
            return density && *density < kBelowPaper;
        }));
    if (paper.exists() && 10 * below > densities.size())
        warnings.push_back(fmt::format(
            "{}: {} of {} patches have a density below that of {}, which may not be the paper; "
            "--paper chooses",
            file, below, densities.size(), in_quotes(paper.name)));
}

} // namespace vantrel::sheets
