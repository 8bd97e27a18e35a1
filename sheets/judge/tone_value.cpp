#include "judge/tone_value.h"

#include <cmath>

namespace vantrel::sheets {
namespace {

// From one colour to another in Vx = 116 f(X/Xn) − 16, Vy = 116 f(Y/Yn) − 16, Vz = 116 f(Z/Zn) −
// 16: of these, Vy is L*, a* is 500/116 (Vx − Vy) and b* is 200/116 (Vy − Vz).
double distance(const CIELABCOORD &from, const CIELABCOORD &to)
{
    const double dL = to.L - from.L;
    const double dVx = dL + 116.0 / 500 * (to.a - from.a);
    const double dVz = dL - 116.0 / 200 * (to.b - from.b);
    return std::sqrt(dVx * dVx + dL * dL + dVz * dVz);
}

} // namespace

std::optional<double> spot_colour_tone_value(const CIELABCOORD &paper, const CIELABCOORD &solid,
                                             const CIELABCOORD &tint)
{
    const double to_solid = distance(paper, solid);
    if (!(to_solid > 0))
        return std::nullopt;
    return 100 * (distance(paper, tint) / to_solid);
}

} // namespace vantrel::sheets
