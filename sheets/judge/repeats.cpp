#include "judge/repeats.h"

#include "judge/colour.h"

#include <algorithm>

namespace vantrel::sheets {
namespace {

CIELABCOORD operator+(const CIELABCOORD &first, const CIELABCOORD &second)
{
    return {first.L + second.L, first.a + second.a, first.b + second.b};
}

constexpr double kMostSpread = 5;

} // namespace

bool is_of_others(const std::optional<double> &spread)
{
    return spread && !(*spread <= kMostSpread);
}

Repeats mean_of(const Measurement &sheet, const std::vector<std::size_t> &places,
                ILLUM_OBS illuminant)
{
    Repeats out{sheet.patches[places.front()], places.size(), {}};
    if (places.size() == 1)
        return out;
    const auto count = static_cast<double>(places.size());
    Spectrum sum{};
    CIELABCOORD lab{};
    for (const std::size_t place : places) {
        const Patch &patch = sheet.patches[place];
        for (int band = 0; band < VANTREL_BANDS; ++band)
            sum[band] += patch.refl[band];
        if (sheet.kind == Kind::colours)
            lab = lab + *patch.lab;
    }
    for (int band = 0; band < VANTREL_BANDS; ++band)
        out.patch.refl[band] = sum[band] / count;
    out.patch.lab.reset();
    if (sheet.kind == Kind::colours)
        out.patch.lab = {lab.L / count, lab.a / count, lab.b / count};
    const CIELABCOORD mean = lab_of(sheet, out.patch, illuminant);
    out.spread = 0;
    for (const std::size_t place : places)
        out.spread =
            std::max(*out.spread, delta_e00(mean, lab_of(sheet, sheet.patches[place], illuminant)));
    return out;
}

} // namespace vantrel::sheets
