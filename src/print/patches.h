#pragma once

#include "density/density.h"

#include <array>

namespace vantrel {

/// The densities of several patches in one status and response; nothing where one of them cannot be
/// measured.
template <std::size_t N>
std::optional<std::array<double, N>> patch_densities(const std::array<Spectrum, N> &patches,
                                                     Paper paper, int status, int response)
{
    std::array<double, N> densities;
    for (std::size_t i = 0; i < N; ++i) {
        const auto measured = density(patches[i], paper, status, response);
        if (!measured)
            return std::nullopt;
        densities[i] = *measured;
    }
    return densities;
}

} // namespace vantrel
