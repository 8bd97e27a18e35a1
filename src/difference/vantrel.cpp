// The exported ΔE*ab, ΔH*ab and CMC(l:c).
#include "vantrel.h"

#include "base/require.h"
#include "difference/cie76.h"
#include "difference/cmc.h"

using namespace vantrel;

int LabToDElab(const CIELABCOORD *first, const CIELABCOORD *second, double *deltaE)
{
    VANTREL_REQUIRE(first && second && deltaE, "0");
    *deltaE = delta_e76(*first, *second);
    return 1;
}

int LabToDH(const CIELABCOORD *first, const CIELABCOORD *second, double *deltaH)
{
    VANTREL_REQUIRE(second && first && deltaH, "0");
    *deltaH = delta_h(*first, *second);
    return 1;
}

int LabToDEcmc(const CIELABCOORD *sample, const CIELABCOORD *reference, double l, double c,
               double *deltaE)
{
    VANTREL_REQUIRE(sample && reference && deltaE, "0");
    if (l == 0 || c == 0) {
        *deltaE = 999;
        return 0;
    }
    *deltaE = delta_e_cmc(*sample, *reference, l, c);
    return 1;
}
