// The exported CIEDE2000: the class and the two functions around it.
#include "vantrel.h"

#include "base/require.h"
#include "difference/de2000.h"

CIEDE2000::CIEDE2000() : pow25To7(vantrel::kPow25To7) {}

CIEDE2000::~CIEDE2000() {}

double CIEDE2000::Calculate(const CIELABCOORD &first, const CIELABCOORD &second, double kL,
                            double kC, double kH)
{
    return vantrel::delta_e2000(first, second, {kL, kC, kH}, pow25To7);
}

bool CIEDE2000::IsZero(double value, double tolerance)
{
    return vantrel::is_zero(value, tolerance);
}

double CIEDE2000::ConvertToDegrees(double radians) { return vantrel::degrees(radians); }

double CIEDE2000::ConvertToRadians(double degrees) { return vantrel::radians(degrees); }

int LabToDE2000Ex(const CIELABCOORD *first, const CIELABCOORD *second, double kL, double kC,
                  double kH, double *deltaE)
{
    VANTREL_REQUIRE(first && second && deltaE, "0");
    *deltaE = vantrel::delta_e2000(*first, *second, {kL, kC, kH}, vantrel::kPow25To7);
    return 1;
}

int LabToDE2000(const CIELABCOORD *first, const CIELABCOORD *second, double kL, double kC,
                double *deltaE)
{
    VANTREL_REQUIRE(first && second && deltaE, "0");
    *deltaE = vantrel::delta_e2000(*first, *second, {kL, kC, 1}, vantrel::kPow25To7);
    return 1;
}
