#include "print/contrast_trap.h"

#include "print/patches.h"

namespace vantrel {

std::optional<double> print_contrast(double Ds, double Dt)
{
    if (Ds == 0)
        return std::nullopt;
    return 100 * ((Ds - Dt) / Ds);
}

std::optional<double> print_contrast(Spectrum solid, Spectrum tint, Paper paper, int status,
                                     int response)
{
    const auto densities = patch_densities({solid, tint}, paper, status, response);
    if (!densities)
        return std::nullopt;
    const auto [Ds, Dt, unused] = *densities;
    return print_contrast(Ds, Dt);
}

std::optional<double> trap(double Dop, double D2, double D1)
{
    if (D2 == 0)
        return std::nullopt;
    return 100 * ((Dop - D1) / D2);
}

std::optional<double> trap(Spectrum second, Spectrum first, Spectrum overprint, Paper paper,
                           int status, int response)
{
    const auto densities = patch_densities({second, first, overprint}, paper, status, response);
    if (!densities)
        return std::nullopt;
    const auto [D2, D1, Dop] = *densities;
    return trap(Dop, D2, D1);
}

} // namespace vantrel
