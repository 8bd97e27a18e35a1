#include "read/illuminant.h"

#include "read/text.h"

#include <fmt/format.h>

#include <iterator>

namespace vantrel::sheets {
namespace {

// In the order of ILLUM_OBS.
constexpr std::string_view illuminants[] = {
    "A_2DEG",   "A_10DEG",   "C_2DEG",   "C_10DEG",   "D50_2DEG", "D50_10DEG",
    "D65_2DEG", "D65_10DEG", "F2_2DEG",  "F2_10DEG",  "F7_2DEG",  "F7_10DEG",
    "F11_2DEG", "F11_10DEG", "F12_2DEG", "F12_10DEG", "D75_2DEG", "D75_10DEG",
};
static_assert(std::size(illuminants) == NUM_ILLUM_OBS);

} // namespace

std::optional<ILLUM_OBS> illuminant_named(std::string_view name)
{
    for (int i = 0; i < NUM_ILLUM_OBS; ++i)
        if (equal_ignoring_case(illuminants[i], name))
            return static_cast<ILLUM_OBS>(i);
    return std::nullopt;
}

std::string_view name_of(ILLUM_OBS illuminant) { return illuminants[illuminant]; }

std::string illuminant_names() { return fmt::format("{}", fmt::join(illuminants, ", ")); }

} // namespace vantrel::sheets
