#include "judge/paper.h"

#include "judge/colour.h"
#include "judge/repeats.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>

namespace vantrel::sheets {
namespace {

constexpr double kChromaOfPaper = 12; // C*: more than white stock for print has
constexpr double kLighter = 2;        // L*: more than paper differs from itself
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

bool contains(const Places &places, std::size_t place)
{
    return std::find(places.begin(), places.end(), place) != places.end();
}

bool is_named_paper(const Patch &patch)
{
    constexpr std::array names = {"paper", "papier", "white", "weiß", "substrate", "bedruckstoff"};
    return std::any_of(names.begin(), names.end(),
                       [&](const char *name) { return equal_ignoring_case(patch.name, name); });
}

// What speaks against the paper at these places; `bare` are those of the patches without ink.
void warn_of_choice(const Measurement &sheet, const Paper &paper, const Places &places,
                    const Places &bare, std::string_view how, ILLUM_OBS illuminant,
                    std::vector<std::string> &warnings)
{
    std::vector<std::string> doubts;
    const bool has_device = std::any_of(sheet.patches.begin(), sheet.patches.end(),
                                        [](const Patch &patch) { return !patch.device.empty(); });
    if (bare.empty() && has_device)
        doubts.emplace_back("no patch is without ink");
    else if (!bare.empty() && !contains(bare, places.front()))
        doubts.push_back(fmt::format("{} is without ink", in_quotes(sheet.patches[bare[0]].name)));
    const CIELABCOORD lab = lab_of(paper, illuminant);
    if (const double chroma = lch_of(lab).C; chroma > kChromaOfPaper)
        doubts.push_back(fmt::format("its C* is {:.1f}", chroma));
    const std::size_t lightest = lightest_of(sheet, illuminant);
    const double lightness = lab_of(sheet, sheet.patches[lightest], illuminant).L;
    if (lightness > lab.L + kLighter && !contains(places, lightest) && !contains(bare, lightest))
        doubts.push_back(fmt::format("{} has an L* of {:.1f} to its {:.1f}",
                                     in_quotes(sheet.patches[lightest].name), lightness, lab.L));
    const Places named = places_where(sheet, is_named_paper);
    if (!has_device && !named.empty() && !is_named_paper(sheet.patches[places.front()]))
        doubts.push_back(
            fmt::format("another patch is named {}", in_quotes(sheet.patches[named.front()].name)));
    if (!doubts.empty())
        warnings.push_back(fmt::format("{}: {} stands for the paper {}, but {}; --paper chooses",
                                       sheet.file, in_quotes(paper.choice.name), how,
                                       fmt::join(doubts, ", and ")));
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
    if (name.empty() && sheet.kind == Kind::transmission)
        return no_paper("transmission");
    const auto white = white_of_rgb(sheet);
    const Places bare =
        places_where(sheet, [&](const Patch &patch) { return is_bare(patch, white); });
    if (name.empty() && bare.empty() && sheet.collection)
        return no_paper("a collection of colours");
    const auto chosen = [&](const Places &places, const char *reason, const char *how) {
        Paper out = paper_at(sheet, places, reason, illuminant, warnings);
        warn_of_choice(sheet, out, places, bare, how, illuminant, warnings);
        return out;
    };
    if (!name.empty())
        return chosen(places_named(sheet, name), "by name", "by name");
    if (!bare.empty())
        return chosen(bare, "without ink", "without ink");
    return chosen({lightest_of(sheet, illuminant)}, "the lightest", "as the lightest patch");
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
