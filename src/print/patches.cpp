#include "print/patches.h"

namespace vantrel {

std::optional<std::array<double, 3>> patch_densities(std::initializer_list<Spectrum> patches,
                                                     Paper paper, int status, int response)
{
    // SpectralX reads the paper where it reads the patch.
    const bool once = paper && status != SPECTRAL_STATUS && status != SPECTRALX_STATUS;
    const double paper_density =
        once ? density(*paper, std::nullopt, status, response).value_or(0) : 0;
    std::array<double, 3> densities{};
    for (double *out = densities.data(); const Spectrum patch : patches) {
        const auto measured = density(patch, once ? std::nullopt : paper, status, response);
        if (!measured)
            return std::nullopt;
        *out++ = *measured - paper_density;
    }
    return densities;
}

} // namespace vantrel
