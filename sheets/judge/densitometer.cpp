#include "judge/densitometer.h"

namespace vantrel::sheets {
namespace {

// Above it 1 - 10^(-D / n) has lost so many places that the limit of large n, D's own share, is the
// better value; both are right to eight places there.
constexpr double kLargestNFactor = 1e8;

} // namespace

std::optional<int> Densitometer::response(const Spectrum &refl) const
{
    const int response = DetermineDensityResponse(refl.data(), status, paper.data());
    const bool found =
        status == SPECTRAL_STATUS || status == SPECTRALX_STATUS || response < NUM_RESPONSES;
    return found ? std::optional(response) : std::nullopt;
}

DensityReading Densitometer::read(const Spectrum &refl) const
{
    DensityReading out{response(refl), std::nullopt};
    if (out.response)
        out.density = density(refl, *out.response);
    return out;
}

double Densitometer::density(const Spectrum &refl, int response) const
{
    double density = 0;
    ReflToDensity(refl.data(), paper.data(), status, response, &density);
    double of_paper = 0;
    if (status == SPECTRAL_STATUS)
        ReflToDensity(paper.data(), nullptr, status, response, &of_paper);
    return density - of_paper;
}

double Densitometer::neutral_density(const Spectrum &refl) const
{
    const bool filters = status != SPECTRAL_STATUS && status != SPECTRALX_STATUS;
    return Densitometer(paper, filters ? status : E_STATUS).density(refl, VISUAL_RESPONSE);
}

std::optional<double> Densitometer::dot_area(const Spectrum &solid, const Spectrum &tint,
                                             double n_factor) const
{
    const auto filter = response(solid);
    if (!filter || !(density(solid, *filter) > 0))
        return std::nullopt;
    const double Ds = density(solid, *filter), Dt = density(tint, *filter);
    if (n_factor > kLargestNFactor)
        return 100 * (Dt / Ds);
    double area = 0;
    return DensityToDotArea(Ds, Dt, n_factor, &area) ? std::optional(area) : std::nullopt;
}

std::optional<double> Densitometer::print_contrast(const Spectrum &solid,
                                                   const Spectrum &tint) const
{
    const auto filter = response(solid);
    double contrast = 0;
    if (!filter || !(density(solid, *filter) > 0) ||
        !DensityToPrintContrast(density(solid, *filter), density(tint, *filter), &contrast))
        return std::nullopt;
    return contrast;
}

std::optional<double> Densitometer::trap(const Spectrum &first, const Spectrum &second,
                                         const Spectrum &overprint) const
{
    const auto filter = response(second);
    double trap = 0;
    if (!filter || !(density(second, *filter) > 0) ||
        !DensityToTrap(density(overprint, *filter), density(second, *filter),
                       density(first, *filter), &trap))
        return std::nullopt;
    return trap;
}

std::optional<Densitometer::HueGray> Densitometer::hue_gray(const Spectrum &refl) const
{
    HueGray out{};
    if (status == SPECTRAL_STATUS || status == SPECTRALX_STATUS ||
        ReflToHueGray(refl.data(), paper.data(), status, &out.grayness, &out.hue_error) != 1)
        return std::nullopt;
    return out;
}

} // namespace vantrel::sheets
