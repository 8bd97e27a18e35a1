#include "judge/stated.h"

#include "judge/colour.h"
#include "read/illuminant.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>

namespace vantrel::sheets {
namespace {

constexpr double kOwnColoursAgree = 0.5; // mean ΔE*ab
constexpr double kOtherColour = 2;       // ΔE00
constexpr double kTimesMiddle = 10;

// Mean ΔE*ab between a file's own L*a*b* and those of its spectra; nothing where it has none.
std::optional<double> mean_difference(const Measurement &sheet, ILLUM_OBS illuminant)
{
    double sum = 0;
    std::size_t count = 0;
    for (const Patch &patch : sheet.patches) {
        if (!patch.lab)
            continue;
        const CIELABCOORD lab = lab_of(patch.refl, illuminant);
        double delta_e = 0;
        LabToDElab(&*patch.lab, &lab, &delta_e);
        sum += delta_e;
        ++count;
    }
    return count ? std::optional(sum / static_cast<double>(count)) : std::nullopt;
}

// Single patches whose own L*a*b* are of another spectrum than theirs: a slip in either, which a
// mean would hide.
void warn_of_single(const Measurement &sheet, ILLUM_OBS illuminant,
                    std::vector<std::string> &warnings)
{
    struct Own {
        double difference;
        const Patch *patch;
    };
    std::vector<Own> all;
    for (const Patch &patch : sheet.patches)
        if (patch.lab)
            all.push_back({delta_e00(*patch.lab, lab_of(patch.refl, illuminant)), &patch});
    std::vector<double> sorted;
    for (const Own &own : all)
        sorted.push_back(own.difference);
    const auto middle = sorted.begin() + static_cast<std::ptrdiff_t>(sorted.size() / 2);
    std::nth_element(sorted.begin(), middle, sorted.end());
    const double most = std::max(kOtherColour, kTimesMiddle * *middle);
    const Own *first = nullptr;
    std::size_t count = 0;
    for (const Own &own : all)
        if (!(own.difference <= most)) {
            first = first ? first : &own;
            ++count;
        }
    if (first)
        warnings.push_back(fmt::format("{}:{}: the file's own L*a*b* of {}{} are ΔE00 {:.2f} from "
                                       "those of its spectrum, in the middle of all {:.2f}",
                                       sheet.file, first->patch->line,
                                       in_quotes(first->patch->name), and_more(count),
                                       first->difference, *middle));
}

void check_own_colours(const Measurement &sheet, ILLUM_OBS illuminant,
                       std::vector<std::string> &warnings)
{
    if (sheet.kind == Kind::colours)
        return;
    const ILLUM_OBS own = sheet.colours.illuminant.value_or(illuminant);
    const auto mean = mean_difference(sheet, own);
    if (!mean)
        return;
    if (*mean <= kOwnColoursAgree) {
        warn_of_single(sheet, own, warnings);
        return;
    }
    ILLUM_OBS best = own;
    double least = *mean;
    for (int i = 0; i < NUM_ILLUM_OBS; ++i) {
        const auto other = static_cast<ILLUM_OBS>(i);
        if (const double difference = *mean_difference(sheet, other); difference < least) {
            best = other;
            least = difference;
        }
    }
    const std::string fit = fmt::format(
        "{}{} fits best, {:.2f}", least > kOwnColoursAgree ? "none of the eighteen agrees, " : "",
        name_of(best), least);
    warnings.push_back(fmt::format("{}: its own L*a*b* are {:.2f} ΔE*ab in the mean from those of "
                                   "its spectra under {}; {}",
                                   sheet.file, *mean, name_of(own), fit));
    warn_of_single(sheet, best, warnings);
}

// Spectra give colours under any illuminant: what a file of colours alone states comes first.
IlluminantChoice choice(const std::optional<ILLUM_OBS> &wish,
                        const std::vector<const Measurement *> &sheets)
{
    if (wish)
        return {*wish, "request"};
    const Measurement *first = nullptr;
    for (const Measurement *sheet : sheets) {
        if (!sheet->colours.illuminant)
            continue;
        const bool fixed = sheet->kind == Kind::colours;
        if (!first || (fixed && first->kind != Kind::colours))
            first = sheet;
        else if (fixed && *sheet->colours.illuminant != *first->colours.illuminant)
            throw RequestError{
                fmt::format("{} holds colours for {}, {} for {}, both without spectra; with "
                            "--illuminant they are compared as they stand",
                            first->file, name_of(*first->colours.illuminant), sheet->file,
                            name_of(*sheet->colours.illuminant))};
    }
    if (first)
        return {*first->colours.illuminant, "file"};
    return {D50_2DEG, "default"};
}

} // namespace

IlluminantChoice illuminant_for(const std::optional<ILLUM_OBS> &wish,
                                const std::vector<const Measurement *> &sheets,
                                std::vector<std::string> &warnings)
{
    IlluminantChoice out = choice(wish, sheets);
    for (const Measurement *sheet : sheets) {
        const Colours &colours = sheet->colours;
        const std::string_view taken = name_of(out.illuminant);
        if (colours.illuminant && *colours.illuminant != out.illuminant)
            warnings.push_back(fmt::format("{}: its colours are for {}; {} is taken", sheet->file,
                                           name_of(*colours.illuminant), taken));
        else if (!colours.illuminant && !colours.stated.empty())
            warnings.push_back(fmt::format(
                "{}: its colours are for {}, which is none of the eighteen; {} is taken",
                sheet->file, in_quotes(colours.stated), taken));
        else if (!colours.illuminant && sheet->kind == Kind::colours)
            warnings.push_back(
                fmt::format("{}: it does not say for which illuminant its colours are; {} is taken",
                            sheet->file, taken));
        check_own_colours(*sheet, out.illuminant, warnings);
    }
    return out;
}

} // namespace vantrel::sheets
