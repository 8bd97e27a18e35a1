#include "inks/overprint.h"

namespace vantrel {

static double mean_of(double v1, double v2) { return 0.5 * v1 + 0.5 * v2; }

static double mean_of(double v1, double v2, double v3)
{
    constexpr double third = 0.3333333;
    return v1 * third + v2 * third + v3 * third;
}

Lab mean(const Lab &first, const Lab &second)
{
    return {mean_of(first.L, second.L), mean_of(first.a, second.a), mean_of(first.b, second.b)};
}

Lab mean(const Lab &first, const Lab &second, const Lab &third)
{
    return {mean_of(first.L, second.L, third.L), mean_of(first.a, second.a, third.a),
            mean_of(first.b, second.b, third.b)};
}

} // namespace vantrel
