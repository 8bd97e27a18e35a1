#include "judge/advice.h"

#include "judge/colour.h"
#include "judge/densitometer.h"
#include "judge/zones.h"

#include <fmt/format.h>

#include <cmath>

namespace vantrel::sheets {
namespace {

constexpr double kThinnest = 0.25, kThickest = 4;
constexpr double kStep = 0.01;
constexpr double kExact = 1e-5;
// A change at the press is worth it that takes away so much of ΔE00, and this share of it.
constexpr double kLeast = 0.5, kLeastShare = 0.2;
constexpr double kReached = 2; // ΔE00, from which on the hue is off

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

std::string name_of(const SolidAdvice &advice) { return name_of_mean(advice.patch, advice.count); }

std::string_view words_of(const Advice &advice)
{
    if (advice.de00 < kLeast)
        return "on its aim";
    if (advice.thickness < kThinnest + kStep / 2 || advice.thickness > kThickest - kStep / 2)
        return "still off at the end of the films tried, 1/4 to 4 times this one";
    const double gained = advice.de00 - advice.de00_after;
    const bool worth = gained >= std::fmax(kLeast, kLeastShare * advice.de00);
    const bool more = advice.density_change > 0;
    if (advice.de00_after <= kReached)
        return !worth ? "nothing to gain by density" : more ? "more ink" : "less ink";
    return !worth ? "hue is off: ink, paper or trapping, not density"
           : more ? "hue is off: ink, paper or trapping; more ink mends a part"
                  : "hue is off: ink, paper or trapping; less ink mends a part";
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
    if (out.de00_after > out.de00) // the model has no film that is as the solid was printed
        out = {.thickness = 1, .density_change = 0, .de00 = out.de00, .de00_after = out.de00};
    return out;
}

} // namespace vantrel::sheets
