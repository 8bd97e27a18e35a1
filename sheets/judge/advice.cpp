#include "judge/advice.h"

#include "judge/colour.h"
#include "judge/densitometer.h"

#include <fmt/format.h>

#include <cmath>

namespace vantrel::sheets {
namespace {

constexpr double kThinnest = 0.5, kThickest = 2;
constexpr double kStep = 0.01;
constexpr double kExact = 1e-5;

Spectrum film(const Spectrum &solid, double thickness, const Spectrum &paper)
{
    Spectrum refl;
    EstimateReflsForThickness(solid.data(), thickness, paper.data(), refl.data());
    return refl;
}

// Golden section search for the least of a function that has one minimum between the two.
template <typename Function> double minimum(Function f, double low, double high)
{
    const double golden = (std::sqrt(5.0) - 1) / 2;
    double a = high - golden * (high - low), b = low + golden * (high - low);
    while (high - low > kExact) {
        if (f(a) < f(b)) {
            high = b;
            b = a;
            a = high - golden * (high - low);
        } else {
            low = a;
            a = b;
            b = low + golden * (high - low);
        }
    }
    return (low + high) / 2;
}

} // namespace

std::string advice_from() { return fmt::format("{} {}", kAdviceFrom, kAdviceElse); }

std::string_view words_of(const Advice &advice)
{
    constexpr double near_enough = 0.5; // ΔE00
    if (advice.de00 < near_enough)
        return "on its aim";
    if (!advice.reaches_aim())
        return "hue is off: ink, paper or trapping, not density";
    return advice.density_change > 0 ? "more ink" : "less ink";
}

std::optional<Advice> advise(const Spectrum &solid, const Spectrum &paper, const CIELABCOORD &aim,
                             ILLUM_OBS illuminant, int status)
{
    const Densitometer densitometer(paper, status);
    const auto response = densitometer.response(solid);
    if (!response)
        return std::nullopt;
    const auto to_aim = [&](double thickness) {
        return delta_e00(aim, lab_of(film(solid, thickness, paper), illuminant));
    };
    // ΔE00 along the film may have several hollows: the search starts from the deepest of a scan.
    double nearest = 1;
    for (int i = 0; kThinnest + i * kStep <= kThickest + kStep / 2; ++i)
        if (const double thickness = kThinnest + i * kStep; to_aim(thickness) < to_aim(nearest))
            nearest = thickness;

    Advice out;
    out.thickness = minimum(to_aim, std::fmax(nearest - kStep, kThinnest),
                            std::fmin(nearest + kStep, kThickest));
    out.density_change = densitometer.density(film(solid, out.thickness, paper), *response) -
                         densitometer.density(solid, *response);
    out.de00 = delta_e00(aim, lab_of(solid, illuminant));
    out.de00_after = to_aim(out.thickness);
    return out;
}

} // namespace vantrel::sheets
