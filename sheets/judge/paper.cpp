#include "judge/paper.h"

#include "judge/colour.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <optional>

namespace vantrel::sheets {
namespace {

// The ink of a patch, all its percentages; nothing where its device values name no ink.
std::optional<double> ink_on(const Patch &patch)
{
    std::optional<double> sum;
    for (const auto &[field, percent] : patch.device)
        if (is_ink(field))
            sum = sum.value_or(0) + std::abs(percent);
    return sum;
}

std::optional<CIELABCOORD> own_lab(const Measurement &sheet, const Patch &patch)
{
    return sheet.kind == Kind::colours ? patch.lab : std::nullopt;
}

} // namespace

CIELABCOORD lab_of(const Paper &paper, ILLUM_OBS illuminant)
{
    return paper.lab ? *paper.lab : lab_of(paper.refl, illuminant);
}

Paper paper_of(const Measurement &sheet, std::string_view name, std::vector<std::string> &warnings)
{
    if (!name.empty()) {
        const Patch &patch = patch_named(sheet, name);
        return {patch.name, patch.refl, own_lab(sheet, patch)};
    }
    const Patch &first = sheet.patches.front();
    if (ink_on(first) > 0) {
        const auto bare = std::find_if(sheet.patches.begin(), sheet.patches.end(),
                                       [](const Patch &patch) { return ink_on(patch) == 0; });
        const std::string other =
            bare == sheet.patches.end() ? "" : ", " + in_quotes(bare->name) + " has none";
        warnings.push_back(
            fmt::format("{}: {} stands for the paper, but has ink{}; --paper chooses", sheet.file,
                        in_quotes(first.name), other));
    }
    return {first.name, first.refl, own_lab(sheet, first)};
}

} // namespace vantrel::sheets
