#pragma once

#include "density/density.h"

#include <array>

namespace vantrel {

/// The densities of several patches over one paper, which is measured once; nothing where the
/// response is not one of the status.
template <std::size_t N>
std::optional<std::array<double, N>> patch_densities(const std::array<Spectrum, N> &patches,
                                                     Paper paper, int status, int response)
{
    // SpectralX reads the paper where it reads the patch.
    const bool once = paper && status != SPECTRAL_STATUS && status != SPECTRALX_STATUS;
    const double paper_density =
        once ? density(*paper, std::nullopt, status, response).value_or(0) : 0;
    std::array<double, N> densities;
    for (std::size_t i = 0; i < N; ++i) {
        const auto measured = density(patches[i], once ? std::nullopt : paper, status, response);
        if (!measured)
            return std::nullopt;
        densities[i] = *measured - paper_density;
    }
    return densities;
}

} // namespace vantrel
