#include "judge/substrate.h"

#include <array>

namespace vantrel::sheets {
namespace {

std::array<double, 3> xyz_of(const CIELABCOORD &lab, ILLUM_OBS illuminant)
{
    const double from[3] = {lab.L, lab.a, lab.b};
    std::array<double, 3> xyz{};
    LabToXYZ(from, illuminant, xyz.data());
    return xyz;
}

} // namespace

SubstrateCorrection::SubstrateCorrection(const CIELABCOORD &aim_paper,
                                         const CIELABCOORD &darkest_aim, const CIELABCOORD &paper,
                                         ILLUM_OBS illuminant)
    : illuminant(illuminant)
{
    const auto from = xyz_of(aim_paper, illuminant), dark = xyz_of(darkest_aim, illuminant),
               to = xyz_of(paper, illuminant);
    for (std::size_t i = 0; i < 3; ++i) {
        slope[i] = (to[i] - dark[i]) / (from[i] - dark[i]);
        offset[i] = dark[i] - slope[i] * dark[i];
    }
}

CIELABCOORD SubstrateCorrection::operator()(const CIELABCOORD &aim) const
{
    auto xyz = xyz_of(aim, illuminant);
    for (std::size_t i = 0; i < 3; ++i)
        xyz[i] = slope[i] * xyz[i] + offset[i];
    double lab[3];
    XYZToCIELab(xyz.data(), illuminant, lab);
    return {lab[0], lab[1], lab[2]};
}

} // namespace vantrel::sheets
